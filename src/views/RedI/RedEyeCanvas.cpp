#include "views/RedI/RedEyeCanvas.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QPainterPath>
#include <QWheelEvent>

#include <algorithm>

namespace lumora {

namespace {

constexpr int longPress = 600;
constexpr int wheelStep = 120;
constexpr double finger = 10;

// Yellow on a dark rim, so that it is seen on any picture.
void drawCircle(QPainter& painter, const QRectF& circle, int rim, int line) {
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(Theme::Colour::Ink, rim));
    painter.drawEllipse(circle);
    painter.setPen(QPen(Theme::Colour::Marker, line));
    painter.drawEllipse(circle);
}

} // namespace

RedEyeCanvas::RedEyeCanvas(RedI& page, const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_page(page)
    , m_theme(theme) {
    setMouseTracking(true); // the read-out follows the mouse
    setFocusPolicy(Qt::TabFocus);
    setMinimumSize(theme.px(320), theme.px(200));
    m_longPress.setSingleShot(true);
    m_longPress.setInterval(longPress);
    connect(&m_longPress, &QTimer::timeout, this,
            [this, &held = m_page] { held.Picture1_MouseDown(RedI::Button::Right, inPicture(m_pressedAt)); });
}

QPointF RedEyeCanvas::onWidget(QPointF picture) const {
    const QPointF corner(m_page.sight().Picture1Left, m_page.sight().Picture1Top);
    return QRectF(rect()).center() + (corner - RedEyeSight::viewingCentre) * m_theme.factor() + picture * scale();
}

QPointF RedEyeCanvas::inPicture(QPointF widget) const {
    return (widget - onWidget({})) / scale();
}

QRectF RedEyeCanvas::visiblePart() const {
    return QRectF(inPicture({}), QSizeF(size()) / scale()) & QRectF(m_page.picture().Picture1.image().rect());
}

void RedEyeCanvas::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    QPainterPath shape;
    shape.addRoundedRect(rect(), m_theme.corner(), m_theme.corner());
    painter.setClipPath(shape);
    painter.fillRect(rect(), Theme::Colour::Sunken);
    if (m_page.picture().Picture1.isNull())
        return;
    const QRectF part = visiblePart();
    const auto placed = [this](const QRectF& area) { return QRectF(onWidget(area.topLeft()), area.size() * scale()); };
    painter.drawImage(placed(part), m_page.picture().Picture1.image(), part);
    if (m_page.controls().Image1.visible && !m_page.picture().Image1Picture.isNull())
        painter.drawImage(placed(m_page.picture().patchPlace), m_page.picture().Image1Picture.image());
    if (m_page.controls().RedTargetRectangle.visible)
        drawCircle(painter, placed(m_page.sight().circle()), m_theme.px(5), m_theme.thick());
}

void RedEyeCanvas::mousePressEvent(QMouseEvent* event) {
    const bool right = event->button() == Qt::RightButton;
    if (!right && event->button() != Qt::LeftButton)
        return;
    m_pressedAt = event->position();
    if (!right)
        m_longPress.start();
    m_page.Picture1_MouseDown(right ? RedI::Button::Right : RedI::Button::Left, inPicture(event->position()));
}

void RedEyeCanvas::mouseMoveEvent(QMouseEvent* event) {
    if ((event->position() - m_pressedAt).manhattanLength() > finger * m_theme.factor())
        m_longPress.stop();
    m_page.Picture1_MouseMove(inPicture(event->position()));
}

void RedEyeCanvas::mouseReleaseEvent(QMouseEvent* event) {
    m_longPress.stop();
    if (event->button() == Qt::LeftButton)
        m_page.Picture1_MouseUp(inPicture(event->position()));
}

void RedEyeCanvas::wheelEvent(QWheelEvent* event) {
    m_wheel += event->angleDelta().y();
    for (; m_wheel >= wheelStep; m_wheel -= wheelStep)
        m_page.Combo1_Change(0);
    for (; m_wheel <= -wheelStep; m_wheel += wheelStep)
        m_page.Combo1_Change(2);
    event->accept();
}

void RedEyeCanvas::keyPressEvent(QKeyEvent* event) {
    switch (event->key()) {
    case Qt::Key_Up:
        return tap(&RedI::Image12_MouseDown);
    case Qt::Key_Down:
        return tap(&RedI::Image13_MouseDown);
    case Qt::Key_Left:
        return tap(&RedI::Image14_MouseDown);
    case Qt::Key_Right:
        return tap(&RedI::Image15_MouseDown);
    case Qt::Key_Plus:
    case Qt::Key_Equal:
        return m_page.Combo1_Change(0);
    case Qt::Key_Minus:
        return m_page.Combo1_Change(2);
    case Qt::Key_Menu:
        return m_page.kofez_Open();
    default:
        QWidget::keyPressEvent(event);
    }
}

// A key moves the circle as a tap of the arrow's button does.
void RedEyeCanvas::tap(void (RedI::*arrowDown)()) {
    (m_page.*arrowDown)();
    m_page.Arrow_MouseUp();
}

void RedEyeCanvas::hideEvent(QHideEvent* event) {
    m_longPress.stop();
    QWidget::hideEvent(event);
}

void RedEyeCanvas::resizeEvent(QResizeEvent* event) {
    QWidget::resizeEvent(event);
    Q_EMIT resized();
}

