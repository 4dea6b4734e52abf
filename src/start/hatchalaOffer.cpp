// The panel of the start page that offers an order which was not finished.
#include "order/WaitingOrders.h"
#include "platform/Dialogs.h"
#include "platform/Instances.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "start/hatchala.h"

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

// An order that seems unfinished may be under way in another program.
void hatchala::offerUnfinished() {
    if (m_platform.instances.another())
        return;
    TidyOrders(m_state, m_platform.files);
    if (!m_state.offerPutOff)
        readUnfinished();
    m_state.waitingOrders = static_cast<int>(OrdersThatWait(m_state, m_platform).size());
}

// What is sent by itself is no business of the next customer.
void hatchala::readUnfinished() {
    m_unfinished = UnfinishedOrders(m_state, m_platform.files);
    if (!m_state.Waiting)
        return;
    const QList<UnfinishedOrder> waiting = OrdersThatWait(m_state, m_platform);
    m_unfinished.removeIf([&](const UnfinishedOrder& order) {
        return order.state.givenUp || std::any_of(waiting.begin(), waiting.end(), [&](const UnfinishedOrder& other) {
                   return other.folder.path() == order.folder.path();
               });
    });
}

void hatchala::goOnWithOrder() {
    if (m_leaving || !Pic4Hemshech.visible)
        return;
    // Pictures may have gone or come back, with their card, since the panel opened.
    UnfinishedOrder& order = m_unfinished.first();
    order = UnfinishedOrderOf(m_state, m_platform.files, order.folder, order.state);
    if (order.gone > 0 && (!m_asksForGone || order.lacksAllPictures())) {
        m_asksForGone = true;
        showOffer();
        return;
    }
    if (GoOnWithOrder(order, m_state, m_platform.files, m_chain, PageId::hatchala)) {
        m_leaving = true;
        stopTimers();
    }
}

void hatchala::putOffOrder() {
    if (m_leaving || !Pic4Hemshech.visible)
        return;
    // Waiting for the pictures leads back to the offer.
    if (!std::exchange(m_asksForGone, false)) {
        m_state.offerPutOff = true;
        m_unfinished.clear();
    }
    showOffer();
}

void hatchala::throwOrderAway() {
    if (m_leaving || !Pic4Hemshech.visible)
        return;
    const UnfinishedOrder order = m_unfinished.first();
    if (!asksToThrowAway(order.state.number) || m_leaving)
        return;
    if (const Result<void> gone = ThrowAwayOrder(m_platform.files, order.folder); !gone)
        m_platform.dialogs.message(gone.failure().message);
    m_asksForGone = false;
    readUnfinished();
    showOffer();
}

} // namespace lumora
