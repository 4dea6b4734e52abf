#include "editing/LineFrame.h"

#include "imaging/Bitmap.h"

#include <QPainter>
#include <QPainterPath>

#include <algorithm>

namespace lumora {
namespace {

enum class Shape { Rectangle, Ellipse, Both };

class LinePainter {
public:
    LinePainter(Bitmap& box, QColor colour)
        : m_painter(&box.image())
        , m_colour(colour)
        , m_width(box.width())
        , m_height(box.height()) {
        m_painter.setRenderHint(QPainter::Antialiasing);
    }

    int width() const { return m_width; }

    // One path of shapes that lie so far inside the edges of the box; a width of 0 is the thinnest line.
    void draw(Shape shape, double rectangleInset, double ellipseInset, int alpha, int penWidth) {
        QPainterPath path;
        // A line of one pixel covers the pixel that it is said to be on.
        const double half = penWidth == 0 ? 0.5 : 0;
        if (shape != Shape::Ellipse)
            path.addRect(inset(rectangleInset).translated(half, half));
        if (shape != Shape::Rectangle)
            path.addEllipse(inset(ellipseInset).translated(half, half));
        QColor colour = m_colour;
        colour.setAlpha(std::clamp(alpha, 0, 255));
        QPen pen(colour, std::max(1, penWidth));
        pen.setJoinStyle(Qt::MiterJoin);
        m_painter.strokePath(path, pen);
    }

private:
    QRectF inset(double by) const {
        const double width = m_width - 2 * by;
        const double height = m_height - 2 * by;
        return width > 0 && height > 0 ? QRectF(by, by, width, height) : QRectF();
    }

    QPainter m_painter;
    QColor m_colour;
    double m_width;
    double m_height;
};

// Rectangles shrink into the box and ellipses grow out of it, each fainter than the one before.
void drawFading(LinePainter& lines, Shape shape, double shareOfWidth, int firstAlpha, int fall) {
    const int last = static_cast<int>(lines.width() * shareOfWidth);
    for (int i = 0; i <= last && firstAlpha - fall * i > 0; ++i)
        lines.draw(shape, i, -i, firstAlpha - fall * i, 0);
}

// From so far inside outwards, with a broad pen.
template <typename Alpha>
void drawGrowing(LinePainter& lines, Shape shape, int penWidth, const Alpha& alpha) {
    for (int i = 1; i <= lines.width(); ++i)
        lines.draw(shape, penWidth - i, penWidth - i, alpha(i), penWidth);
}

// Styles 21 to 50: an edge of ten kinds, alone, with a line beside it, or with a glow of thin lines.
void drawEdge(LinePainter& lines, int style) {
    const int kind = (style - 21) % 10;
    const int penWidth = 20 + kind / 2 * 10;
    lines.draw(Shape::Rectangle, 0, 0, style % 2 == 1 ? 211 : 155, penWidth);
    if (style > 40) {
        for (int i = 0; i < 16; ++i)
            lines.draw(Shape::Rectangle, penWidth - i, 0, 183 - 7 * i, 2);
    } else if (style > 30) {
        lines.draw(Shape::Rectangle, penWidth / 2.0, 0, 200, 12);
    }
}

} // namespace

std::optional<QColor> lineFrameColour(QChar letter) {
    switch (letter.unicode()) {
    case u'W':
        return QColor(250, 250, 250);
    case u'R':
        return QColor(250, 100, 100);
    case u'P':
        return QColor(250, 0, 100);
    case u'S':
        return QColor(240, 120, 0);
    case u'K':
    case u'8':
        return QColor(0, 0, 0);
    case u'G':
        return QColor(100, 250, 100);
    case u'Y':
        return QColor(250, 250, 0);
    case u'H':
        return QColor(120, 120, 120);
    case u'B':
        return QColor(40, 40, 250);
    case u'T':
        return QColor(0, 250, 250);
    case u'U':
        return QColor(110, 110, 250);
    default:
        return std::nullopt;
    }
}

void PaintLineFrame(Bitmap& box, const QString& code) {
    const std::optional<QColor> colour = code.size() == 3 ? lineFrameColour(code[0]) : std::nullopt;
    if (box.isNull() || !colour)
        return;
    LinePainter lines(box, *colour);
    const auto rising = [](int i) { return 2 * (i - 1); };
    const auto steady = [](int) { return 9; };
    const int style = code.mid(1).toInt();
    switch (style) {
    case 1:
        return drawGrowing(lines, Shape::Rectangle, 20, rising);
    case 2:
        return drawGrowing(lines, Shape::Ellipse, 20, rising);
    case 3:
        return drawFading(lines, Shape::Rectangle, 1, 255, 2);
    case 4:
        return drawFading(lines, Shape::Ellipse, 1, 255, 2);
    case 5:
        return drawGrowing(lines, Shape::Rectangle, 30, steady);
    case 6:
        return drawGrowing(lines, Shape::Ellipse, 30, steady);
    case 13:
        return drawFading(lines, Shape::Rectangle, 0.3, 255, 3);
    case 14:
        return drawFading(lines, Shape::Ellipse, 0.3, 255, 3);
    case 15:
        return drawFading(lines, Shape::Both, 0.07, 255, 3);
    case 16:
        return drawFading(lines, Shape::Ellipse, 0.05, 205, 3);
    case 17:
        return drawFading(lines, Shape::Rectangle, 0.05, 205, 3);
    case 18:
        return drawFading(lines, Shape::Both, 0.06, 255, 3);
    case 19:
        return drawFading(lines, Shape::Both, 0.06, 175, 3);
    default:
        if (style >= 21 && style <= 50)
            drawEdge(lines, style);
    }
}

} // namespace lumora
