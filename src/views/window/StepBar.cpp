#include "views/window/StepBar.h"

#include "views/kit/Painting.h"

namespace lumora {

using namespace Qt::StringLiterals;

StepBar::StepBar(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {
    setObjectName(u"stepBar"_s);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
}

void StepBar::setTexts(const QStringList& names, const QString& spokenPrefix) {
    m_names = names;
    m_spokenPrefix = spokenPrefix;
    speak();
    updateGeometry();
    update();
}

void StepBar::setStep(OrderStep step, double share) {
    m_step = step;
    m_share = share;
    speak();
    update();
}

void StepBar::speak() {
    setAccessibleName(m_spokenPrefix +
                      m_names.value(std::min(static_cast<int>(m_step), static_cast<int>(m_names.size()) - 1)));
}

QSize StepBar::sizeHint() const {
    return {m_theme.px(600), m_theme.px(64)};
}

QSize StepBar::minimumSizeHint() const {
    return {m_theme.px(440), m_theme.px(64)};
}

void StepBar::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const int count = static_cast<int>(m_names.size());
    if (count == 0)
        return;
    const int current = static_cast<int>(m_step);
    const double slot = width() / static_cast<double>(count);
    const double radius = m_theme.corner();
    const double y = m_theme.px(22);
    const auto centre = [&](int i) {
        const double along = slot * (i + 0.5);
        return QPointF(layoutDirection() == Qt::RightToLeft ? width() - along : along, y);
    };
    for (int i = 0; i + 1 < count; ++i) {
        painter.setPen(QPen(i < current ? Theme::Colour::Primary : Theme::Colour::Track, m_theme.thick(), Qt::SolidLine,
                            Qt::RoundCap));
        const QPointF a = centre(i);
        const QPointF b = centre(i + 1);
        const double inset = (b.x() > a.x() ? 1 : -1) * (radius + m_theme.size(Space::Small));
        const QPointF from(a.x() + inset, y);
        const QPointF to(b.x() - inset, y);
        painter.drawLine(from, to);
        if (i == current && m_share > 0) {
            painter.setPen(QPen(Theme::Colour::Primary, m_theme.thick(), Qt::SolidLine, Qt::RoundCap));
            painter.drawLine(from, from + (to - from) * m_share);
        }
    }
    for (int i = 0; i < count; ++i) {
        const bool done = i < current;
        const bool here = i == current;
        const QPointF at = centre(i);
        if (here) {
            painter.setPen(Qt::NoPen);
            painter.setBrush(Theme::Colour::PrimarySoft);
            painter.drawEllipse(at, radius + m_theme.size(Space::Tight), radius + m_theme.size(Space::Tight));
        }
        painter.setPen(QPen(done || here ? Theme::Colour::Primary : Theme::Colour::Edge, m_theme.hair()));
        painter.setBrush(done || here ? Theme::Colour::Primary : Theme::Colour::Surface);
        painter.drawEllipse(at, radius, radius);
        if (done) {
            drawIcon(painter, at, m_theme.icon(u"tick"_s, m_theme.size(IconSize::Small), Qt::white));
        } else {
            painter.setFont(m_theme.font(Theme::Type::Small));
            painter.setPen(here ? QColor(Qt::white) : Theme::Colour::Muted);
            painter.drawText(QRectF(at.x() - radius, at.y() - radius, 2 * radius, 2 * radius), Qt::AlignCenter,
                             QString::number(i + 1));
        }
        QFont font = m_theme.font(Theme::Type::Small);
        font.setBold(here);
        painter.setFont(font);
        painter.setPen(here ? Theme::Colour::PrimaryDark : Theme::Colour::Muted);
        painter.drawText(QRectF(at.x() - slot / 2, m_theme.px(41), slot, m_theme.px(22)), Qt::AlignCenter, m_names[i]);
    }
}

} // namespace lumora
