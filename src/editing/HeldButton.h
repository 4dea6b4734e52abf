#pragma once

namespace lumora {

class Ticker;

// The held button of a page. Its ticker runs until the button is let go.
class HeldButton {
public:
    // Ends the hold of the button that was held before.
    void press(Ticker& ticker);
    // A press that is let go before its first tick counts as one tick; one that is lost counts as none.
    enum class End { LetGo, Lost };
    // True if the button has ticked.
    bool end(End how);
    bool isHeld() const { return m_ticker != nullptr; }
    bool holds(const Ticker& ticker) const { return m_ticker == &ticker; }

    // False for a tick that was under way when the button was let go; a tick handler asks it first.
    bool ticks(const Ticker& ticker);

private:
    Ticker* m_ticker = nullptr;
    bool m_ticked = false;
};

} // namespace lumora
