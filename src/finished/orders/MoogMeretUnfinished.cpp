// Orders whose preparation did not come to its end, on the page of finished orders.
#include "finished/orders/MoogMeret.h"
#include "order/HistoryState.h"
#include "order/OrderNames.h"
#include "order/UnfinishedOrders.h"
#include "platform/Dialogs.h"
#include "platform/Instances.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"

namespace lumora {

// The page may be left while a question is open.
bool MoogMeret::mayBePicked(const OrderFolder& folder) {
    if (const std::optional<OrderFolder> again = ReplacementOf(m_state, m_platform.files, folder)) {
        tellReplaced(*again);
        return false;
    }
    const Completion completion = CompletionOf(m_platform.files, folder);
    if (completion == Completion::Finished)
        return true;
    if (completion == Completion::CanGoOn)
        offerToFinish(folder);
    else if (asksToSendWithoutDetails())
        return mayAct();
    else
        offerToThrowAway(folder);
    return false;
}

void MoogMeret::offerToFinish(const OrderFolder& folder) {
    // Another program may be preparing it just now.
    if (m_platform.instances.another())
        tellNotFinished();
    else if (asksToFinish())
        finishOrder(folder);
    else
        offerToThrowAway(folder);
}

void MoogMeret::finishOrder(const OrderFolder& folder) {
    const Result<OrderState> order = ReadOrderState(m_platform.files, folder);
    if (!mayAct() || !order)
        return;
    const UnfinishedOrder unfinished = UnfinishedOrderOf(m_state, m_platform.files, folder, *order);
    if (unfinished.lacksAllPictures()) {
        tellGone(unfinished);
        return;
    }
    if (unfinished.gone > 0 && (!asksToGoOnWithoutGone(unfinished) || !mayAct()))
        return;
    const Phase before = m_phase;
    enter(Phase::Leaving);
    if (!GoOnWithOrder(unfinished, m_state, m_platform.files, m_chain, PageId::MoogMeret))
        enter(before);
}

void MoogMeret::offerToThrowAway(const OrderFolder& folder) {
    const Result<OrderState> order = ReadOrderState(m_platform.files, folder);
    const QString number = order ? order->number : OrderNumberOf(folder.name());
    if (!mayAct() || !asksToThrowAway(number))
        return;
    if (const Result<void> gone = ThrowAwayOrder(m_platform.files, folder); !gone)
        m_platform.dialogs.message(gone.failure().message);
    refreshOrders();
}

} // namespace lumora
