#pragma once

#include <algorithm>

namespace lumora {

// The seconds until a sending begins by itself.
class Countdown {
public:
    // full: seconds at the start. over: the count has ended when fewer seconds than this are left.
    Countdown(int full, int over)
        : m_full(full)
        , m_over(over)
        , m_seconds(full) {}

    int seconds() const { return m_seconds; }
    double share() const { return static_cast<double>(m_seconds) / m_full; } // part of the full count, 0 to 1

    void restart() { m_seconds = m_full; }
    void set(int seconds) { m_seconds = seconds; }
    // Counts one second. True when the count has ended.
    bool tick() {
        const int left = m_seconds - 1;
        m_seconds = std::max(left, 0);
        return left < m_over;
    }

private:
    int m_full;
    int m_over;
    int m_seconds;
};

} // namespace lumora
