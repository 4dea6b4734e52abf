#pragma once

#include "imaging/Bitmap.h"
#include "imaging/files/PictureFile.h"

#include <QColor>
#include <QPainterPath>
#include <QPoint>
#include <QString>

namespace lumora {

// A caption as an edit record holds it; sizes and positions in pixels of the preview.
struct PictureCaption {
    enum class Align { Near, Centre, Far };
    enum class Run { Across, Down };

    QString text;   // lines end in CR LF or LF
    QString family; // nothing is drawn with a family that this machine lacks
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

// Paper pixels per preview pixel, 1 for the preview itself. The letter size follows x.
struct PaperScale {
    double x = 1;
    double y = 1;
    bool operator==(const PaperScale&) const = default;
};

// A caption in pixels. The shadow stands at the anchor, the text 2 preview pixels up and to the left of it. The length
// of a line is its advance and a third of an em; the text begins a sixth of an em inside. By the alignment the line
// begins, is centred or ends at the anchor; the anchor's y is the top of the first line's box. The base direction is
// left to right. A caption that runs down is the same block turned a quarter clockwise, its right edge at the anchor.
struct CaptionInk {
    Bitmap pixels; // the part that lies on the paper; transparent between the letters, null when no part does
    QPoint at;     // top left corner of pixels on the paper
};

// Needs a QGuiApplication. Null pixels when the family is missing or nothing lies on the paper.
CaptionInk inkOf(const PictureCaption& caption, PictureSize paper, PaperScale scale = {});

// Gives the same as inkOf() for a caption that is drawn again and again while the customer moves and sizes it. The
// outlines are kept while text, family, style and alignment stay; the pixels are kept while the caption moves by whole
// pixels of the paper.
class CaptionInks {
public:
    CaptionInk inkOf(const PictureCaption& caption, PictureSize paper, PaperScale scale = {});

private:
    PictureCaption m_caption;
    QPainterPath m_outlines; // of m_caption; anchor at (0, 0), in layout pixels
    PaperScale m_scale;
    QPointF m_part;      // the anchor's fraction of a pixel that m_around was drawn with
    CaptionInk m_around; // the whole caption, positioned from the anchor's pixel; null when it is larger than the paper
};

void drawInk(Bitmap& paper, const CaptionInk& ink);

} // namespace lumora
