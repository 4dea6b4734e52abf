// Events and routines of the page that no control calls: the resend from the page's own file list, a chain of orders,
// and the question after a fatal error.
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "transfer/ftp/FtpFrm.h"

namespace lumora {

using namespace Qt::StringLiterals;

void FtpFrm::Command27_Click() {
    const auto made = m_platform.files.makeFolder(m_state.DiskRoot / u"!!AVROO");
    if (!made)
        m_platform.dialogs.message(made.failure().message);
    m_sender.lists.List4Tikiyot.setCurrentIndex(0);
    Q_EMIT changed();
}

void FtpFrm::takeChain(const QStringList& folderNames) {
    m_sender.lists.ListRezefFiles.clear();
    m_sender.lists.ListRezefFiles.append(folderNames);
    showLabButtons();
}

void FtpFrm::PrepareResendHere(const DrivePath& folder) {
    m_state.transfer.OrderFolder = folder;
    clearLists();
    TextList& list = m_sender.lists.List3;
    list.append(filesForResend(folder));
    if (list.isEmpty()) {
        m_platform.dialogs.message(wording(u"לא בחרת קבצים למשלוח מתוך החלון הצהב\rקרא הנחיות שלב שני",
                                           u"You chose no files to send from the yellow window.\r"
                                           u"Read the instructions of step two."));
        return;
    }
    m_state.transfer.SugMishloah = Sending::Chain;
    armCountdown();
}

void FtpFrm::FtpFatalErrorAsk(const Failure& failure, const QString& source) {
    FtpSession& session = m_sender.session;
    session.takeResponse(failure);
    const QString text = source + u" Err: "_s + QString::number(LineErrorNumber(failure.kind)) + u" Extd Err: "_s +
                         session.LastResponse + u"\r\nClose Connection and Session?"_s;
    if (m_platform.dialogs.ask(text))
        session.closeSession();
}

} // namespace lumora
