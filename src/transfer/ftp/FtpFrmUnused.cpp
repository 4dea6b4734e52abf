// Events and routines of the page that no control calls: the lab's manual panel, the resend from the page's own file
// list, and the question after a fatal error. The lab's own tests use them.
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/PieceName.h"
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

bool FtpFrm::inSession(const QString& message) {
    if (!isUnderWay(phase()) && m_sender.session.bActiveSession)
        return true;
    m_platform.dialogs.message(message);
    return false;
}

QString FtpFrm::chosenRemoteName() {
    if (!inSession(u"Not in session"_s))
        return {};
    const QString chosen = lists().List2.currentItem();
    if (chosen.isEmpty())
        m_platform.dialogs.message(u"Please select the item to GET!"_s);
    return chosen.mid(chosen.lastIndexOf(u'/') + 1);
}

void FtpFrm::Command3_Click() {
    if (!inSession(u"Not in session"_s))
        return;
    if (File1.name(File1Index).isEmpty()) {
        m_platform.dialogs.message(u"Please select a local file to put"_s);
        return;
    }
    m_sender.session.putHere(File1.folder() / File1.name(File1Index));
    Q_EMIT changed();
}

void FtpFrm::Command5_Click() {
    const QString name = chosenRemoteName();
    if (!name.isEmpty())
        m_sender.session.getHere(name, File1.folder());
    Q_EMIT changed();
}

void FtpFrm::Command6_Click() {
    const QString name = chosenRemoteName();
    if (!name.isEmpty())
        m_sender.session.removeHere(name);
    Q_EMIT changed();
}

void FtpFrm::Command7_Click() {
    if (inSession(u"Not in session"_s))
        m_sender.session.makeGoop();
    Q_EMIT changed();
}

void FtpFrm::cmdInternetOpen_Click() {
    if (isUnderWay(phase()))
        return;
    m_sender.session.FtpOpenInternet();
    m_sender.session.FtpConnectServer();
    Q_EMIT changed();
}

void FtpFrm::cmdClosehOpen_Click() {
    if (isUnderWay(phase()))
        return;
    m_sender.session.closeSession();
    Q_EMIT changed();
}

// Both buttons set the same transfer type: the lab's server takes all files, pictures too, as ASCII and keeps their
// bytes.
void FtpFrm::chooseType(bool binary) {
    m_sender.session.dwType = 1;
    optBin.checked = binary;
    optAscii.checked = !binary;
    Q_EMIT changed();
}

void FtpFrm::chkPassive_Click(bool checked) {
    m_sender.session.passive = chkPassive.checked = checked;
    Q_EMIT changed();
}

void FtpFrm::File1_Click(int index) {
    File1Index = index;
    Q_EMIT changed();
}

void FtpFrm::List2_Click(int index) {
    m_sender.lists.List2.setCurrentIndex(index);
    Q_EMIT changed();
}

void FtpFrm::ListRezefFiles_Click(int index) {
    m_sender.lists.ListRezefFiles.setCurrentIndex(index);
    Q_EMIT changed();
}

void FtpFrm::takeChain(const QStringList& folderNames) {
    m_sender.lists.ListRezefFiles.clear();
    m_sender.lists.ListRezefFiles.append(folderNames);
}

void FtpFrm::PrepareResendHere(const DrivePath& folder) {
    const bool pieces = TravelsInPieces(folder.text());
    File1.setPattern(pieces ? u"*.jpp;*.prk;*.txt"_s : u"*.jpp;*.txt"_s);
    if (pieces) {
        m_state.transfer.Mefurak = Travel::Pieces;
        m_state.transfer.HazmanaP = 1;
    }
    m_state.transfer.OrderFolder = folder;
    File1.setFolder(folder);
    File1.refresh();
    clearLists();
    TextList& list = m_sender.lists.List3;
    const DrivePath log = OrderFolder(folder).logPath();
    if (m_platform.files.fileExists(log))
        list.append(log.text());
    for (const QString& entry : File1.names()) {
        const DrivePath path = folder / entry;
        if ((!inPieces() || IsPiece(entry) || IsSheet(entry)) && path != log)
            list.append(path.text());
    }
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
