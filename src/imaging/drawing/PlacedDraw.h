#pragma once

#include "imaging/Bitmap.h"
#include "imaging/drawing/ColourMatrix.h"
#include "imaging/files/PictureFile.h"

#include <QPoint>
#include <QRect>

#include <vector>

namespace lumora {

// Where a picture lands on the paper: zoomed and turned about the pan point, never mirrored. All in pixels of the
// paper.
//
//     W = round_half_even(drawWidth * zoomPercent / 100), H likewise
//     screen = (panX, panY) + R(rotationCode - 180) * (u * W / sourceWidth - floor(W / 2), v * H / sourceHeight -
//     floor(H / 2)) R(a) = [cos a, -sin a; sin a, cos a], y down: a positive angle turns clockwise
//
// so that a rotation code of 180 is upright.
struct Placement {
    double drawWidth = 0; // before the zoom
    double drawHeight = 0;
    int zoomPercent = 100;
    int rotationCode = 180;
    double panX = 0;
    double panY = 0;

    // The zoomed size; at least 1 pixel a side.
    PictureSize zoomed() const;

    // Where the point (x, y) of the zoomed, unturned picture lands.
    struct Point {
        double x;
        double y;
    };
    Point onPaper(double x, double y) const;

    // True when no pixel of a paper of this size, or of a part of one, is left uncovered.
    bool covers(PictureSize paper) const { return covers(QRect(0, 0, paper.width, paper.height)); }
    bool covers(const QRect& part) const;

    // Rectangles that hold every pixel of the paper that is left uncovered, and few others. They do not overlap.
    std::vector<QRect> uncovered(PictureSize paper) const;
};

// The size to which a larger source is best reduced before it is drawn at the zoomed size: a quarter more, so that the
// sampling takes nothing from its sharpness. Never more than the source has.
PictureSize reducedSize(PictureSize source, const Placement& placement);

// Draws source over what paper shows. The colour matrix acts before the sampling, which is a 4x4 cubic (a = -0.5) at
// pixel centres with the edge pixels repeated outside; a flat picture stays flat to the last bit. A pixel is painted if
// its centre lies inside the picture, with smooth coverage along edges that are neither level nor upright. A source
// larger than reducedSize() is reduced first.
void drawPlaced(Bitmap& paper, const Bitmap& source, const Placement& placement, const ColourMatrix& matrix);

// The part of a source, reduced to this size, that drawing on this paper touches; beyond the source its edge is
// repeated. Empty where the picture lies off the paper.
QRect neededPart(PictureSize reduced, const Placement& placement, PictureSize paper);

// The same drawing from that part (or a larger one) of the reduced source, its colours done and its format 32 bits
// without alpha.
void drawPlacedPart(Bitmap& paper, const Bitmap& pixels, const QRect& part, PictureSize reduced,
                    const Placement& placement);

// A frame stretched to the size of a paper, without the parts that are wholly transparent: most frames have nothing in
// their middle.
struct KeyedFrame {
    struct Piece {
        QPoint at;
        Bitmap pixels;
    };
    std::vector<Piece> pieces; // they do not overlap
};

// alpha = min(255, 11 * (red + green + blue)), so that black is transparent; the alpha is taken before the stretching,
// and colours are weighted by it. Empty where memory is short.
KeyedFrame keyedFrame(const Bitmap& frame, PictureSize paper);

// Lays it over the whole paper.
void drawKeyedFrame(Bitmap& paper, const KeyedFrame& keyed);

} // namespace lumora
