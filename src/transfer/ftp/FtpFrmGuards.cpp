// What the sending page asks before, during and after a sending, so that no order is lost.
#include "common/DrivePath.h"
#include "common/FixedText.h"
#include "order/OrderChoices.h"
#include "order/OrderFolder.h"
#include "order/UnfinishedOrders.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "transfer/delivery/CompletenessGuard.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/report/InetForm.h"

namespace lumora {

bool FtpFrm::mayBeSent() {
    QStringList names;
    for (const QString& path : lists().List3.items())
        names += LeafName(path);
    return CompletenessGuard(m_state, m_platform).maySend(OrderFolder::chosen(m_state), names) && !m_sender.stop.left;
}

// Under the next number that neither this computer nor the server has. The state of the order still holds its basket,
// since nothing of it was sent.
void FtpFrm::prepareAgain() {
    const OrderState kept = m_sender.session.journal()->state();
    const OrderFolder before = m_sender.session.journal()->folder();
    const bool plain = printsAsTheyAre(kept.kind);
    const Outcome next = plain ? Outcome::PlainTakenUp : Outcome::EditedTakenUp;
    // Without its picture a print can't be made again, and the old order holds the only one.
    if (!m_chain.canFollow(id(), next) || GonePictures(m_state, m_platform.files, {before, kept}) > 0) {
        tellForeign();
        finish(SendingPhase::CallLab);
        return;
    }
    TakeChoices(kept.choices, m_state);
    const auto ending = plain ? OrderFolder::Ending::BySession : OrderFolder::Ending::Plain;
    OrderFolder free = before;
    do {
        m_state.MisparHazmana = QString::number(Val(m_state.MisparHazmana) + 1.0, 'f', 0);
        free = OrderFolder::inPreparation(m_state, ending);
    } while (m_platform.files.folderExists(free.path()) || lists().List5.contains(free.name()));
    m_state.handOver.lines = kept.items;
    m_state.handOver.pressStart = plain; // the page of edited orders starts by itself
    m_state.handOver.replaced = before.path();
    showNumberTaken(kept.number);
    if (!m_sender.stop.left)
        m_chain.follow(id(), next);
}

void FtpFrm::tellForeign() {
    failed(LineStep::ForeignFolder, {Failure::Kind::InUse, m_state.transfer.ShemTikiya}, {});
}

void FtpFrm::watchLine() {
    m_sender.pass.watch();
}

ReportCalls* FtpFrm::reportCalls() {
    return m_chain.isRegistered(PageId::InetForm) ? &m_chain.load<InetForm>() : nullptr;
}

} // namespace lumora
