#pragma once

#include <QTimer>

#include <functional>

namespace lumora {

// A timer of a page. A running event loop ticks it; a test ticks by calling the page's handler.
class Ticker {
public:
    Ticker(int milliseconds, std::function<void()> tick);

    void start();
    void stop() { m_timer.stop(); }
    void tick() { m_tick(); } // leaves the running time as it is
    bool running() const { return m_timer.isActive(); }
    int interval() const { return m_timer.interval(); }
    void setInterval(int milliseconds) { m_timer.setInterval(milliseconds); }

private:
    std::function<void()> m_tick;
    QTimer m_timer;
};

} // namespace lumora
