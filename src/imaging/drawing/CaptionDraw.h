#pragma once

#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"

#include <QColor>
#include <QPainterPath>
#include <QPoint>
#include <QString>

namespace lumora {

// A caption as an edit record carries it; sizes and places in pixels of the preview.
struct PictureCaption {
    enum class Align { Near, Centre, Far };
    enum class Run { Across, Down };

    QString text;   // lines end in CR LF or LF
    QString family; // one that this machine lacks draws nothing
    int emSize = 8; // under 8 counts as 8
    bool bold = false;
    bool italic = false;
    Align align = Align::Near;
    Run run = Run::Across;
    QColor colour = Qt::black;
    int x = 0;
    int y = 0;
    bool operator==(const PictureCaption&) const = default;
};

// What the pixels of the preview become on the paper; 1 for the preview itself. Letters take their size by x.
struct PaperScale {
    double x = 1;
    double y = 1;
    bool operator==(const PaperScale&) const = default;
};

// A caption in pixels: its shadow at the anchor, the text over it 2 pixels up and to the left. A line is its advance
// and a third of an em long and starts a sixth inside that; it begins, is centred or ends at the anchor, whose height
// is the top of the first line's box. Base direction left to right; lines that run down are the same block turned a
// quarter clockwise, its right edge at the anchor.
struct CaptionInk {
    Bitmap pixels; // what the paper can show; transparent between the letters, null where nothing shows
    QPoint at;     // where its corner lies on the paper
};

// Needs a QGuiApplication.
CaptionInk inkOf(const PictureCaption& caption, PictureSize paper, PaperScale scale = {});

// The same for a caption that is asked for again and again while it is moved and sized: the outlines are made anew only
// for other words or another face, the pixels not for a move by whole pixels of the paper.
class CaptionInks {
public:
    CaptionInk inkOf(const PictureCaption& caption, PictureSize paper, PaperScale scale = {});

private:
    PictureCaption m_caption;
    QPainterPath m_outlines; // for the caption's text, family, style and lines; around its anchor, in layout pixels
    PaperScale m_scale;
    QPointF m_part;      // the anchor's fraction of a pixel when the pixels were made
    CaptionInk m_around; // the whole caption, placed from the anchor's pixel; null if it is far larger than the paper
};

void drawInk(Bitmap& paper, const CaptionInk& ink);

} // namespace lumora
