#include "views/tFrmNew/FilmStrip.h"

#include <QPainter>

namespace lumora {

using namespace Qt::StringLiterals;

StripCell::StripCell(const Theme& theme, QWidget* parent)
    : CardButton(theme, parent) {
    setCardSize({64, 62});
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
}

void StripCell::show(const Look& look) {
    m_look = look;
    setEnabled(look.filled);
    update();
}

void StripCell::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    const double thick = m_look.open ? theme().px(3) : underMouse() && m_look.filled ? theme().px(2) : 1;
    const QRectF card = QRectF(rect()).adjusted(thick / 2, thick / 2, -thick / 2, -thick / 2);
    painter.setPen(QPen(m_look.open                     ? Theme::Colour::Sun
                        : underMouse() && m_look.filled ? Theme::Colour::Primary
                                                        : Theme::Colour::Line,
                        thick));
    painter.setBrush(m_look.open     ? Theme::Colour::SunSoft
                     : m_look.filled ? Theme::Colour::Surface
                                     : Theme::Colour::Paper);
    painter.drawRoundedRect(card, theme().px(9), theme().px(9));
    if (!m_look.filled)
        return;
    const double inset = theme().px(5);
    const QRectF room = card.adjusted(inset, inset, -inset, -inset);
    if (m_look.picture.isNull()) {
        const int size = theme().px(28);
        painter.drawPixmap(room.center() - QPointF(size / 2.0, size / 2.0),
                           theme().icon(u"picture"_s, size, Theme::Colour::Edge));
    } else {
        QRectF at(QPointF(), QSizeF(m_look.picture.size()).scaled(room.size(), Qt::KeepAspectRatio));
        at.moveCenter(room.center());
        painter.drawImage(at, m_look.picture);
    }
    if (!m_look.ordered && !m_look.open)
        return;
    const double radius = theme().px(10);
    const QPointF at(layoutDirection() == Qt::RightToLeft ? card.left() + radius + theme().px(2)
                                                          : card.right() - radius - theme().px(2),
                     card.top() + radius + theme().px(2));
    painter.setPen(QPen(Qt::white, theme().px(1)));
    painter.setBrush(m_look.open ? Theme::Colour::Sun : Theme::Colour::Primary);
    painter.drawEllipse(at, radius, radius);
    const int size = theme().px(13);
    painter.drawPixmap(
        at - QPointF(size / 2.0, size / 2.0),
        theme().icon(m_look.open ? u"edit"_s : u"tick"_s, size, m_look.open ? Theme::Colour::Ink : QColor(Qt::white)));
}

} // namespace lumora
