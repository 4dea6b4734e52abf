#include "views/picture/ResolutionBadge.h"

#include <QFontMetricsF>

#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

struct GradeLook {
    QString sign;
    QColor ink;
    QColor fill;
    QColor edge;
};

GradeLook lookOf(PrintResolution::Grade grade) {
    switch (grade) {
    case PrintResolution::Grade::Sharp:
        return {u"tick"_s, Theme::Colour::Good, Theme::Colour::GoodSoft, Theme::Colour::Good};
    case PrintResolution::Grade::Fair:
        return {u"info"_s, Theme::Colour::Ink, Theme::Colour::SunSoft, Theme::Colour::SunEdge};
    case PrintResolution::Grade::Coarse:
        break;
    }
    return {u"warning"_s, Theme::Colour::Danger, Theme::Colour::DangerSoft, Theme::Colour::Danger};
}

constexpr double pillHeight = 24; // of a 1024 by 768 window, as are the other lengths
constexpr double signSide = 15;
constexpr double padding = 7;
constexpr double gap = 4;

QSizeF sizeOf(const Theme& theme, const ResolutionCaption& mark) {
    const QFontMetricsF metrics(theme.font(Theme::Type::Small));
    const int lengths = theme.px(2 * padding + gap + signSide);
    return {lengths + std::ceil(metrics.horizontalAdvance(isolated(mark.text))), double(theme.px(pillHeight))};
}

} // namespace

void drawResolution(QPainter& painter, const Theme& theme, QPointF lowerLeft, const ResolutionCaption& mark) {
    const GradeLook look = lookOf(mark.grade);
    const QSizeF size = sizeOf(theme, mark);
    const QRectF pill = QRectF(lowerLeft - QPointF(0, size.height()), size).adjusted(0.5, 0.5, -0.5, -0.5);
    painter.setPen(QPen(look.edge, 1));
    painter.setBrush(look.fill);
    painter.drawRoundedRect(pill, pill.height() / 2, pill.height() / 2);
    const bool rightToLeft = painter.layoutDirection() == Qt::RightToLeft;
    const double side = theme.px(signSide);
    const double middle = theme.px(padding) + side / 2;
    drawIcon(painter, {rightToLeft ? pill.right() - middle : pill.left() + middle, pill.center().y()},
             theme.icon(look.sign, theme.px(signSide), look.ink));
    painter.setFont(theme.font(Theme::Type::Small));
    painter.setPen(look.ink);
    const double beside = theme.px(padding + gap + signSide);
    const double inner = theme.px(padding) - 1;
    painter.drawText(pill.adjusted(rightToLeft ? inner : beside, 0, rightToLeft ? -beside : -inner, 0),
                     Qt::AlignVCenter | Qt::AlignLeading, isolated(mark.text));
}

ResolutionBadge::ResolutionBadge(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
}

void ResolutionBadge::display(const ResolutionCaption& mark) {
    const bool resized = m_mark.text != mark.text;
    m_mark = mark;
    setAccessibleName(mark.text);
    if (resized)
        updateGeometry();
    update();
}

QSize ResolutionBadge::sizeHint() const {
    return sizeOf(m_theme, m_mark).toSize();
}

void ResolutionBadge::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setLayoutDirection(layoutDirection());
    drawResolution(painter, m_theme, QPointF(0, height()), m_mark);
}

} // namespace lumora
