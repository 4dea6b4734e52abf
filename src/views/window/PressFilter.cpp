#include "views/window/PressFilter.h"

#include "views/kit/TouchKeyboard.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QWidget>
#include <QWindow>

#include <utility>

namespace lumora {

namespace {

constexpr double samePlace = 40; // logical pixels

// A blank is a letter where text is typed.
bool isPress(const QKeyEvent& key, const QWidget& receiver) {
    return key.key() == Qt::Key_Return || key.key() == Qt::Key_Enter ||
           (key.key() == Qt::Key_Space && !receiver.testAttribute(Qt::WA_InputMethodEnabled));
}

DoubledPress::Clock sinceStart() {
    QElapsedTimer timer;
    timer.start();
    return [timer] { return timer.elapsed(); };
}

} // namespace

PressFilter::PressFilter(QWidget* window)
    : QObject(window)
    , rule(sinceStart())
    , m_window(window) {
    qApp->installEventFilter(this);
}

// Who types fast begins before the pause behind the rising of the keys is over. There a doubled press is one at the
// same place.
bool PressFilter::counts(const QWidget& widget, QPointF at) {
    const QPointF away = at - std::exchange(m_at, at);
    if (TouchKeyboard::has(widget) && away.manhattanLength() > samePlace)
        rule.seen();
    return rule.pressed();
}

bool PressFilter::eventFilter(QObject* watched, QEvent* event) {
    auto* widget = qobject_cast<QWidget*>(watched);
    const bool ours = widget && widget->window() == m_window;
    switch (event->type()) {
    case QEvent::Show:
    case QEvent::Hide:
        if (ours && !event->spontaneous() && widget->property("changesSight").toBool())
            rule.changed();
        break;
    case QEvent::UpdateRequest:
        if (watched == m_window)
            rule.painted();
        break;
    case QEvent::WindowDeactivate:
        if (watched == m_window)
            rule.released();
        break;
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
        if (ours)
            m_mouseTaken = !counts(*widget, static_cast<const QMouseEvent&>(*event).globalPosition());
        return ours && m_mouseTaken;
    case QEvent::MouseMove:
        if (static_cast<const QMouseEvent&>(*event).buttons() == Qt::NoButton)
            m_mouseTaken = false; // it was let go elsewhere
        return ours && m_mouseTaken;
    case QEvent::MouseButtonRelease: // also where a list that a press has opened gets it
        if (widget)
            rule.released();
        return widget && std::exchange(m_mouseTaken, false);
    case QEvent::TouchBegin:
        if (watched == m_window->windowHandle())
            rule.pressed();
        // Only the keys on the screen take a finger as such.
        return ours && TouchKeyboard::has(*widget) &&
               !counts(*widget, static_cast<const QTouchEvent&>(*event).points().front().globalPosition());
    case QEvent::TouchEnd:
    case QEvent::TouchCancel:
        if (watched == m_window->windowHandle())
            rule.released();
        break;
    case QEvent::KeyPress:
        if (!ours || !isPress(static_cast<const QKeyEvent&>(*event), *widget))
            break;
        m_keyTaken = !rule.pressed();
        return m_keyTaken;
    case QEvent::KeyRelease:
        if (!ours || !isPress(static_cast<const QKeyEvent&>(*event), *widget) ||
            static_cast<const QKeyEvent&>(*event).isAutoRepeat())
            break;
        rule.released();
        return std::exchange(m_keyTaken, false);
    default:
        break;
    }
    return false;
}

} // namespace lumora
