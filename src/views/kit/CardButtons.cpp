#include "views/kit/CardButtons.h"

#include <QPainterPath>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

CardButton::CardButton(const Theme& theme, QWidget* parent)
    : QAbstractButton(parent)
    , m_theme(theme) {
    setFocusPolicy(Qt::TabFocus);
    setAttribute(Qt::WA_Hover);
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred);
}

void CardButton::setCardSize(QSizeF size) {
    m_size = size;
    updateGeometry();
}

QSize CardButton::sizeHint() const {
    return {m_theme.px(m_size.width()), m_theme.px(m_size.height())};
}

QSize CardButton::minimumSizeHint() const {
    return {std::max(m_theme.px(m_size.width() * 0.7), m_theme.target()),
            std::max(m_theme.px(m_size.height() * 0.8), m_theme.target())};
}

void CardButton::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    const double thick = isChecked() ? m_theme.thick() : underMouse() && isEnabled() ? m_theme.hair() : m_theme.edge();
    const bool lively = isEnabled() && (underMouse() || isDown());
    const QRectF card = drawCard(painter, rect(), isChecked() || lively ? Theme::Colour::Primary : Theme::Colour::Line,
                                 !isEnabled()              ? Theme::Colour::Sunken
                                 : isChecked() || isDown() ? Theme::Colour::PrimarySoft
                                                           : Theme::Colour::Surface,
                                 thick, m_theme.size(Space::Wide), m_theme.edgeStyle(isEnabled()));
    painter.setPen(isEnabled() ? Theme::Colour::Ink : Theme::Colour::Muted);
    painter.setLayoutDirection(layoutDirection());
    const int inset = m_theme.gap();
    paintInside(painter, card.adjusted(inset, inset, -inset, -inset));
    painter.setLayoutDirection(layoutDirection());
    if (isChecked())
        drawMark(painter, m_theme, card, {.icon = u"tick"_s, .disc = Theme::Colour::Primary, .radius = 13, .inset = 8});
}

Tile::Tile(const Theme& theme, QWidget* parent, QString icon)
    : CardButton(theme, parent)
    , m_icon(std::move(icon)) {
    setCardSize({290, 150});
}

void Tile::setExplanation(const QString& text) {
    if (m_explanation == text)
        return;
    m_explanation = text;
    setAccessibleDescription(text);
    update();
}

void Tile::setMarked(bool marked) {
    m_marked = marked;
    update();
}

void Tile::paintDisc(QPainter& painter, const QRectF& disc) const {
    painter.save();
    painter.setPen(Qt::NoPen);
    painter.setBrush(m_marked ? Theme::Colour::Primary : Theme::Colour::PrimarySoft);
    painter.drawEllipse(disc);
    drawIcon(painter, disc.center(),
             theme().icon(m_icon, static_cast<int>(disc.width() * 0.55),
                          m_marked ? QColor(Qt::white) : Theme::Colour::PrimaryDark));
    painter.restore();
}

