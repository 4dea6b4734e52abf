#pragma once

#include <QtGlobal>

#include <functional>

namespace lumora {

// Tells a press that was meant for what stood there before. Behind another page, or a panel that came or went, none
// counts until the hand was up for a pause; one that comes sooner begins the pause anew.
class DoubledPress {
public:
    using Clock = std::function<qint64()>; // milliseconds, only forward
    static constexpr qint64 pause = 400;   // milliseconds

    explicit DoubledPress(Clock clock)
        : m_clock(std::move(clock)) {}
    void setClock(Clock clock) { m_clock = std::move(clock); }

    // Another page or panel is in front, and when a person can see it: the pause begins there.
    void changed();
    void painted();

    // Whether the press counts. One may be told twice, as those of a finger are.
    bool pressed();
    void released();
    // What has changed was seen, since a press there was meant.
    void seen() { m_waits = false; }

    // Turns the clock on by a pause with the hand up: so a program that presses in place of a person goes through the
    // same rule, as one who looks before each press, and need not wait.
    void rest();

private:
    qint64 now() const { return m_clock() + m_ahead; }

    Clock m_clock;
    qint64 m_ahead = 0;
    qint64 m_since = 0; // the pause runs from here
    bool m_waits = false;
    bool m_painted = true;
    bool m_down = false;
};

} // namespace lumora
