#pragma once

#include "views/window/DoubledPress.h"

#include <QObject>
#include <QPointF>

class QWidget;

namespace lumora {

// Keeps doubled presses of mouse, finger, Enter and blank from every control of the window.
class PressFilter : public QObject {
    Q_OBJECT
public:
    explicit PressFilter(QWidget* window);

    DoubledPress rule;
    // The press of a mouse or a finger that is down does not count.
    bool refuses() const { return m_mouseTaken; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    bool counts(const QWidget& widget, QPointF at);

    QWidget* m_window;
    QPointF m_at;              // of the press before, on the screen
    bool m_mouseTaken = false; // a press that did not count, until it is let go
    bool m_keyTaken = false;
};

} // namespace lumora
