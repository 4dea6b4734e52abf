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

// A person has the word: the customer has stopped it, or pictures were left out of it.
bool waitsForAnswer(const SessionState& state, const Files& files, const UnfinishedOrder& order) {
    if (order.state.phase != OrderState::Phase::Prepared)
        return false;
    if (order.state.held || !state.Careful)
        return order.state.held;
    const std::optional<OrderLog> log = ReadOrderLog(files, order.folder);
    return log && !log->failed.isEmpty();
}

} // namespace

QList<CountedOrder> OrdersThatWait(const SessionState& state, const Platform& platform) {
    QList<CountedOrder> waiting;
    if ((!state.Waiting && !state.kiosk.on) || platform.instances.another())
        return waiting;
    for (const UnfinishedOrder& order : UnfinishedOrders(state, platform.files)) {
        // A person decides about a state that is only guessed.
        if (order.state.phase == OrderState::Phase::Preparing || order.state.givenUp ||
            !ReadOrderState(platform.files, order.folder))
            continue;
        const bool byItself = state.Waiting && !waitsForAnswer(state, platform.files, order);
        if (byItself || (state.kiosk.on && order.state.lapsed))
            waiting.prepend({order, byItself});
    }
    return waiting;
}

void WaitingOrders::refresh() {
    m_orders = OrdersThatWait(m_state, m_platform);
    QHash<QString, Moment> due;
    for (const CountedOrder& waiting : m_orders) {
        const OrderFolder& folder = waiting.order.folder;
        due[folder.name()] =
            m_due.contains(folder.name()) ? m_due[folder.name()] : afterPause(waiting.order.state.tries);
    }
    m_due = due;
}

std::optional<UnfinishedOrder> WaitingOrders::due() const {
    const Moment now = m_platform.clock.running();
    for (const CountedOrder& waiting : m_orders) {
        if (waiting.byItself && m_due.value(waiting.order.folder.name()) <= now)
            return waiting.order;
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
