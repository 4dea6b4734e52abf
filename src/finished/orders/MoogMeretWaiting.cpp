// The orders that are not sent yet, on the page of finished orders.
#include "finished/orders/MoogMeret.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

void MoogMeret::listWaiting() {
    m_waiting = m_state.mayOpenOperatorArea() ? OrdersThatWait(m_state, m_platform) : QList<CountedOrder>();
    List4Mamtinot.clear();
    for (const CountedOrder& waiting : std::as_const(m_waiting))
        List4Mamtinot.append(waitingRow(waiting));
    waitingPanel.visible = !List4Mamtinot.isEmpty();
    chooseWaiting(-1);
}

void MoogMeret::chooseWaiting(int index) {
    List4Mamtinot.setCurrentIndex(index);
    Command4Nase.enabled = Command4Vater.enabled = List4Mamtinot.currentIndex() >= 0;
    Q_EMIT changed();
}

const UnfinishedOrder* MoogMeret::chosenWaiting() const {
    const int index = List4Mamtinot.currentIndex();
    return mayAct() && index >= 0 ? &m_waiting[index].order : nullptr;
}

void MoogMeret::tryNow() {
    const UnfinishedOrder* order = chosenWaiting();
    if (!order)
        return;
    const Phase before = m_phase;
    enter(Phase::Leaving);
    if (!GoOnWithOrder(*order, m_state, m_platform.files, m_chain, PageId::MoogMeret))
        enter(before);
}

void MoogMeret::giveUp() {
    const UnfinishedOrder* chosen = chosenWaiting();
    if (!chosen)
        return;
    const UnfinishedOrder order = *chosen; // the page may be left while the question is open
    if (!asksToGiveUp(order.state.number) || !mayAct())
        return;
    if (const Result<void> kept = OrderJournal(m_platform.files, order.folder).givenUp(); !kept)
        tellNotGivenUp(kept.failure());
    refreshOrders();
}

QString MoogMeret::megabytesOf(const OrderFolder& folder) const {
    qint64 bytes = 0;
    for (const QString& name : m_platform.files.names(folder.path(), u"*"_s)) {
        if (const Result<qint64> size = m_platform.files.size(folder.filePath(name)))
            bytes += *size;
    }
    return QString::number(static_cast<double>(bytes) / 1e6, 'f', 1);
}

} // namespace lumora
