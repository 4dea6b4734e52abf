#include "views/kyoskNew/PictureCell.h"

#include "views/kit/Maker.h"
#include "views/picture/ResolutionBadge.h"

#include <QKeyEvent>
#include <QPainterPath>

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

PictureCell::PictureCell(const Theme& theme, QWidget* parent)
    : CardButton(theme, parent) {
    setCardSize({146, 160});
    setMinimumWidth(3 * theme.key() + 2 * theme.thick());
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
    fitPicture();
    m_strip->setVisible(look.chosen);
    m_copies->setText(look.copies.trimmed());
    setEnabled(look.filled && look.unreadable.isEmpty());
    update();
}

QRect PictureCell::pictureRoom() const {
    const int inset = theme().thick();
    return rect().adjusted(inset, inset, -inset, -inset);
}

int PictureCell::pictureSide() const {
    const QRect room = pictureRoom();
    return static_cast<int>(std::max(room.width(), room.height()) * devicePixelRatioF());
}

int PictureCell::nameHeight() const {
    return QFontMetrics(theme().font(Theme::Type::Small)).height() + theme().size(Space::Small);
}

// Scaled once for a picture in a room, however often it is shown and painted.
void PictureCell::fitPicture() {
    const QSize room = pictureRoom().size() * devicePixelRatioF();
    if (const std::pair from(m_look.picture.cacheKey(), room); std::exchange(m_fittedFrom, from) == from)
        return;
    const QSize size = m_look.picture.size();
    const bool fits = size.width() <= room.width() && size.height() <= room.height();
    if (m_look.picture.isNull() || room.isEmpty()) {
        m_fitted = QImage();
        return;
    }
    m_fitted = fits ? m_look.picture : m_look.picture.scaled(room, Qt::KeepAspectRatio, Qt::SmoothTransformation);
    m_fitted.setDevicePixelRatio(devicePixelRatioF());
}

void PictureCell::resizeEvent(QResizeEvent*) {
    Q_EMIT resized();
    fitPicture();
    const QRect room = pictureRoom();
    m_strip->setGeometry(room.left(), room.bottom() + 1 - theme().key(), room.width(), theme().key());
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
                                 m_look.inEditor           ? Theme::Colour::SunEdge
                                 : m_look.chosen || lively ? Theme::Colour::Primary
                                                           : Theme::Colour::Line,
                                 m_look.chosen                                  ? Theme::Colour::PrimarySoft
                                 : m_look.filled && m_look.unreadable.isEmpty() ? Theme::Colour::Surface
                                                                                : Theme::Colour::Paper,
                                 m_look.chosen || m_look.inEditor ? theme().thick()
                                 : lively                         ? theme().hair()
                                                                  : theme().edge(),
                                 theme().corner());
    if (!m_look.filled)
        return;
    const QRectF room = pictureRoom();
    QRectF band = room;
    band.setTop(room.bottom() - (m_look.chosen ? theme().key() : nameHeight()));
    painter.save();
    QPainterPath inside;
    inside.addRoundedRect(room, theme().corner() - theme().thick(), theme().corner() - theme().thick());
    painter.setClipPath(inside);
    if (!m_fitted.isNull()) {
        const QSizeF size = m_fitted.deviceIndependentSize();
        const double free = room.height() - size.height();
        // Above the name where there is room, and there it stays when it is chosen. The picture begins on a whole
        // pixel; between pixels it would be drawn blurred.
        const QPointF at(room.left() + (room.width() - size.width()) / 2,
                         room.top() + std::max(0.0, free - nameHeight()) / 2);
        painter.drawImage(at.toPoint(), m_fitted);
    } else {
        const QString icon = m_look.waiting ? u"clock"_s : m_look.unreadable.isEmpty() ? u"picture"_s : u"warning"_s;
        drawIcon(painter, room.center() - QPointF(0, band.height() / 2),
                 theme().icon(icon, theme().size(IconSize::Box), Theme::Colour::Edge));
    }
    painter.setFont(theme().font(Theme::Type::Small));
    if (!m_look.unreadable.isEmpty()) {
        painter.setPen(Theme::Colour::Muted);
        painter.drawText(QRectF(room.left(), room.center().y(), room.width(), band.top() - room.center().y()),
                         Qt::AlignCenter | Qt::TextWordWrap, m_look.unreadable);
    }
    // Words on any picture keep their contrast.
    QColor veil = m_look.chosen ? Theme::Colour::PrimarySoft : Theme::Colour::Surface;
    veil.setAlpha(230);
    painter.fillRect(band, veil);
    painter.setPen(Theme::Colour::Ink);
    const double beside = theme().size(Space::Small);
    if (!m_look.chosen)
        painter.drawText(band, Qt::AlignCenter,
                         fromLeft(painter.fontMetrics().elidedText(m_look.name, Qt::ElideMiddle,
                                                                   static_cast<int>(band.width() - 2 * beside))));
    painter.restore();
    if (m_look.resolution.visible)
        drawResolution(painter, theme(), {room.left() + beside, band.top() - theme().size(Space::Tight)},
                       m_look.resolution);
    if (m_look.chosen || m_look.inEditor)
        drawMark(painter, theme(), card,
                 {.icon = m_look.inEditor ? u"edit"_s : u"tick"_s,
                  .disc = m_look.inEditor ? Theme::Colour::Sun : Theme::Colour::Primary,
                  .ink = m_look.inEditor ? Theme::Colour::Ink : QColor(Qt::white),
                  .radius = 14,
                  .inset = 5,
                  .rim = 2});
}

} // namespace lumora
