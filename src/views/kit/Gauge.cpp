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
    return {m_theme.size(Extent::Field), m_theme.size(Extent::Field)};
}

void Gauge::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const double thick = m_theme.corner();
    const double side = std::min(width(), height()) - thick - 2;
    QRectF ring(0, 0, side, side);
    ring.moveCenter(QRectF(rect()).center());
    const std::pair<QColor, QString> looks[] = {{Theme::Colour::Primary, {}}, // by Mood
                                                {Theme::Colour::Edge, u"pause"_s},
                                                {Theme::Colour::SunEdge, u"info"_s},
                                                {Theme::Colour::Good, u"tick"_s},
                                                {Theme::Colour::Danger, u"warning"_s}};
    const auto& [colour, sign] = looks[static_cast<int>(m_mood)];
    painter.setPen(QPen(Theme::Colour::Groove, thick));
    painter.drawEllipse(ring);
    painter.setPen(QPen(colour, thick, Qt::SolidLine, Qt::RoundCap));
    if (m_share > 0)
        painter.drawArc(ring, 90 * 16, -static_cast<int>(m_share * 360 * 16));
    if (m_mood != Mood::Busy) {
        const int size = static_cast<int>(side * 0.5);
        drawIcon(painter, ring.center(), m_theme.icon(sign, size, colour));
        return;
    }
    QFont font = m_theme.font(Theme::Type::Number);
    // "12 / 250" has to stay within the ring.
    const double room = side - thick - m_theme.size(Space::Wide);
    if (const int wide = QFontMetrics(font).horizontalAdvance(m_large); wide > room)
        font.setPixelSize(std::max(1, static_cast<int>(m_theme.text(Theme::Type::Number) * room / wide)));
    painter.setFont(font);
    painter.setPen(Theme::Colour::Ink);
    const double lift = m_small.isEmpty() ? 0 : m_theme.corner();
    painter.setLayoutDirection(Qt::LeftToRight);
    painter.drawText(ring.translated(0, -lift), Qt::AlignCenter, m_large);
    painter.setFont(m_theme.font(Theme::Type::Body));
    painter.setPen(Theme::Colour::Muted);
    painter.setLayoutDirection(layoutDirection());
    painter.drawText(ring.translated(0, m_theme.margin()), Qt::AlignCenter, m_small);
}

} // namespace lumora
