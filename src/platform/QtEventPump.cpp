#include "platform/QtEventPump.h"

#include <QCoreApplication>
#include <QEventLoop>

namespace lumora {

// The pauses of the transfer are counted in rounds of painting and pumping, some 25,000 for each file that is sent, and
// have no clock of their own: on the machines that they were counted for a round took its time. A round that really
// turned the event loop each time would make a file wait for seconds here. So the loop turns at most once in this time,
// reckoned from the end of the turn before, and a pump in between costs one look at the clock. It is below what an eye
// or a hand can tell.
constexpr qint64 betweenTurns = 8; // milliseconds

void QtEventPump::pump() {
    if (m_sinceLast.isValid() && m_sinceLast.elapsed() < betweenTurns)
        return;
    // A click that arrives during a pump is handled inside it. If that handler pumps too, further clicks wait until it
    // has returned: a handler is never entered from within itself.
    const auto flags = m_depth > 0 ? QEventLoop::ExcludeUserInputEvents : QEventLoop::AllEvents;
    ++m_depth;
    QCoreApplication::processEvents(flags);
    --m_depth;
    m_sinceLast.start();
}

} // namespace lumora
