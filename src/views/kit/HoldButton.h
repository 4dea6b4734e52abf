#pragma once

#include <QPushButton>

#include <functional>

namespace lumora {

// A button that works as long as it is held. The page's own timer does the work: down() starts it, up() ends it, also
// when the pointer or the keyboard leaves the button, or the button is hidden or disabled under it. tap() comes before
// up() when the button was released and not lost: the page then makes one step if its timer has not ticked yet, so that
// a tap is one step.
class HoldButton : public QPushButton {
    Q_OBJECT
public:
    struct Handlers {
        std::function<void()> down;
        std::function<void()> tap;
        std::function<void()> up;
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
