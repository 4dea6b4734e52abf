// What the sending page asks before, during and behind a sending, so that no order is lost.
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/report/InetForm.h"

namespace lumora {

void FtpFrm::tellLab() {
    if (m_state.profile.ReportOn <= 0 || !m_chain.isRegistered(PageId::InetForm))
        return;
    auto& reports = m_chain.load<InetForm>();
    reports.reportOrder();
    reports.reportDone();
}

} // namespace lumora
