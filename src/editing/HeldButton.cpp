#include "editing/HeldButton.h"

#include "session/Ticker.h"

#include <utility>

namespace lumora {

void HeldButton::press(Ticker& ticker) {
    end(End::Lost);
    m_ticker = &ticker;
    m_ticked = false;
    ticker.start();
}

bool HeldButton::end(End how) {
    if (m_ticker != nullptr && !m_ticked && how == End::LetGo)
        m_ticker->tick();
    if (m_ticker != nullptr)
        m_ticker->stop();
    m_ticker = nullptr;
    return std::exchange(m_ticked, false);
}

bool HeldButton::ticks(const Ticker& ticker) {
    if (!holds(ticker))
        return false;
    m_ticked = true;
    return true;
}

} // namespace lumora
