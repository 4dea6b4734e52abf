#pragma once

namespace lumora {

class Ticker;

// The held button of a page. Its ticker runs until the button is let go; a press that ends before the first tick counts
// as one tick.
class HeldButton {
public:
    // Another button that was held is let go.
    void press(Ticker& ticker);
    void release();
    bool isHeld() const { return m_ticker != nullptr; }
    bool holds(const Ticker& ticker) const { return m_ticker == &ticker; }

    // A tick handler asks this first: false for a tick that was under way when the button was let go.
    bool ticks(const Ticker& ticker);
    void tickOnceIfNone();

private:
    Ticker* m_ticker = nullptr;
    bool m_ticked = false;
};

} // namespace lumora
