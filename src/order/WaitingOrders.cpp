#include "order/WaitingOrders.h"

#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "platform/Instances.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/SessionState.h"

#include <algorithm>
#include <array>

namespace lumora {

namespace {

using std::chrono::minutes;

constexpr std::array pauses = {minutes(1), minutes(2), minutes(5), minutes(15), minutes(60)};

bool waitsForAnswer(const SessionState& state, const Files& files, const UnfinishedOrder& order) {
    if (!state.Careful || order.state.phase != OrderState::Phase::Prepared)
        return false;
    const std::optional<OrderLog> log = ReadOrderLog(files, order.folder);
    return log && !log->failed.isEmpty();
}

} // namespace

QList<UnfinishedOrder> OrdersThatWait(const SessionState& state, const Platform& platform) {
    if (!state.Waiting || platform.instances.another())
        return {};
    QList<UnfinishedOrder> orders = UnfinishedOrders(state, platform.files);
    orders.removeIf([&](const UnfinishedOrder& order) {
        return order.state.phase == OrderState::Phase::Preparing || order.state.givenUp ||
               waitsForAnswer(state, platform.files, order) ||
               !ReadOrderState(platform.files, order.folder); // a person decides about a state that is only guessed
    });
    std::reverse(orders.begin(), orders.end());
    return orders;
}

void WaitingOrders::refresh() {
    m_orders = OrdersThatWait(m_state, m_platform);
    for (const UnfinishedOrder& order : m_orders) {
        if (!m_due.contains(order.folder.name()))
            m_due[order.folder.name()] = afterPause(order.state.tries);
    }
}

std::optional<UnfinishedOrder> WaitingOrders::due() const {
    const Moment now = m_platform.clock.running();
    for (const UnfinishedOrder& order : m_orders) {
        if (m_due.value(order.folder.name()) <= now)
            return order;
    }
    return std::nullopt;
}

void WaitingOrders::ended(const OrderFolder& folder, const BothLanguages& why) {
    OrderJournal order(m_platform.files, folder);
    // Unwritten it counts for this run: the pause grows by what the journal holds.
    if (order.known() && !order.state().hasArrived())
        static_cast<void>(order.tried(why));
    m_due[folder.name()] = afterPause(order.state().tries);
    refresh();
}

WaitingOrders::Moment WaitingOrders::afterPause(int tries) const {
    const auto at = std::clamp<std::size_t>(static_cast<std::size_t>(std::max(tries, 0)), 0, pauses.size() - 1);
    return m_platform.clock.running() + pauses[at];
}

} // namespace lumora
