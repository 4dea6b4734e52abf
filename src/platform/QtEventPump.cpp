#include "platform/QtEventPump.h"

#include <QCoreApplication>
#include <QEventLoop>

namespace lumora {

// The pauses of the transfer count rounds of painting and pumping, some 25,000 for each file sent, and have no clock.
// If every round ran the event loop, a file would wait for seconds. So the loop runs at most once in this time, counted
// from the end of its last run; the other rounds only read the clock. A person does not notice so short a delay.
constexpr qint64 betweenTurns = 8; // milliseconds

void QtEventPump::pump() {
    if (m_sinceLast.isValid() && m_sinceLast.elapsed() < betweenTurns)
        return;
    // A click during a pump is handled inside it. If its handler pumps too, further clicks wait until it returns, so
    // that no handler is entered from within itself.
    const auto flags = m_depth > 0 ? QEventLoop::ExcludeUserInputEvents : QEventLoop::AllEvents;
    ++m_depth;
    QCoreApplication::processEvents(flags);
    --m_depth;
    m_sinceLast.start();
}

} // namespace lumora
