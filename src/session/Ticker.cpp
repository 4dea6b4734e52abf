#include "session/Ticker.h"

namespace lumora {

Ticker::Ticker(int milliseconds, std::function<void()> tick)
    : m_tick(std::move(tick)) {
    m_timer.setInterval(milliseconds);
    QObject::connect(&m_timer, &QTimer::timeout, m_tick);
}

void Ticker::start() {
    if (!m_timer.isActive())
        m_timer.start();
}

} // namespace lumora
