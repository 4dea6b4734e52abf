#include "views/window/PressFilter.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QWidget>
#include <QWindow>

#include <utility>

namespace lumora {

namespace {

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
            m_mouseTaken = !rule.pressed();
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
        break;
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
