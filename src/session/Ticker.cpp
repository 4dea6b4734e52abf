#include "session/Ticker.h"

namespace lumora {

Ticker::Ticker(int milliseconds, std::function<void()> tick) {
    m_timer.setInterval(milliseconds);
    QObject::connect(&m_timer, &QTimer::timeout, std::move(tick));
}

void Ticker::start() {
    if (!m_timer.isActive())
        m_timer.start();
}

} // namespace lumora
