#pragma once

#include "session/PageFlow.h"

#include <QString>

#include <functional>
#include <optional>

namespace lumora {

class OrderJournal;
struct Platform;
struct SessionState;

// An order whose folder on the server is another order's is prepared again under the next number that neither this
// computer nor the server has. Nothing of it was sent, so that its state still holds basket and choices.
class PreparedAgain {
public:
    PreparedAgain(SessionState& state, const Platform& platform, const OrderJournal& order)
        : m_state(state)
        , m_platform(platform)
        , m_order(order) {}

    // To the page that prepares orders of this kind.
    Outcome way() const;
    // False where the order was prepared again before, or three others in a row were, and where the basket is gone, or
    // a picture of it: without its picture a print can't be made again, and the old order holds the only one.
    bool isPossible() const;

    // Whether the server has a folder of this name; no value where it does not tell.
    using IsTaken = std::function<std::optional<bool>(const QString& name)>;
    // Gives the session the number, basket and choices. False where the server does not tell of a free number; the
    // session is unchanged then.
    bool handOver(const IsTaken& isTaken);

private:
    SessionState& m_state;
    const Platform& m_platform;
    const OrderJournal& m_order;
};

} // namespace lumora
