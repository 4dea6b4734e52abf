#include "views/kit/PressElsewhere.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QWidget>

namespace lumora {

PressElsewhere::PressElsewhere(QWidget& panel, QWidget& opener, std::function<void()> pressed)
    : QObject(&panel)
    , m_panel(panel)
    , m_opener(opener)
    , m_pressed(std::move(pressed)) {
    qApp->installEventFilter(this);
}

bool PressElsewhere::eventFilter(QObject* watched, QEvent* event) {
    const auto* pressed = qobject_cast<QWidget*>(watched);
    // A page over this one, or a box before it, is nothing that closes the panel.
    if (!pressed || !m_panel.isVisible() || pressed->window() != m_panel.window())
        return false;
    // A key that nobody takes goes on from parent to parent; it was meant for the first.
    if (event->type() == QEvent::KeyPress && pressed != QApplication::focusWidget())
        return false;
    const auto lies = [&](const QWidget& in) {
        if (event->type() != QEvent::KeyPress)
            // What ignores a press hands it on to its parent, so the place decides.
            return in.rect().contains(in.mapFromGlobal(static_cast<QMouseEvent*>(event)->globalPosition()).toPoint());
        return &in == pressed || in.isAncestorOf(pressed);
    };
    const auto pressesByKey = [&] {
        const int key = static_cast<QKeyEvent*>(event)->key();
        return key == Qt::Key_Return || key == Qt::Key_Enter || key == Qt::Key_Space;
    };
    const bool press = event->type() == QEvent::MouseButtonPress || event->type() == QEvent::MouseButtonDblClick ||
                       (event->type() == QEvent::KeyPress && pressesByKey());
    if (press && !lies(m_panel) && !lies(m_opener))
        m_pressed();
    return false;
}

} // namespace lumora
