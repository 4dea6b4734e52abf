#include "views/kit/CardOffer.h"

namespace lumora {

using namespace Qt::StringLiterals;

CardOffer::CardOffer(const Theme& theme, QWidget* parent, Size size)
    : CardButton(theme, parent) {
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    setSize(size);
}

void CardOffer::setSize(Size size) {
    m_cardSize = size;
    setCardSize(size == Size::Slim ? QSizeF(300, 60) : QSizeF(400, 80));
}

void CardOffer::setNote(const QString& note) {
    if (m_note == note)
        return;
    m_note = note;
    update();
}

void CardOffer::paintInside(QPainter& painter, const QRectF& room) {
    const bool rightToLeft = layoutDirection() == Qt::RightToLeft;
    const bool large = m_cardSize == Size::Large;
    const double side = theme().px(large ? 52 : 38);
    QRectF disc(0, 0, side, side);
    disc.moveCenter({rightToLeft ? room.right() - side / 2 : room.left() + side / 2, room.center().y()});
    painter.setPen(Qt::NoPen);
    painter.setBrush(isEnabled() ? Theme::Colour::PrimarySoft : Theme::Colour::Paper);
    painter.drawEllipse(disc);
    drawIcon(painter, disc.center(),
             theme().icon(u"card"_s, static_cast<int>(side * 0.56),
                          isEnabled() ? Theme::Colour::PrimaryDark : Theme::Colour::Muted));

    QRectF words = room;
    const double beside = side + theme().size(Space::Normal);
    words.adjust(rightToLeft ? 0 : beside, 0, rightToLeft ? -beside : 0, 0);
    const int atStart = (rightToLeft ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignAbsolute;
    const bool hint = m_note.isEmpty();
    const QFont head = theme().font(hint ? Theme::Type::Small : large ? Theme::Type::Large : Theme::Type::Strong);
    const QFont note = theme().font(large ? Theme::Type::Body : Theme::Type::Small);
    painter.setFont(head);
    painter.setPen(isEnabled() ? Theme::Colour::Ink : Theme::Colour::Muted);
    if (hint) {
        painter.drawText(words, atStart | Qt::AlignVCenter | Qt::TextWordWrap, text());
        return;
    }
    const QFontMetricsF headMetrics(head);
    const QFontMetricsF noteMetrics(note);
    QRectF line(words.left(), 0, words.width(), headMetrics.height());
    line.moveTop(words.center().y() - (headMetrics.height() + noteMetrics.height()) / 2);
    painter.drawText(line, atStart, headMetrics.elidedText(text(), Qt::ElideMiddle, words.width()));
    line.moveTop(line.bottom());
    line.setHeight(noteMetrics.height());
    painter.setFont(note);
    painter.setPen(Theme::Colour::Muted);
    painter.drawText(line, atStart, noteMetrics.elidedText(m_note, Qt::ElideRight, words.width()));
}

} // namespace lumora
