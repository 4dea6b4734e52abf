#include "editing/render/LineFrame.h"

#include "imaging/Bitmap.h"

#include <QPainter>
#include <QPainterPath>

#include <algorithm>
#include <utility>

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

    // Adds a shape that lies so far inside the edges of the box. Width 0 is the thinnest line.
    void draw(Shape shape, double rectangleInset, double ellipseInset, int alpha, int penWidth) {
        QPainterPath path;
        // A line of one pixel covers exactly its pixel.
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

struct Fading {
    int style;
    Shape shape;
    double shareOfWidth;
    int firstAlpha, fall;
};
constexpr Fading fadingStyles[] = {
    {3, Shape::Rectangle, 1, 255, 2},     {4, Shape::Ellipse, 1, 255, 2},  {13, Shape::Rectangle, 0.3, 255, 3},
    {14, Shape::Ellipse, 0.3, 255, 3},    {15, Shape::Both, 0.07, 255, 3}, {16, Shape::Ellipse, 0.05, 205, 3},
    {17, Shape::Rectangle, 0.05, 205, 3}, {18, Shape::Both, 0.06, 255, 3}, {19, Shape::Both, 0.06, 175, 3}};

// Rectangles shrink into the box and ellipses grow out of it, each fainter than the one before.
void drawFading(LinePainter& lines, const Fading& fading) {
    const int last = static_cast<int>(lines.width() * fading.shareOfWidth);
    for (int i = 0; i <= last && fading.firstAlpha - fading.fall * i > 0; ++i)
        lines.draw(fading.shape, i, -i, fading.firstAlpha - fading.fall * i, 0);
}

// Rectangles from so far inside outwards, with a broad pen.
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
    static constexpr std::pair<char16_t, QRgb> colours[] = {
        {u'W', qRgb(250, 250, 250)}, {u'R', qRgb(250, 100, 100)}, {u'P', qRgb(250, 0, 100)},
        {u'S', qRgb(240, 120, 0)},   {u'K', qRgb(0, 0, 0)},       {u'8', qRgb(0, 0, 0)},
        {u'G', qRgb(100, 250, 100)}, {u'Y', qRgb(250, 250, 0)},   {u'H', qRgb(120, 120, 120)},
        {u'B', qRgb(40, 40, 250)},   {u'T', qRgb(0, 250, 250)},   {u'U', qRgb(110, 110, 250)}};
    for (const auto& [known, colour] : colours) {
        if (letter == known)
            return QColor(colour);
    }
    return std::nullopt;
}

void PaintLineFrame(Bitmap& box, const QString& code) {
    const std::optional<QColor> colour = code.size() == 3 ? lineFrameColour(code[0]) : std::nullopt;
    if (box.isNull() || !colour)
        return;
    LinePainter lines(box, *colour);
    const int style = code.mid(1).toInt();
    const auto rising = [](int i) { return 2 * (i - 1); };
    const auto steady = [](int) { return 9; };
    if (style == 1 || style == 2)
        drawGrowing(lines, style == 1 ? Shape::Rectangle : Shape::Ellipse, 20, rising);
    else if (style == 5 || style == 6)
        drawGrowing(lines, style == 5 ? Shape::Rectangle : Shape::Ellipse, 30, steady);
    else if (style >= 21 && style <= 50)
        drawEdge(lines, style);
    for (const Fading& fading : fadingStyles) {
        if (fading.style == style)
            drawFading(lines, fading);
    }
}

} // namespace lumora
