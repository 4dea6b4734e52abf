// What the sending page asks before, during and behind a sending, so that no order is lost.
#include "common/DrivePath.h"
#include "order/OrderFolder.h"
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

void FtpFrm::watchLine() {
    m_sender.pass.watch();
}

void FtpFrm::keepArrival(SendingPhase end) {
    OrderJournal* journal = m_sender.session.journal();
    if (!journal || !hasArrived(end))
        return;
    m_sender.session.keep(journal->arrived(true));
    if (end == SendingPhase::AllThere)
        m_sender.session.keep(journal->needsNoReport());
}

void FtpFrm::tellLab() {
    OrderJournal* journal = m_sender.session.journal();
    if (m_state.profile.ReportOn <= 0) {
        if (journal)
            m_sender.session.keep(journal->needsNoReport());
        return;
    }
    if (!m_chain.isRegistered(PageId::InetForm))
        return;
    if (journal)
        m_sender.session.keep(journal->reportBegun());
    auto& reports = m_chain.load<InetForm>();
    reports.reportOrder();
    reports.reportDone();
    if (journal)
        m_sender.session.keep(journal->reportDone());
}

} // namespace lumora