RedEyeOverview::RedEyeOverview(RedI& page, const Theme& theme, const RedEyeCanvas& canvas, QWidget* parent)
    : QWidget(parent)
    , m_page(page)
    , m_theme(theme)
    , m_canvas(canvas) {
    setFocusPolicy(Qt::TabFocus);
}

void RedEyeOverview::fit() {
    constexpr double tallest = 190;
    const QSizeF logical(std::max(1, m_page.picture().Picture3Size.width),
                         std::max(1, m_page.picture().Picture3Size.height));
    const double share = std::min(1.0, tallest / logical.height());
    const QSize wanted(m_theme.px(std::max(1.0, logical.width() * share)),
                       m_theme.px(std::max(1.0, logical.height() * share)));
    if (size() != wanted)
        setFixedSize(wanted);
    update();
}

void RedEyeOverview::paintEvent(QPaintEvent*) {
    if (m_page.picture().Picture3.isNull())
        return;
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    painter.drawImage(rect(), m_page.picture().Picture3.image());
    const double across = static_cast<double>(width()) / m_page.picture().Picture1.width();
    const double down = static_cast<double>(height()) / m_page.picture().Picture1.height();
    const auto placed = [&](const QRectF& part) {
        return QRectF(part.left() * across, part.top() * down, part.width() * across, part.height() * down);
    };
    painter.setBrush(Qt::NoBrush);
    const QRectF seen = placed(m_canvas.visiblePart()).adjusted(1, 1, -1, -1);
    painter.setPen(QPen(Qt::white, m_theme.thick()));
    painter.drawRect(seen);
    painter.setPen(QPen(Theme::Colour::Primary, m_theme.hair()));
    painter.drawRect(seen);
    if (!m_page.controls().RedTargetRectangle.visible)
        return;
    QRectF circle = placed(m_page.sight().circle());
    const double least = m_theme.px(12);
    if (circle.width() < least) {
        const QPointF middle = circle.center();
        circle.setSize({least, least});
        circle.moveCenter(middle);
    }
    drawCircle(painter, circle, m_theme.px(4), m_theme.hair());
}

void RedEyeOverview::mousePressEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton)
        m_page.Picture3_Click({event->position().x() / width(), event->position().y() / height()});
}

// The first key brings the circle to the middle.
void RedEyeOverview::keyPressEvent(QKeyEvent* event) {
    constexpr double step = 1.0 / 40; // of the picture; the arrows of the large picture go on from there
    const QPoint way = event->key() == Qt::Key_Left    ? QPoint(-1, 0)
                       : event->key() == Qt::Key_Right ? QPoint(1, 0)
                       : event->key() == Qt::Key_Up    ? QPoint(0, -1)
                       : event->key() == Qt::Key_Down  ? QPoint(0, 1)
                                                       : QPoint();
    if (way.isNull())
        return QWidget::keyPressEvent(event);
    const RedEyeSight& sight = m_page.sight();
    const QPointF here(static_cast<double>(sight.RedSearchX) / sight.picture.width,
                       static_cast<double>(sight.RedSearchY) / sight.picture.height);
    const QPointF there = m_page.controls().RedTargetRectangle.visible ? here + step * QPointF(way) : here;
    m_page.Picture3_Click({std::clamp(there.x(), 0.0, 1.0), std::clamp(there.y(), 0.0, 1.0)});
}

RedEyeSteps::RedEyeSteps(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {
    setFixedHeight(theme.px(40));
}

void RedEyeSteps::show(const std::array<QString, 4>& steps, int current) {
    m_steps = steps;
    m_current = current;
    setAccessibleName(steps[static_cast<std::size_t>(current - 1)]);
    update();
}

void RedEyeSteps::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const bool leftwards = layoutDirection() == Qt::RightToLeft;
    const double cell = width() / 4.0;
    const double disc = m_theme.px(30);
    for (int i = 0; i < 4; ++i) {
        const bool present = i + 1 == m_current;
        const bool done = i + 1 < m_current;
        const double left = leftwards ? width() - (i + 1) * cell : i * cell;
        QRectF mark(0, (height() - disc) / 2, disc, disc);
        mark.moveLeft(leftwards ? left + cell - disc : left);
        painter.setPen(present || done ? QPen(Qt::NoPen) : QPen(Theme::Colour::Edge, m_theme.px(1.5)));
        painter.setBrush(present ? Theme::Colour::Primary : done ? Theme::Colour::PrimarySoft : Theme::Colour::Surface);
        painter.drawEllipse(mark.adjusted(1, 1, -1, -1));
        painter.setFont(m_theme.font(Theme::Type::Strong));
        painter.setPen(present ? QColor(Qt::white) : done ? Theme::Colour::PrimaryDark : Theme::Colour::Muted);
        painter.drawText(mark, Qt::AlignCenter, QString::number(i + 1));
        const double beside = disc + m_theme.size(Space::Small);
        const QRectF words(leftwards ? left + m_theme.px(6) : left + beside, 0, cell - beside - m_theme.px(6),
                           height());
        painter.setFont(m_theme.font(present ? Theme::Type::Strong : Theme::Type::Body));
        painter.setPen(present ? Theme::Colour::Ink : Theme::Colour::Muted);
        const int side = leftwards ? Qt::AlignRight : Qt::AlignLeft;
        painter.drawText(words, side | Qt::AlignVCenter | Qt::TextWordWrap, m_steps[static_cast<std::size_t>(i)]);
    }
}

} // namespace lumora
