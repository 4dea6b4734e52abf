#include "views/kit/Gauge.h"

#include "views/kit/Painting.h"

#include <QFontMetrics>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

Gauge::Gauge(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {}

void Gauge::show(double share, const QString& large, const QString& small) {
    m_mood = Mood::Busy;
    m_share = std::clamp(share, 0.0, 1.0);
    m_large = large;
    m_small = small;
    setAccessibleName(large + u' ' + small);
    update();
}

void Gauge::showSign(Mood mood) {
    m_mood = mood;
    m_share = 1;
    m_large.clear();
    m_small.clear();
    update();
}

QSize Gauge::sizeHint() const {
    return {m_theme.px(230), m_theme.px(230)};
}

QSize Gauge::minimumSizeHint() const {
    return {m_theme.px(150), m_theme.px(150)};
}

void Gauge::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const double thick = m_theme.px(14);
    const double side = std::min(width(), height()) - thick - 2;
    QRectF ring(0, 0, side, side);
    ring.moveCenter(QRectF(rect()).center());
    const QColor colour = m_mood == Mood::Good      ? Theme::Colour::Good
                          : m_mood == Mood::Bad     ? Theme::Colour::Danger
                          : m_mood == Mood::Held    ? Theme::Colour::Edge
                          : m_mood == Mood::Unclear ? Theme::Colour::Sun
                                                    : Theme::Colour::Primary;
    painter.setPen(QPen(Theme::Colour::Sunken, thick));
    painter.drawEllipse(ring);
    painter.setPen(QPen(colour, thick, Qt::SolidLine, Qt::RoundCap));
    if (m_share > 0)
        painter.drawArc(ring, 90 * 16, -static_cast<int>(m_share * 360 * 16));
    if (m_mood != Mood::Busy) {
        const int size = static_cast<int>(side * 0.5);
        const QString sign = m_mood == Mood::Good      ? u"tick"_s
                             : m_mood == Mood::Bad     ? u"warning"_s
                             : m_mood == Mood::Unclear ? u"info"_s
                                                       : u"pause"_s;
        drawIcon(painter, ring.center(), m_theme.icon(sign, size, colour));
        return;
    }
    QFont font = m_theme.font(Theme::Type::Display);
    font.setPixelSize(m_theme.px(52));
    // "12 / 250" has to stay within the ring.
    const double room = side - thick - m_theme.px(16);
    if (const int wide = QFontMetrics(font).horizontalAdvance(m_large); wide > room)
        font.setPixelSize(std::max(1, static_cast<int>(m_theme.px(52) * room / wide)));
    painter.setFont(font);
    painter.setPen(Theme::Colour::Ink);
    const double lift = m_small.isEmpty() ? 0 : m_theme.px(14);
    painter.setLayoutDirection(Qt::LeftToRight);
    painter.drawText(ring.translated(0, -lift), Qt::AlignCenter, m_large);
    painter.setFont(m_theme.font(Theme::Type::Body));
    painter.setPen(Theme::Colour::Muted);
    painter.setLayoutDirection(layoutDirection());
    painter.drawText(ring.translated(0, m_theme.px(28)), Qt::AlignCenter, m_small);
}

} // namespace lumora
