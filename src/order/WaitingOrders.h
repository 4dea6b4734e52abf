#pragma once

#include "order/UnfinishedOrders.h"

#include <QHash>

#include <chrono>
#include <optional>

namespace lumora {

struct Platform;

struct CountedOrder {
    UnfinishedOrder order;
    bool byItself = true; // is sent by itself; else the staff sends it
};

// The orders whose sending can go on, oldest first, but for one that the staff has given up. One that its customer has
// stopped, or that waits for an answer about pictures that were left out, is not sent by itself; it is counted on a
// kiosk once it has lapsed. None where another program runs in the data folder.
QList<CountedOrder> OrdersThatWait(const SessionState& state, const Platform& platform);

// Which of the orders that wait is sent next, and when. Each pauses by the count of its tries, which its state keeps;
// behind a start of the program each begins with a pause, so that an order that ends the program leaves it free.
class WaitingOrders {
public:
    WaitingOrders(const SessionState& state, const Platform& platform)
        : m_state(state)
        , m_platform(platform) {}

    // Reads the orders anew.
    void refresh();
    int count() const { return static_cast<int>(m_orders.size()); }
    // The oldest one whose pause is over.
    std::optional<UnfinishedOrder> due() const;
    // A sending of the order has ended by itself. What has not arrived pauses longer than before.
    void ended(const OrderFolder& folder, const BothLanguages& why);

private:
    using Moment = std::chrono::milliseconds; // of the running clock

    Moment afterPause(int tries) const;

    const SessionState& m_state;
    const Platform& m_platform;
    QList<CountedOrder> m_orders;
    QHash<QString, Moment> m_due; // by the name of the folder
};

} // namespace lumora
