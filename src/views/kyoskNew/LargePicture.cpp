#include "views/kyoskNew/LargePicture.h"

#include "views/kit/Painting.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainterPath>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The paper where the picture has that place on the screen.
QRectF paperOver(const QRectF& picture, const QRectF& shares) {
    return {picture.left() + shares.left() * picture.width(), picture.top() + shares.top() * picture.height(),
            shares.width() * picture.width(), shares.height() * picture.height()};
}

} // namespace

LargePicture::LargePicture(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {
    setMinimumSize(theme.size(Extent::Field), theme.size(Extent::Drawing));
}

void LargePicture::show(const LargeView& view) {
    m_view = view;
    setAccessibleName(view.bitmap.isNull() ? view.guide.join(u' ').simplified()
                      : view.poor          ? view.spoken + u". "_s + view.warning
                                           : view.spoken);
    setCursor(view.bitmap.isNull() ? Qt::ArrowCursor : Qt::PointingHandCursor);
    setFocusPolicy(view.bitmap.isNull() ? Qt::NoFocus : Qt::TabFocus);
    update();
}

void LargePicture::mousePressEvent(QMouseEvent* event) {
    m_pressed = event->button() == Qt::LeftButton && !m_view.bitmap.isNull();
}

void LargePicture::mouseReleaseEvent(QMouseEvent* event) {
    if (std::exchange(m_pressed, false) && rect().contains(event->position().toPoint()))
        Q_EMIT clicked();
}

void LargePicture::keyPressEvent(QKeyEvent* event) {
    const bool press = event->key() == Qt::Key_Space || event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (!press || m_view.bitmap.isNull())
        return QWidget::keyPressEvent(event);
    Q_EMIT clicked();
}

// The picture and its paper together are as large as the view.
QRectF LargePicture::pictureRoom() const {
    const QRectF one(0, 0, 1, 1);
    const QRectF both = m_view.paper.isNull() ? one : one.united(m_view.paper);
    const QSizeF shape = m_view.bitmap.image().size();
    const QRectF room = fitted(rect(), {shape.width() * both.width(), shape.height() * both.height()});
    const QSizeF size(room.width() / both.width(), room.height() / both.height());
    return {{room.left() - both.left() * size.width(), room.top() - both.top() * size.height()}, size};
}

// What the paper does not take is shaded, and the paper's edge is seen on any picture.
void LargePicture::drawCut(QPainter& painter, const QRectF& picture) const {
    const QRectF paper = paperOver(picture, m_view.paper);
    QPainterPath cut;
    cut.addRect(picture);
    QPainterPath kept;
    kept.addRect(paper);
    cut -= kept;
    QColor shade = Theme::Colour::Ink;
    shade.setAlpha(165);
    painter.fillPath(cut, shade);
    painter.fillPath(cut, QBrush(QColor(255, 255, 255, 70), Qt::BDiagPattern));
    painter.setBrush(Qt::NoBrush);
    const double half = m_theme.hair() / 2.0;
    const QRectF edge = paper.adjusted(half, half, -half, -half);
    painter.setPen(QPen(Theme::Colour::Ink, m_theme.hair()));
    painter.drawRect(edge);
    QPen dashes(Qt::white, m_theme.hair());
    dashes.setDashPattern({4, 4});
    painter.setPen(dashes);
    painter.drawRect(edge);
}

void LargePicture::paintEvent(QPaintEvent*) {
    if (!m_view.visible)
        return;
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    if (m_view.bitmap.isNull()) {
        QStringList lines;
        for (const QString& line : m_view.guide) {
            const QString words = line.trimmed();
            // The row of arrows is left out, since the layout shows where the small pictures are.
            if (!words.isEmpty() && words != QString(words.size(), u'<'))
                lines += words;
        }
        const int flags = Qt::AlignHCenter | Qt::AlignTop | Qt::TextWordWrap;
        painter.setPen(Theme::Colour::Ink);
        painter.setLayoutDirection(layoutDirection());
        painter.setFont(m_theme.font(Theme::Type::Body));
        const int sign = m_theme.size(IconSize::Box);
        QRect words = rect().adjusted(0, sign + m_theme.size(Space::Wide), 0, 0);
        if (painter.boundingRect(words, flags, lines.join(u'\n')).height() > words.height()) {
            painter.setFont(m_theme.font(Theme::Type::Small)); // little room: the words alone, and smaller
            words = rect();
        } else {
            painter.drawPixmap(QPoint((width() - sign) / 2, m_theme.size(Space::Small)),
                               m_theme.icon(u"info"_s, sign, Theme::Colour::Primary));
        }
        painter.drawText(words, flags, lines.join(u'\n'));
        return;
    }
    const QRectF at = pictureRoom();
    painter.fillRect(paperOver(at, m_view.paper), Qt::white);
    painter.drawImage(at, m_view.bitmap.image());
    if (!m_view.paper.isNull())
        drawCut(painter, at);
    const double radius = m_theme.size(Space::Wide);
    const double in = radius + m_theme.size(Space::Small);
    const QPointF plate(at.right() - in, at.bottom() - in);
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(255, 255, 255, 215));
    painter.drawEllipse(plate, radius, radius);
    drawIcon(painter, plate, m_theme.icon(u"look"_s, m_theme.size(IconSize::Small), Theme::Colour::Ink));
    if (!m_view.poor)
        return;
    painter.setFont(m_theme.font(Theme::Type::Small));
    const int icon = m_theme.size(IconSize::Button);
    const int edge = m_theme.size(Space::Small);
    const QRectF room(at.left(), at.top(), at.width(), m_theme.target());
    QColor veil = Theme::Colour::SunSoft;
    veil.setAlpha(235);
    painter.fillRect(room, veil);
    const bool rightToLeft = layoutDirection() == Qt::RightToLeft;
    const double middle = edge + icon / 2.0;
    drawIcon(painter, {rightToLeft ? room.right() - middle : room.left() + middle, room.center().y()},
             m_theme.icon(u"warning"_s, icon, Theme::Colour::Danger));
    painter.setPen(Theme::Colour::Ink);
    painter.setLayoutDirection(layoutDirection());
    const int beside = icon + 2 * edge;
    painter.drawText(room.adjusted(rightToLeft ? edge : beside, 0, rightToLeft ? -beside : -edge, 0),
                     Qt::AlignVCenter | Qt::AlignLeading | Qt::TextWordWrap, m_view.warning);
}

} // namespace lumora
