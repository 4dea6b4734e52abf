#include "views/window/DoubledPress.h"

#include <utility>

namespace lumora {

void DoubledPress::changed() {
    m_waits = true;
    m_painted = false;
    m_since = now();
}

// Work of the change itself may take longer than the pause.
void DoubledPress::painted() {
    if (!std::exchange(m_painted, true))
        m_since = now();
}

bool DoubledPress::pressed() {
    if (!std::exchange(m_down, true) && m_painted && now() - m_since >= pause)
        m_waits = false;
    if (m_waits)
        painted(); // what can be pressed is on the screen
    return !m_waits;
}

void DoubledPress::released() {
    m_down = false;
    m_since = now();
}

void DoubledPress::rest() {
    released();
    m_painted = true;
    m_ahead += pause;
}

} // namespace lumora
