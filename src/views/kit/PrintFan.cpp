#include "views/kit/PrintFan.h"

#include "views/kit/Painting.h"

#include <algorithm>
#include <utility>

namespace lumora {

namespace {

constexpr double turnOfNext = 6; // degrees
constexpr double sinkOfNext = 0.03;
constexpr double stepOfNext = 0.36; // both in sides of a print
constexpr double printOfHeight = 0.68;

} // namespace

PrintFan::PrintFan(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {}

void PrintFan::setPrints(std::vector<QImage> prints) {
    if (prints == m_prints)
        return;
    m_prints = std::move(prints);
    update();
}

QSize PrintFan::sizeHint() const {
    return m_theme.isTall() ? QSize(m_theme.px(560), m_theme.px(280)) : QSize(m_theme.px(340), m_theme.px(170));
}

QSize PrintFan::minimumSizeHint() const {
    return {m_theme.px(240), m_theme.px(120)};
}

// From the last to the first, which lies on top.
void PrintFan::paintEvent(QPaintEvent*) {
    if (m_prints.empty())
        return;
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    const int count = static_cast<int>(m_prints.size());
    const double widest = stepOfNext * (count - 1) + 1.3;
    const double side = std::min(height() * printOfHeight, width() / widest);
    const double way = layoutDirection() == Qt::RightToLeft ? -1 : 1;
    for (int i = count - 1; i >= 0; --i) {
        const double from = i - (count - 1) / 2.0;
        painter.save();
        painter.translate(width() / 2.0 + way * from * stepOfNext * side,
                          height() / 2.0 + from * from * sinkOfNext * side);
        painter.rotate(way * from * turnOfNext);
        paintPrint(painter, m_prints[static_cast<std::size_t>(i)], side);
        painter.restore();
    }
}

void PrintFan::paintPrint(QPainter& painter, const QImage& print, double side) const {
    QRectF paper(0, 0, side, side);
    paper.moveCenter({0, 0});
    paper = fitted(paper, print.size());
    const double rim = m_theme.px(5);
    painter.setPen(Qt::NoPen);
    for (int depth = 3; depth > 0; --depth) {
        painter.setBrush(QColor(0x1D, 0x25, 0x2C, 14));
        painter.drawRoundedRect(paper.adjusted(-depth, -depth, depth, depth + 2.0 * depth), depth, depth);
    }
    painter.setBrush(Theme::Colour::Surface);
    painter.drawRect(paper);
    drawImage(painter, paper.adjusted(rim, rim, -rim, -rim), print);
    painter.setPen(QPen(Theme::Colour::Line, 1));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(paper);
}

} // namespace lumora
