#include "views/kyoskNew/PictureCell.h"

#include "views/kit/Maker.h"
#include "views/picture/ResolutionBadge.h"

#include <QKeyEvent>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

PictureCell::PictureCell(const Theme& theme, QWidget* parent)
    : CardButton(theme, parent) {
    setCardSize({146, 160});
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    const Maker make(theme, this);
    const auto key = [&](const QString& icon) {
        QPushButton* made = make.plainButton({}, "round", [] {});
        const int size = theme.size(IconSize::Small);
        made->setIcon(theme.buttonIcon(icon, size, Theme::Colour::PrimaryDark, Theme::Colour::Muted));
        made->setIconSize({size, size});
        made->setFixedSize(theme.key(), theme.key());
        return made;
    };
    m_minus = key(u"minus"_s);
    m_plus = key(u"plus"_s);
    m_copies = make.plainButton({}, "count", [] {});
    m_copies->setFocusPolicy(Qt::NoFocus);
    m_copies->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
    m_copies->setFixedHeight(theme.key());
    setCopiesTyped(false);
    // Minus is left of plus in both languages.
    m_strip = make.leftToRight(make.inRow(Space::None, {m_minus, {m_copies, 1}, m_plus}));
    m_strip->hide();
}

void PictureCell::setCopiesTyped(bool typed) {
    m_copies->setAttribute(Qt::WA_TransparentForMouseEvents, !typed);
}

void PictureCell::show(const Look& look) {
    m_look = look;
    m_strip->setVisible(look.chosen);
    m_copies->setText(look.copies.trimmed());
    setEnabled(look.filled && look.unreadable.isEmpty());
    update();
}

QRect PictureCell::pictureRoom() const {
    const int inset = theme().size(Space::Small);
    const int strip = theme().key();
    return rect().adjusted(inset, inset, -inset, -inset - strip);
}

int PictureCell::pictureSide() const {
    const QRect room = pictureRoom();
    return static_cast<int>(std::min(room.width(), room.height()) * devicePixelRatioF());
}

void PictureCell::resizeEvent(QResizeEvent*) {
    const int inset = theme().thick() + theme().hair();
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
    painter.setLayoutDirection(layoutDirection());
    const bool lively = underMouse() && isEnabled();
    const QRectF card = drawCard(painter, rect(),
                                 m_look.inEditor           ? Theme::Colour::Sun
                                 : m_look.chosen || lively ? Theme::Colour::Primary
                                                           : Theme::Colour::Line,
                                 m_look.chosen                                  ? Theme::Colour::PrimarySoft
                                 : m_look.filled && m_look.unreadable.isEmpty() ? Theme::Colour::Surface
                                                                                : Theme::Colour::Paper,
                                 m_look.chosen || m_look.inEditor ? theme().thick()
                                 : lively                         ? theme().hair()
                                                                  : 1,
                                 theme().corner());
    if (!m_look.filled)
        return;
    const QRect room = pictureRoom();
    QPointF mark = room.bottomLeft();
    if (!m_look.picture.isNull()) {
        const double ratio = devicePixelRatioF();
        QSizeF size = QSizeF(m_look.picture.size()) / ratio;
        if (size.width() > room.width() || size.height() > room.height())
            size.scale(room.size(), Qt::KeepAspectRatio);
        QRectF at(QPointF(), size);
        at.moveCenter(QRectF(room).center());
        // The picture begins on a whole pixel; between pixels it would be drawn blurred.
        at.moveTopLeft(QPointF(at.topLeft().toPoint()));
        painter.fillRect(at.translated(theme().hair(), theme().hair()), QColor(0, 0, 0, 30));
        painter.drawImage(at, m_look.picture);
        mark = at.bottomLeft() + QPointF(-theme().px(6), theme().px(12));
    } else {
        const QString icon = m_look.waiting ? u"clock"_s : m_look.unreadable.isEmpty() ? u"picture"_s : u"warning"_s;
        drawIcon(painter, QRectF(room).center(), theme().icon(icon, theme().size(IconSize::Box), Theme::Colour::Edge));
    }
    if (!m_look.unreadable.isEmpty()) {
        painter.setFont(theme().font(Theme::Type::Small));
        painter.setPen(Theme::Colour::Muted);
        painter.drawText(QRectF(room.left(), room.center().y() + theme().size(IconSize::Box) / 2.0, room.width(),
                                room.height() / 2.0 - theme().size(IconSize::Box) / 2.0),
                         Qt::AlignHCenter | Qt::AlignTop | Qt::TextWordWrap, m_look.unreadable);
    }
    if (m_look.resolution.visible)
        drawResolution(painter, theme(),
                       {std::max<double>(mark.x(), room.left()), std::min<double>(mark.y(), room.bottom())},
                       m_look.resolution);
    if (m_look.chosen || m_look.inEditor)
        drawMark(painter, theme(), card,
                 {.icon = m_look.inEditor ? u"edit"_s : u"tick"_s,
                  .disc = m_look.inEditor ? Theme::Colour::Sun : Theme::Colour::Primary,
                  .ink = m_look.inEditor ? Theme::Colour::Ink : QColor(Qt::white),
                  .radius = 14,
                  .inset = 5,
                  .rim = 2});
    if (!m_look.chosen) {
        painter.setFont(theme().font(Theme::Type::Small));
        painter.setPen(Theme::Colour::Muted);
        const int beside = theme().size(Space::Small);
        const QRectF line(beside, m_strip->y(), width() - 2 * beside, m_strip->height());
        painter.drawText(
            line, Qt::AlignCenter,
            fromLeft(painter.fontMetrics().elidedText(m_look.name, Qt::ElideMiddle, static_cast<int>(line.width()))));
    }
}

} // namespace lumora
