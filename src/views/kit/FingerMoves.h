#pragma once

#include "views/kit/Pinch.h"
#include "views/kit/Swipe.h"

#include <QMouseEvent>
#include <QObject>
#include <QPointer>
#include <QTimer>
#include <QWidget>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

class QAbstractScrollArea;
class QPointingDevice;
class QTouchEvent;
class QWindow;

namespace lumora {

// Whether the event was made from a finger.
bool isTouch(const QMouseEvent& event);

// What lies in it can be swiped to a side; beside that it is pressed as ever.
class SwipeBox : public QWidget {
    Q_OBJECT
public:
    SwipeBox(QLayout* inside, std::function<void(Swipe::Way)> swiped);
    void swipe(Swipe::Way way) { m_swiped(way); }

private:
    std::function<void(Swipe::Way)> m_swiped;
};

// A widget that two fingers pinch, if it is this beside its own class.
class PinchTarget {
public:
    virtual ~PinchTarget() = default;
    virtual void touched() {} // by the first of the fingers, before it presses
    virtual void pinched(const Pinch& pinch) = 0;
    virtual void pinchEnded() {}
};

// What fingers do in the program's windows beside pressing: a list or a scroll area moves with the finger, and no
// press of what lies there comes of it; boxes are swiped, a target is pinched, a tooltip is read where a finger rests.
// Whatever scrolls by pixels is served without being told; what drags by itself has the property "ownDrag". A mouse is
// left alone.
class FingerMoves : public QObject {
    Q_OBJECT
public:
    // isRefused: whether the press in hand does not count. Nothing is swiped by it.
    explicit FingerMoves(QObject* parent, std::function<bool()> isRefused = {});

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    // Which way of the finger is known: it may press, it moves what it touches, or nothing more comes of it.
    enum class Way { None, Open, Scrolls, Spent };

    bool press(QWidget& widget, const QMouseEvent& event);
    bool move(const QMouseEvent& event);
    bool release(const QMouseEvent& event);
    void follow(QWindow& window, const QTouchEvent& event);
    void beginPinch(QWindow& window, QLineF fingers);
    void begin(Way way);
    void scroll(int input, const QMouseEvent& event) const;
    void send(QMouseEvent& event);
    void sendPress();
    void endPinch();
    void forget(Way way);
    void tell() const;

    const std::function<bool()> m_isRefused;
    Way m_way = Way::None;
    QPointer<QWidget> m_widget; // that was pressed
    QPointer<QAbstractScrollArea> m_area;
    QPointer<SwipeBox> m_box;
    std::optional<Swipe> m_swipe;
    // A list chooses at the press, which waits here until it is known to be one.
    std::vector<std::unique_ptr<QMouseEvent>> m_waiting;
    bool m_waits = false;
    bool m_sends = false;
    QPointF m_from;
    const QPointingDevice* m_finger = nullptr;
    QPointF m_at;
    QPointer<QWidget> m_pinched;
    std::optional<Pinch> m_pinch;
    QTimer m_rests;
};

} // namespace lumora
