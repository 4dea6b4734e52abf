#pragma once

#include <QPushButton>

#include <functional>

namespace lumora {

// A button that works as long as it is held. The page's own timer does the work: down() starts it, up() ends it when
// the button is released, and lost() when the keyboard leaves it, or it is hidden or disabled under the pointer.
class HoldButton : public QPushButton {
    Q_OBJECT
public:
    struct Handlers {
        std::function<void()> down;
        std::function<void()> up;
        std::function<void()> lost;
    };
    // Without handlers it is a plain button.
    HoldButton(Handlers handlers, QWidget* parent);

    bool isHeld() const { return m_held; }

protected:
    void changeEvent(QEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    enum class End { LetGo, Lost };
    void end(End how);

    Handlers m_handlers;
    bool m_held = false;
};

} // namespace lumora
