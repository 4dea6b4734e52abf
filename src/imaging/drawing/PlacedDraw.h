#pragma once

#include "imaging/Bitmap.h"
#include "imaging/drawing/ColourMatrix.h"
#include "imaging/files/PictureFile.h"

#include <QPoint>
#include <QRect>

#include <vector>

namespace lumora {

// The position of a picture on the paper, in pixels of the paper: zoomed and turned about the pan point, never
// mirrored.
//
//     W = round_half_even(drawWidth * zoomPercent / 100), H likewise
//     screen = (panX, panY)
//              + R(rotationCode - 180) * (u * W / sourceWidth - floor(W / 2), v * H / sourceHeight - floor(H / 2))
//     R(a) = [cos a, -sin a; sin a, cos a] with y down: a positive angle turns clockwise
//
// A rotation code of 180 is upright.
struct Placement {
    double drawWidth = 0; // before the zoom
    double drawHeight = 0;
    int zoomPercent = 100;
    int rotationCode = 180;
    double panX = 0;
    double panY = 0;

    // The size after the zoom, at least 1 pixel a side.
    PictureSize zoomed() const;

    // The point of the paper that shows the point (x, y) of the zoomed, unturned picture.
    struct Point {
        double x;
        double y;
    };
    Point onPaper(double x, double y) const;

    // True when the picture covers every pixel of the paper, or of the part.
    bool covers(PictureSize paper) const { return covers(QRect(0, 0, paper.width, paper.height)); }
    bool covers(const QRect& part) const;

    // Rectangles that do not overlap and hold every uncovered pixel of the paper; they may hold a few covered ones.
    std::vector<QRect> uncovered(PictureSize paper) const;
};

// The size to which a larger source is reduced before it is drawn: 1.25 times the zoomed size, so that the sampling
// loses no sharpness, and never more than the source has.
PictureSize reducedSize(PictureSize source, const Placement& placement);

// Draws source over paper. The colour matrix is applied before the sampling, a 4x4 cubic (a = -0.5) at pixel centres
// with the edge pixels repeated outside; a flat picture stays flat to the last bit. A pixel is painted if its centre
// lies inside the picture; slanted edges are smooth. A source larger than reducedSize() is reduced first.
void drawPlaced(Bitmap& paper, const Bitmap& source, const Placement& placement, const ColourMatrix& matrix);

// The part of a source, reduced to the size reduced, that drawing on this paper reads; it may reach beyond the source,
// where the edge is repeated. Empty when the picture lies off the paper.
QRect neededPart(PictureSize reduced, const Placement& placement, PictureSize paper);

// Draws the same from that part, or a larger one, of the reduced source: pixels has the colour matrix applied and holds
// 32 bits a pixel without alpha.
void drawPlacedPart(Bitmap& paper, const Bitmap& pixels, const QRect& part, PictureSize reduced,
                    const Placement& placement);

// A frame stretched to the size of a paper, as rectangles without the transparent parts: most frames are empty in the
// middle.
struct KeyedFrame {
    struct Piece {
        QPoint at;
        Bitmap pixels;
    };
    std::vector<Piece> pieces; // they do not overlap
};

// alpha = min(255, 11 * (red + green + blue)), so that black is transparent. The alpha is computed before the
// stretching and weights the colours there. Empty when memory is short.
KeyedFrame keyedFrame(const Bitmap& frame, PictureSize paper);

// Draws the frame over the whole paper.
void drawKeyedFrame(Bitmap& paper, const KeyedFrame& keyed);

} // namespace lumora
