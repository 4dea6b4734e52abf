// Orders whose preparation did not come to its end, on the page of finished orders.
#include "finished/orders/MoogMeret.h"
#include "order/HistoryState.h"
#include "order/OrderNames.h"
#include "order/UnfinishedOrders.h"
#include "platform/Dialogs.h"
#include "platform/Instances.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

// Whoever is asked may leave the page meanwhile.
bool MoogMeret::mayBePicked(const OrderFolder& folder) {
    const Completion completion = CompletionOf(m_platform.files, folder);
    if (completion == Completion::Finished)
        return true;
    if (completion == Completion::CanGoOn)
        offerToFinish(folder);
    else if (asks(u"להזמנה זו חסרים הפרטים. לשלוח את מה שיש?",
                  u"The details of this order are missing. Send what is there?"))
        return mayAct();
    else
        offerToThrowAway(folder);
    return false;
}

void MoogMeret::offerToFinish(const OrderFolder& folder) {
    // Another program may be preparing it just now.
    if (m_platform.instances.another())
        m_platform.dialogs.message(m_state.wording(u"הזמנה זו לא הושלמה.", u"This order was not finished."));
    else if (asks(u"הזמנה זו לא הושלמה. להשלים אותה עכשיו?", u"This order was not finished. Finish it now?"))
        finishOrder(folder);
    else
        offerToThrowAway(folder);
}

void MoogMeret::finishOrder(const OrderFolder& folder) {
    const Result<OrderState> order = ReadOrderState(m_platform.files, folder);
    if (!mayAct() || !order)
        return;
    const UnfinishedOrder unfinished = UnfinishedOrderOf(m_state, m_platform.files, folder, *order);
    if (unfinished.gone > 0 && unfinished.gone == unfinished.pictures) {
        m_platform.dialogs.message(
            m_state.wording(u"%1 מתוך %2 התמונות אינן עוד במקומן.", u"%1 of %2 pictures are no longer where they were.")
                .arg(unfinished.gone)
                .arg(unfinished.pictures));
        return;
    }
    if (unfinished.gone > 0 && (!asks(u"%1 מתוך %2 התמונות אינן עוד במקומן. להמשיך בלעדיהן?",
                                      u"%1 of %2 pictures are no longer where they were. Go on without them?",
                                      {QString::number(unfinished.gone), QString::number(unfinished.pictures)}) ||
                                !mayAct()))
        return;
    const SessionState before = m_state;
    const Outcome way = takeUpOrder(unfinished, m_state, m_platform.files);
    if (!m_chain.canFollow(PageId::MoogMeret, way)) {
        m_state = before;
        return;
    }
    enter(Phase::Leaving);
    m_chain.follow(PageId::MoogMeret, way);
}

void MoogMeret::offerToThrowAway(const OrderFolder& folder) {
    const Result<OrderState> order = ReadOrderState(m_platform.files, folder);
    const QString number = order ? order->number : OrderNumberOf(folder.name());
    if (!mayAct() || !asks(u"לזרוק את הזמנה מספר %1? לא ניתן להחזיר אותה.",
                           u"Throw order number %1 away? It can't be brought back.", {number}))
        return;
    if (const Result<void> gone = throwAwayOrder(m_platform.files, folder); !gone)
        m_platform.dialogs.message(gone.failure().message);
    refreshOrders();
}

} // namespace lumora