void Tile::paintInside(QPainter& painter, const QRectF& room) {
    if (room.height() > theme().px(170)) {
        paintUpright(painter, room);
        return;
    }
    const bool rightToLeft = layoutDirection() == Qt::RightToLeft;
    const double disc = std::min<double>(theme().px(60), room.height() * 0.7);
    const double gap = theme().size(Space::Wide);
    QRectF mark(0, 0, disc, disc);
    mark.moveCenter({rightToLeft ? room.right() - disc / 2 - theme().size(Space::Tight)
                                 : room.left() + disc / 2 + theme().size(Space::Tight),
                     room.center().y()});
    paintDisc(painter, mark);

    QRectF words = room;
    if (rightToLeft)
        words.setRight(mark.left() - gap);
    else
        words.setLeft(mark.right() + gap);
    const int flags =
        Qt::TextWordWrap | (rightToLeft ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignAbsolute | Qt::AlignTop;
    const QFont head = theme().font(Theme::Type::Large);
    const QFont body = theme().font(Theme::Type::Small);
    const QRectF headBox = QFontMetricsF(head).boundingRect(words, flags, text());
    const QRectF bodyBox =
        m_explanation.isEmpty() ? QRectF() : QFontMetricsF(body).boundingRect(words, flags, m_explanation);
    const double between = m_explanation.isEmpty() ? 0 : theme().size(Space::Tight);
    double y = words.top() + std::max(0.0, (words.height() - headBox.height() - between - bodyBox.height()) / 2);
    painter.setFont(head);
    painter.drawText(QRectF(words.left(), y, words.width(), headBox.height() + 2), flags, text());
    y += headBox.height() + between;
    painter.setFont(body);
    painter.setPen(Theme::Colour::Muted);
    painter.drawText(QRectF(words.left(), y, words.width(), words.bottom() - y + theme().size(Space::Small)), flags,
                     m_explanation);
}

void Tile::paintUpright(QPainter& painter, const QRectF& room) {
    const double disc = theme().px(84);
    const int flags = Qt::TextWordWrap | Qt::AlignHCenter | Qt::AlignTop;
    const QFont head = theme().font(Theme::Type::Large);
    const QFont body = theme().font(Theme::Type::Body);
    const QRectF words = room.adjusted(theme().size(Space::Tight), 0, -theme().size(Space::Tight), 0);
    const double headHeight = QFontMetricsF(head).boundingRect(words, flags, text()).height();
    const double bodyHeight =
        m_explanation.isEmpty() ? 0 : QFontMetricsF(body).boundingRect(words, flags, m_explanation).height();
    double y = room.center().y() -
               (disc + theme().size(Space::Wide) + headHeight + theme().size(Space::Tight) + bodyHeight) / 2;
    const QRectF mark(room.center().x() - disc / 2, y, disc, disc);
    paintDisc(painter, mark);
    y += disc + theme().size(Space::Wide);
    painter.setFont(head);
    painter.drawText(QRectF(words.left(), y, words.width(), headHeight + 2), flags, text());
    y += headHeight + theme().size(Space::Tight);
    painter.setFont(body);
    painter.setPen(Theme::Colour::Muted);
    painter.drawText(QRectF(words.left(), y, words.width(), bodyHeight + 2), flags, m_explanation);
}

DrawingCard::DrawingCard(const Theme& theme, QWidget* parent, Drawing drawing, QSizeF size, Words words)
    : CardButton(theme, parent)
    , m_drawing(std::move(drawing))
    , m_words(words) {
    setCardSize(size);
}

void DrawingCard::setRibbon(QColor colour) {
    if (m_ribbon == colour)
        return;
    m_ribbon = colour;
    update();
}

void DrawingCard::paintInside(QPainter& painter, const QRectF& room) {
    const bool small = m_words == Words::Small;
    QRectF line = room;
    line.setTop(room.bottom() - theme().px(small ? 40 : 34));
    painter.save();
    m_drawing(painter, QRectF(room.topLeft(), line.topRight()), text());
    painter.restore();
    if (m_ribbon.isValid()) {
        // A ribbon on the side opposite to the mark of the choice.
        const double width = theme().size(Space::Wide);
        const double top = room.top() - theme().gap();
        const double bottom = top + theme().px(34);
        const double left = layoutDirection() == Qt::RightToLeft ? room.right() - width : room.left();
        painter.setPen(Qt::NoPen);
        painter.setBrush(m_ribbon);
        painter.drawPolygon(QPolygonF{{left, top},
                                      {left + width, top},
                                      {left + width, bottom},
                                      {left + width / 2, bottom - theme().size(Space::Small)},
                                      {left, bottom}});
    }
    painter.setPen(isEnabled() ? Theme::Colour::Ink : Theme::Colour::Muted);
    painter.setFont(theme().font(m_words == Words::Size ? Theme::Type::Large
                                 : small                ? Theme::Type::Small
                                                        : Theme::Type::Strong));
    if (m_words == Words::Size)
        painter.setLayoutDirection(Qt::LeftToRight);
    const int beside = small ? theme().size(Space::Small) : 0;
    const int below = small ? theme().size(Space::Tight) : 0;
    painter.drawText(line.adjusted(-beside, below, beside, below),
                     Qt::AlignCenter | (small ? static_cast<int>(Qt::TextWordWrap) : 0),
                     small && !toolTip().isEmpty() ? text() + u'\n' + toolTip() : text());
}

void BorderSample::setCode(const QString& code) {
    if (m_code == code)
        return;
    m_code = code;
    update();
}

void BorderSample::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    if (!m_code.isEmpty())
        drawBorderSample(painter, QRectF(rect()).adjusted(4, 4, -4, -4), m_code);
}

PictureBox::PictureBox(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {}

void PictureBox::setPicture(const QImage& picture) {
    if (picture.cacheKey() == m_picture.cacheKey())
        return;
    m_picture = picture;
    m_scaled = {};
    update();
}

void PictureBox::paintEvent(QPaintEvent*) {
    if (m_picture.isNull())
        return;
    QPainter painter(this);
    const double ratio = devicePixelRatioF();
    const QSize fit = m_picture.size().scaled(size() * ratio, Qt::KeepAspectRatio);
    if (m_scaled.size() != fit) {
        m_scaled = QPixmap::fromImage(fit == m_picture.size()
                                          ? m_picture
                                          : m_picture.scaled(fit, Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
        m_scaled.setDevicePixelRatio(ratio);
    }
    const QSizeF at = m_scaled.deviceIndependentSize();
    painter.drawPixmap(QPointF((width() - at.width()) / 2, (height() - at.height()) / 2), m_scaled);
}

} // namespace lumora
