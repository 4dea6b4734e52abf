#include "views/kit/FingerMoves.h"

#include "views/kit/HoldButton.h"

#include <QAbstractItemView>
#include <QApplication>
#include <QLayout>
#include <QPointingDevice>
#include <QScrollArea>
#include <QScrollBar>
#include <QScroller>
#include <QToolTip>
#include <QWindow>

#include <utility>

namespace lumora {

namespace {

constexpr int restsAfter = 700;      // milliseconds
constexpr QPoint aboveFinger(0, 90); // logical pixels
constexpr double farAway = -1000000; // where nothing is pressed any more

template <class T>
T* around(QWidget* widget) {
    while (widget && !dynamic_cast<T*>(widget))
        widget = widget->isWindow() ? nullptr : widget->parentWidget();
    return dynamic_cast<T*>(widget);
}

bool canScroll(const QAbstractScrollArea& area) {
    const bool byPixels = qobject_cast<const QAbstractItemView*>(&area) || qobject_cast<const QScrollArea*>(&area);
    const auto moves = [](const QScrollBar& bar, Qt::ScrollBarPolicy policy) {
        return policy != Qt::ScrollBarAlwaysOff && bar.maximum() > bar.minimum();
    };
    return byPixels && !area.property("ownDrag").toBool() &&
           (moves(*area.verticalScrollBar(), area.verticalScrollBarPolicy()) ||
            moves(*area.horizontalScrollBar(), area.horizontalScrollBarPolicy()));
}

// The nearest one whose content the widget lies in.
QAbstractScrollArea* scrolledAround(QWidget* widget) {
    auto* area = around<QAbstractScrollArea>(widget);
    while (area && !(canScroll(*area) && (area->viewport() == widget || area->viewport()->isAncestorOf(widget)))) {
        widget = area;
        area = area->isWindow() ? nullptr : around<QAbstractScrollArea>(area->parentWidget());
    }
    return area;
}

// No panel has come to lie over it.
bool isInSight(const QWidget& widget) {
    const QWidget* hit = widget.window()->childAt(widget.mapTo(widget.window(), widget.rect().center()));
    return hit && (hit == &widget || widget.isAncestorOf(hit));
}

PinchTarget* targetAt(QWindow& window, QPointF at) {
    QWidget* whole = QWidget::find(window.winId());
    return whole ? around<PinchTarget>(whole->childAt(whole->mapFromGlobal(at.toPoint()))) : nullptr;
}

} // namespace

bool isTouch(const QMouseEvent& event) {
    return event.source() != Qt::MouseEventNotSynthesized ||
           (event.pointingDevice() && event.pointingDevice()->type() == QInputDevice::DeviceType::TouchScreen);
}

SwipeBox::SwipeBox(QLayout* inside, std::function<void(Swipe::Way)> swiped)
    : m_swiped(std::move(swiped)) {
    inside->setContentsMargins(0, 0, 0, 0);
    setLayout(inside);
}

FingerMoves::FingerMoves(QObject* parent, std::function<bool()> isRefused)
    : QObject(parent)
    , m_isRefused(std::move(isRefused)) {
    qApp->installEventFilter(this);
    m_rests.setSingleShot(true);
    m_rests.setInterval(restsAfter);
    connect(&m_rests, &QTimer::timeout, this, &FingerMoves::tell);
}

bool FingerMoves::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
        if (watched->isWindowType())
            follow(static_cast<QWindow&>(*watched), static_cast<const QTouchEvent&>(*event));
        return false;
    case QEvent::TouchCancel:
        if (watched->isWindowType())
            forget(Way::Spent); // its release still comes
        return false;
    case QEvent::Polish: // before anything is pressed, since rows move by it
        if (auto* rows = qobject_cast<QAbstractItemView*>(watched)) {
            rows->setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
            rows->setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
        }
        return false;
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease:
        break;
    default:
        return false;
    }
    const auto& mouse = static_cast<const QMouseEvent&>(*event);
    // What a press of ours starts may run an event loop, whose fingers are others.
    const bool ours = m_sends && !event->spontaneous();
    if (ours || !watched->isWidgetType() || !isTouch(mouse))
        return false;
    switch (event->type()) {
    case QEvent::MouseMove:
        return move(mouse);
    case QEvent::MouseButtonRelease:
        return release(mouse);
    default:
        return press(static_cast<QWidget&>(*watched), mouse);
    }
}

bool FingerMoves::press(QWidget& widget, const QMouseEvent& event) {
    // The parents of a widget that takes no press are asked behind it, and a double click behind its press.
    if (m_way == Way::None) {
        m_way = Way::Open;
        m_widget = &widget;
        m_from = m_at = event.globalPosition();
        m_finger = event.pointingDevice();
        m_area = scrolledAround(&widget);
        m_box = around<SwipeBox>(&widget);
        if (m_box)
            m_swipe.emplace(m_from, event.timestamp());
        m_waits = qobject_cast<QAbstractItemView*>(m_area) && m_area->viewport() == &widget;
        m_rests.start();
        if (m_area) {
            scroll(QScroller::InputPress, event);
            if (QScroller::scroller(m_area->viewport())->state() == QScroller::Dragging)
                m_way = Way::Scrolls; // it stops what still runs
        }
    }
    if (m_way != Way::Open)
        return true;
    if (m_waits && &widget == m_widget)
        m_waiting.emplace_back(event.clone());
    return m_waits;
}

