#pragma once

#include "transfer/delivery/SendingEvents.h"
#include "transfer/delivery/SendingPhase.h"

#include <optional>

namespace lumora {

class EventPump;

// What the customer asks for while a sending runs. The rules look at it between their steps.
struct SendingStop {
    // The customer has left the page or the program: every loop ends at its next step and nothing more is sent.
    bool left = false;
    // The customer has asked to stop. Read at the head of each file and within it, between two tries to reach the
    // server, and behind a check; reset where a file begins.
    bool StopFlag = false;
};

// The only pause of the senders: rounds of telling and pumping, no clock.
void pauseInRounds(int rounds, SendingEvents& events, EventPump& pump, const SendingStop& stop);

// Up to so many attempts at one order, each a pass over what is missing and a check of what has arrived.
class Attempts {
public:
    // What the sending has come to; no value when the customer has left.
    std::optional<SendingPhase> run(int attempts, SendingMoment beginning = SendingMoment::AttemptBegins);

protected:
    Attempts(SendingEvents& events, SendingStop& stop)
        : m_events(events)
        , m_stop(stop) {}
    ~Attempts() = default;

    // False if the customer has stopped it.
    virtual bool sendMissing(int attempt) = 0;
    // The end, or no value when another attempt is due.
    virtual std::optional<SendingPhase> checkArrival(int attempt) = 0;
    virtual SendingPhase afterTheLast() = 0;

    SendingEvents& m_events;
    SendingStop& m_stop;
};

} // namespace lumora
