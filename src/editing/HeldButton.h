#pragma once

namespace lumora {

class Ticker;

// The button of a page on which a finger rests: its ticker runs until it is let go, and a press that ends before the
// first tick counts as one.
class HeldButton {
public:
    // Another button that was held is let go.
    void press(Ticker& ticker);
    void release();
    bool isHeld() const { return m_ticker != nullptr; }
    bool holds(const Ticker& ticker) const { return m_ticker == &ticker; }

    // What the handler of a tick asks first. No: the tick was under way when the button was let go.
    bool ticks(const Ticker& ticker);
    void tickOnceIfNone();

private:
    Ticker* m_ticker = nullptr;
    bool m_ticked = false;
};

} // namespace lumora
