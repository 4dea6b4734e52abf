#include "views/kyoskNew/PictureCell.h"

#include "views/kit/Maker.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QPainter>
#include <QPushButton>

namespace lumora {

using namespace Qt::StringLiterals;

PictureCell::PictureCell(const Theme& theme, QWidget* parent)
    : CardButton(theme, parent) {
    setCardSize({146, 160});
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    m_strip = new QWidget(this);
    // Minus stands left of plus in both languages, as on every counter.
    m_strip->setLayoutDirection(Qt::LeftToRight);
    auto* row = new QHBoxLayout(m_strip);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(0);
    const auto key = [&](const QString& icon) {
        auto* made = new QPushButton(m_strip);
        setRole(made, "round");
        made->setIcon(theme.buttonIcon(icon, theme.px(20), Theme::Colour::PrimaryDark, Theme::Colour::Muted));
        made->setIconSize({theme.px(20), theme.px(20)});
        const int side = theme.key();
        made->setFixedSize(side, side);
        made->setFocusPolicy(Qt::TabFocus);
        return made;
    };
    m_minus = key(u"minus"_s);
    m_plus = key(u"plus"_s);
    m_copies = makeLabel(m_strip, "large");
    m_copies->setAlignment(Qt::AlignCenter);
    m_copies->setWordWrap(false);
    row->addWidget(m_minus);
    row->addWidget(m_copies, 1);
    row->addWidget(m_plus);
    m_strip->hide();
}

void PictureCell::show(const Look& look) {
    m_look = look;
    m_strip->setVisible(look.chosen);
    m_copies->setText(look.copies.trimmed());
    setEnabled(look.filled);
    update();
}

QRect PictureCell::pictureRoom() const {
    const int inset = theme().px(7);
    const int strip = theme().key() + theme().px(4);
    return rect().adjusted(inset, inset, -inset, -inset - strip);
}

int PictureCell::pictureSide() const {
    const QRect room = pictureRoom();
    return static_cast<int>(std::min(room.width(), room.height()) * devicePixelRatioF());
}

void PictureCell::resizeEvent(QResizeEvent*) {
    const int inset = theme().px(6);
    const int height = theme().key();
    Q_EMIT resized();
    m_strip->setGeometry(inset, rect().height() - inset - height, width() - 2 * inset, height);
}

void PictureCell::keyPressEvent(QKeyEvent* event) {
    switch (event->key()) {
    case Qt::Key_Left:
        Q_EMIT arrow(-1, 0);
        return;
    case Qt::Key_Right:
        Q_EMIT arrow(1, 0);
        return;
    case Qt::Key_Up:
        Q_EMIT arrow(0, -1);
        return;
    case Qt::Key_Down:
        Q_EMIT arrow(0, 1);
        return;
    case Qt::Key_Plus:
    case Qt::Key_Equal:
        if (m_look.chosen)
            m_plus->click();
        return;
    case Qt::Key_Minus:
        if (m_look.chosen)
            m_minus->click();
        return;
    default:
        CardButton::keyPressEvent(event);
    }
}

void PictureCell::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    const double thick = m_look.chosen                   ? theme().px(3)
                         : m_look.inEditor               ? theme().px(3)
                         : underMouse() && m_look.filled ? theme().px(2)
                                                         : 1;
    const QRectF card = QRectF(rect()).adjusted(thick / 2, thick / 2, -thick / 2, -thick / 2);
    painter.setPen(QPen(m_look.inEditor                                    ? Theme::Colour::Sun
                        : m_look.chosen || (underMouse() && m_look.filled) ? Theme::Colour::Primary
                                                                           : Theme::Colour::Line,
                        thick));
    painter.setBrush(m_look.chosen   ? Theme::Colour::PrimarySoft
                     : m_look.filled ? Theme::Colour::Surface
                                     : Theme::Colour::Paper);
    painter.drawRoundedRect(card, theme().px(14), theme().px(14));
    if (!m_look.filled)
        return;
    const QRect room = pictureRoom();
    if (!m_look.picture.isNull()) {
        const double ratio = devicePixelRatioF();
        QSizeF size = QSizeF(m_look.picture.size()) / ratio;
        if (size.width() > room.width() || size.height() > room.height())
            size.scale(room.size(), Qt::KeepAspectRatio);
        QRectF at(QPointF(), size);
        at.moveCenter(QRectF(room).center());
        // On whole pixels, or every picture would be drawn soft.
        at.moveTopLeft(QPointF(at.topLeft().toPoint()));
        painter.fillRect(at.translated(theme().px(2), theme().px(2)), QColor(0, 0, 0, 30));
        painter.drawImage(at, m_look.picture);
    } else {
        const int size = theme().px(40);
        painter.drawPixmap(room.center() - QPoint(size / 2, size / 2),
                           theme().icon(u"picture"_s, size, Theme::Colour::Edge));
    }
    if (m_look.chosen || m_look.inEditor) {
        const double radius = theme().px(14);
        const QPointF at(layoutDirection() == Qt::RightToLeft ? card.left() + radius + theme().px(5)
                                                              : card.right() - radius - theme().px(5),
                         card.top() + radius + theme().px(5));
        painter.setPen(QPen(Qt::white, theme().px(2)));
        painter.setBrush(m_look.inEditor ? Theme::Colour::Sun : Theme::Colour::Primary);
        painter.drawEllipse(at, radius, radius);
        const int size = theme().px(19);
        painter.drawPixmap(at - QPointF(size / 2.0, size / 2.0), m_look.inEditor
                                                                     ? theme().icon(u"edit"_s, size, Theme::Colour::Ink)
                                                                     : theme().icon(u"tick"_s, size, Qt::white));
    }
    if (!m_look.chosen) {
        painter.setFont(theme().font(Theme::Type::Small));
        painter.setPen(Theme::Colour::Muted);
        const QRectF line(theme().px(8), m_strip->y(), width() - theme().px(16), m_strip->height());
        painter.drawText(
            line, Qt::AlignCenter,
            fromLeft(painter.fontMetrics().elidedText(m_look.name, Qt::ElideMiddle, static_cast<int>(line.width()))));
    }
}

} // namespace lumora
