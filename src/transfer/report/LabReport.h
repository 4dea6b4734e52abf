#pragma once

#include "common/Result.h"
#include "order/ArrivalProof.h"
#include "session/SessionState.h"
#include "transfer/delivery/SendingPhase.h"

#include <functional>
#include <optional>

namespace lumora {

class OrderJournal;
class ReportCalls;
class ReportOnce;
struct OrderState;
struct Platform;
struct SendingStop;

// What follows an arrival, for both senders: it is kept in the order's state, then the lab is told of it. A telling
// ends at the latest after two minutes, and within a second where it is stopped; it then counts as begun.
class LabReport {
public:
    // keep: is given the result of writing each step to the order's state.
    using Keep = std::function<void(const Result<void>&)>;
    LabReport(const SessionState& state, const Platform& platform, SendingStop& stop, Sender by, Keep keep);

    // order: the state of the order that is sent from now on, none where there is none to tell of.
    void beginOrder(OrderJournal* order) { m_order = order; }

    // Keeps what has arrived at the end of a sending; nothing at an end that is no arrival.
    void keepArrival(Arrival arrival, SendingPhase end, bool byNameOnly);
    // The order has arrived and ends untold.
    void endUntold();
    // For an order that lay whole on the server before anything was sent, after keepArrival(): true where the lab has
    // yet to be told of it.
    bool isDueWhereFound() const;
    // The order has arrived with the fewer pictures that the customer has agreed to; due: the lab has yet to be told.
    bool isAsAgreed() const;
    bool isDueAsAgreed() const;
    // The end of a sending that only tells the lab.
    SendingPhase endWhereLeft() const;

    void tell(ReportCalls& calls);
    // For an operator, whatever was told before.
    void tellAgain(ReportCalls& calls);
    // Each second of a telling: cuts one that takes too long.
    void watch();

    // The order has arrived, or a telling was begun.
    bool mayTellAgain() const;
    // The lab was told to the end.
    bool wasTold() const;
    // The order has arrived, and the lab wants no report of it.
    bool isUnwanted() const;
    // A telling was begun, and it is not known whether the lab has heard it.
    bool isEndUnknown() const;
    // The order has arrived, and the server told no lengths to prove it by. As built in none are asked for.
    bool provenByNameOnly() const;

private:
    void run(const std::function<void(ReportOnce&)>& telling);

    const SessionState& m_state;
    const Platform& m_platform;
    SendingStop& m_stop;
    Sender m_by;
    Keep m_keep;
    OrderJournal* m_order = nullptr;
    std::optional<int> m_seconds; // of the telling that is under way
};

} // namespace lumora
