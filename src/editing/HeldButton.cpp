#include "editing/HeldButton.h"

#include "session/Ticker.h"

namespace lumora {

void HeldButton::press(Ticker& ticker) {
    release();
    m_ticker = &ticker;
    m_ticked = false;
    ticker.start();
}

void HeldButton::release() {
    if (m_ticker != nullptr)
        m_ticker->stop();
    m_ticker = nullptr;
}

bool HeldButton::ticks(const Ticker& ticker) {
    if (!holds(ticker))
        return false;
    m_ticked = true;
    return true;
}

void HeldButton::tickOnceIfNone() {
    if (m_ticker != nullptr && !m_ticked)
        m_ticker->tick();
}

} // namespace lumora
