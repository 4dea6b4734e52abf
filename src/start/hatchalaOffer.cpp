// The panel of the start page that offers an order which was not finished.
#include "common/StationLog.h"
#include "common/Warning.h"
#include "order/CustomerTraces.h"
#include "order/KioskOffer.h"
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

namespace {

constexpr int mostWrongDigits = 3; // then the panel closes

void warnOf(const Result<void>& done, const QString& what) {
    if (!done)
        writeWarning(what.arg(done.failure().message));
}

} // namespace

// The customer before has gone.
void hatchala::endCustomer() {
    warnOf(CustomerTraces(m_state, m_platform).clear(), u"what a customer has left can't be cleared: %1"_s);
    if (anotherRuns())
        return;
    loadProfile(); // tells which orders can go on
    warnOf(ThrowLapsedAway(UnfinishedOrders(m_state, m_platform.files), m_platform.files),
           u"an order that nobody takes up can't be thrown away: %1"_s);
}

void hatchala::leftAlone() {
    if (m_state.closedToCustomers())
        warnOf(LetLapse(m_unfinished, m_platform.files), u"it can't be kept that nobody takes an order up: %1"_s);
}

bool hatchala::anotherRuns() const {
    return m_platform.instances.another();
}

// An order that seems unfinished may be under way in another program.
void hatchala::offerUnfinished() {
    if (anotherRuns())
        return;
    TidyOrders(m_state, m_platform.files);
    readUnfinished();
    writeLog(u"orders: %1 wait, %2 are offered"_s.arg(m_state.waitingOrders).arg(m_unfinished.size()));
}

// What is sent by itself is no business of the next customer.
void hatchala::readUnfinished() {
    const QList<CountedOrder> waiting = OrdersThatWait(m_state, m_platform);
    m_state.waitingOrders = static_cast<int>(waiting.size());
    if (m_state.offerPutOff)
        return;
    m_unfinished = UnfinishedOrders(m_state, m_platform.files);
    if (m_state.closedToCustomers())
        m_unfinished = OfferedOnKiosk(m_unfinished, m_platform.files);
    if (!m_state.Waiting)
        return;
    m_unfinished.removeIf([&](const UnfinishedOrder& order) {
        return order.state.givenUp || std::any_of(waiting.begin(), waiting.end(), [&](const CountedOrder& other) {
                   return other.byItself && other.order.folder.path() == order.folder.path();
               });
    });
}

// The staff sees what no customer is offered any more, too.
void hatchala::offerToStaff() {
    if (m_leaving || std::exchange(m_ofStaff, m_state.staff) || !m_ofStaff)
        return;
    m_state.offerPutOff = false;
    offerUnfinished();
}

bool hatchala::asksForDigits() const {
    return m_state.closedToCustomers() && !m_recognised;
}

void hatchala::typeDigit(int digit) {
    if (m_leaving || !Pic4Hemshech.visible || !asksForDigits())
        return;
    m_digits += QString::number(digit);
    if (m_digits.size() == telephoneEnd) {
        const QString digits = std::exchange(m_digits, {});
        const auto isIt = [&](const UnfinishedOrder& order) { return IsEndOfTelephone(order.state, digits); };
        const auto order = std::find_if(m_unfinished.begin(), m_unfinished.end(), isIt);
        m_recognised = order != m_unfinished.end();
        if (m_recognised)
            m_unfinished = {UnfinishedOrder(*order)};
        else if (++m_wrongDigits == mostWrongDigits)
            return putOffOrder();
    }
    showOffer();
}

void hatchala::takeDigitBack() {
    m_digits.chop(1);
    showOffer();
}

void hatchala::goOnWithOrder() {
    if (m_leaving || !Pic4Hemshech.visible || asksForDigits())
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
    if (m_leaving || !Pic4Hemshech.visible || asksForDigits())
        return;
    const UnfinishedOrder order = m_unfinished.first();
    if (!asksToThrowAway(order.state.number) || m_leaving)
        return;
    if (const Result<void> gone = ThrowAwayOrder(m_platform.files, order.folder); !gone)
        m_platform.dialogs.message(gone.failure().message);
    m_asksForGone = false;
    m_recognised = false;
    readUnfinished();
    showOffer();
}

} // namespace lumora