bool FingerMoves::move(const QMouseEvent& event) {
    if (m_way == Way::None || std::exchange(m_at, event.globalPosition()) == event.globalPosition())
        return m_way != Way::None && (m_waits || m_way != Way::Open);
    if ((m_at - m_from).manhattanLength() > Swipe::press)
        m_rests.stop();
    if (m_area && m_way != Way::Spent) {
        scroll(QScroller::InputMove, event);
        if (m_way == Way::Open && QScroller::scroller(m_area->viewport())->state() == QScroller::Dragging)
            begin(Way::Scrolls);
    } else if (m_swipe && m_way == Way::Open && m_swipe->strays(m_at)) {
        begin(Way::Spent);
    }
    return m_waits || m_way != Way::Open;
}

bool FingerMoves::release(const QMouseEvent& event) {
    const Way way = std::exchange(m_way, Way::None);
    m_rests.stop();
    if (way == Way::None)
        return false;
    if (m_area && way != Way::Spent)
        scroll(QScroller::InputRelease, event);
    auto swipe = std::exchange(m_swipe, std::nullopt);
    if (way == Way::Open) {
        sendPress();
        return !m_widget; // it may have gone with its press
    }
    if (way == Way::Spent && swipe && m_box && isInSight(*m_box))
        m_box->swipe(swipe->end(event.globalPosition(), static_cast<qint64>(event.timestamp())));
    return true;
}

void FingerMoves::send(QMouseEvent& event) {
    m_sends = true;
    QApplication::sendEvent(m_widget, &event);
    m_sends = false;
}

void FingerMoves::sendPress() {
    for (const auto& waiting : std::exchange(m_waiting, {})) {
        if (m_widget)
            send(*waiting);
    }
}

// The press is taken back from what has it.
void FingerMoves::begin(Way way) {
    const bool pressed = m_way == Way::Open && !m_waits;
    if (m_isRefused && m_isRefused())
        m_swipe.reset();
    if (m_area && way != Way::Scrolls)
        QScroller::scroller(m_area->viewport())->stop();
    m_way = way;
    m_waiting.clear();
    m_rests.stop();
    if (!pressed || !m_widget)
        return;
    QMouseEvent away(QEvent::MouseButtonRelease, {farAway, farAway}, {farAway, farAway}, Qt::LeftButton, Qt::NoButton,
                     Qt::NoModifier, m_finger);
    send(away);
}

void FingerMoves::scroll(int input, const QMouseEvent& event) const {
    const auto held = [](Qt::ScrollBarPolicy policy, double from, double at) {
        return policy == Qt::ScrollBarAlwaysOff ? from : at;
    };
    const QPointF to(held(m_area->horizontalScrollBarPolicy(), m_from.x(), event.globalPosition().x()),
                     held(m_area->verticalScrollBarPolicy(), m_from.y(), event.globalPosition().y()));
    QScroller::scroller(m_area->viewport())
        ->handleInput(static_cast<QScroller::Input>(input), m_area->viewport()->mapFromGlobal(to),
                      static_cast<qint64>(event.timestamp()));
}

void FingerMoves::follow(QWindow& window, const QTouchEvent& event) {
    std::vector<QPointF> down;
    for (const QEventPoint& point : event.points()) {
        if (point.state() != QEventPoint::Released)
            down.push_back(point.globalPosition());
    }
    if (event.type() == QEvent::TouchBegin && m_way != Way::None)
        forget(Way::None);
    if (event.type() == QEvent::TouchBegin && !down.empty()) {
        if (auto* target = targetAt(window, down.front()))
            target->touched();
    }
    if (m_pinch && down.size() != 2) {
        endPinch();
    } else if (m_pinch) {
        m_pinch->follow({down[0], down[1]});
        if (auto* target = dynamic_cast<PinchTarget*>(m_pinched.data()))
            target->pinched(*m_pinch);
    } else if (down.size() == 2 && m_way != Way::Scrolls) {
        beginPinch(window, {down[0], down[1]});
    }
}

void FingerMoves::beginPinch(QWindow& window, QLineF fingers) {
    PinchTarget* const target = targetAt(window, fingers.p1());
    if (!target || target != targetAt(window, fingers.p2()))
        return;
    begin(Way::Spent);
    m_pinched = dynamic_cast<QWidget*>(target);
    m_pinch.emplace(fingers);
}

void FingerMoves::endPinch() {
    if (!std::exchange(m_pinch, std::nullopt))
        return;
    if (auto* target = dynamic_cast<PinchTarget*>(m_pinched.data()))
        target->pinchEnded();
}

// The finger was lifted where nobody was told.
void FingerMoves::forget(Way way) {
    if (m_way != Way::None)
        begin(way);
    m_swipe.reset();
    endPinch();
}

void FingerMoves::tell() const {
    const auto* held = qobject_cast<const HoldButton*>(m_widget);
    if (m_way != Way::Open || !m_widget || (held && held->isHeld()))
        return;
    const auto* rows = qobject_cast<QAbstractItemView*>(m_area);
    const QString hint = rows && m_area->viewport() == m_widget
                             ? rows->indexAt(m_widget->mapFromGlobal(m_from.toPoint())).data(Qt::ToolTipRole).toString()
                             : m_widget->toolTip();
    if (!hint.isEmpty())
        QToolTip::showText(m_from.toPoint() - aboveFinger, hint, m_widget);
}

} // namespace lumora
