#include "transfer/delivery/Attempts.h"

#include "common/StationLog.h"
#include "platform/Machine.h"

namespace lumora {

using namespace Qt::StringLiterals;

void pauseInRounds(int rounds, SendingEvents& events, EventPump& pump, const SendingStop& stop) {
    for (int round = 1; round <= rounds && !stop.left && !stop.StopFlag; ++round) {
        events.pausing(round);
        pump.pump();
    }
}

std::optional<SendingPhase> Attempts::run(int attempts, SendingMoment beginning) {
    for (int attempt = 1; attempt <= attempts; ++attempt) {
        writeLog(u"sending: attempt %1"_s.arg(attempt));
        m_events.reached(beginning, attempt);
        const std::optional<SendingPhase> ended = sendMissing(attempt);
        if (m_stop.left)
            return std::nullopt;
        if (ended)
            return ended;
        m_events.reached(SendingMoment::CheckBegins);
        const std::optional<SendingPhase> end = checkArrival(attempt);
        if (m_stop.left)
            return std::nullopt;
        if (end)
            return end;
    }
    return afterTheLast();
}

} // namespace lumora
