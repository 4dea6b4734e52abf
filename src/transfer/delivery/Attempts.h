#pragma once

#include "transfer/delivery/SendingEvents.h"
#include "transfer/delivery/SendingPhase.h"

#include <optional>

namespace lumora {

class EventPump;

// What the customer asks for during a sending. The rules read it between their steps.
struct SendingStop {
    // The customer has left the page or the program: every loop ends at its next step, and nothing more is sent.
    bool left = false;
    // The customer has pressed stop, or the line was silent for too long. It is read before and during each file,
    // between two tries to connect, in each pause, and after a check; it is reset where a file begins.
    bool StopFlag = false;
};

// The only pause of the senders: rounds of telling and pumping, without a clock.
void pauseInRounds(int rounds, SendingEvents& events, EventPump& pump, const SendingStop& stop);

// Up to a number of attempts at one order; each sends the missing files and then checks which have arrived.
class Attempts {
public:
    // The end of the sending; no value when the customer has left.
    std::optional<SendingPhase> run(int attempts, SendingMoment beginning = SendingMoment::AttemptBegins);

protected:
    Attempts(SendingEvents& events, SendingStop& stop)
        : m_events(events)
        , m_stop(stop) {}
    ~Attempts() = default;

    // A value ends the sending without a check: the customer stopped it, or another attempt would end the same.
    virtual std::optional<SendingPhase> sendMissing(int attempt) = 0;
    // The end of the sending, or no value when another attempt is needed.
    virtual std::optional<SendingPhase> checkArrival(int attempt) = 0;
    virtual SendingPhase afterTheLast() = 0;

    SendingEvents& m_events;
    SendingStop& m_stop;
};

} // namespace lumora
