#include "views/kit/HoldButton.h"

#include <QEvent>

namespace lumora {

HoldButton::HoldButton(Handlers handlers, QWidget* parent)
    : QPushButton(parent)
    , m_handlers(std::move(handlers)) {
    setFocusPolicy(Qt::TabFocus);
    setAutoRepeat(false); // the page's timer gives the pace
    if (!m_handlers.down)
        return;
    connect(this, &QPushButton::pressed, this, [this] {
        m_held = true;
        m_handlers.down();
    });
    connect(this, &QPushButton::released, this, [this] { end(End::LetGo); });
}

void HoldButton::end(End how) {
    if (!std::exchange(m_held, false))
        return;
    how == End::LetGo ? m_handlers.up() : m_handlers.lost();
}

void HoldButton::changeEvent(QEvent* event) {
    if (event->type() == QEvent::EnabledChange && !isEnabled())
        end(End::Lost);
    QPushButton::changeEvent(event);
}

// A button that is disabled or hidden loses the keyboard first.
void HoldButton::focusOutEvent(QFocusEvent* event) {
    end(End::Lost);
    QPushButton::focusOutEvent(event);
}

void HoldButton::hideEvent(QHideEvent* event) {
    end(End::Lost);
    QPushButton::hideEvent(event);
}

} // namespace lumora
