// What the sending page asks before, during and after a sending, so that no order is lost.
#include "order/OrderJournal.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/report/InetForm.h"

namespace lumora {

bool FtpFrm::mayBeSent() {
    return SendingPage::mayBeSent(lists().List3.items()) && !m_sender.stop.left;
}

void FtpFrm::prepareAgain() {
    const auto isTaken = [this](const QString& name) { return lists().List5.contains(name); };
    if (SendingPage::prepareAgain(*m_sender.session.journal(), isTaken))
        return;
    tellForeign();
    finish(SendingPhase::CallLab);
}

void FtpFrm::tellForeign() {
    failed(LineStep::ForeignFolder, {Failure::Kind::InUse, m_state.transfer.ShemTikiya}, {});
}

void FtpFrm::watchLine() {
    m_sender.watch();
}

ReportCalls* FtpFrm::reportCalls() {
    return m_chain.isRegistered(PageId::InetForm) ? &m_chain.load<InetForm>() : nullptr;
}

} // namespace lumora
