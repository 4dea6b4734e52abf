// The hidden area of the sending page: the older bulk path, the chain of orders, the manual panel of the makers, and
// the routines that nothing calls.
#include "common/DrivePathText.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/PieceName.h"
#include "platform/Dialogs.h"
#include "session/Workspace.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/http/UploadRoom.h"

#include <algorithm>

namespace lumora {

namespace {

constexpr int bulkRounds = 3;
constexpr int bulkConnectFails = 5;

} // namespace

void FtpFrm::Command2_Click() {
    if (sending || AllDone == 1)
        return;
    // The proof picture alone would arrive and count as the whole order.
    if (m_handedOver.isEmpty()) {
        m_platform.dialogs.message(QStringLiteral("list3 is empty"));
        return;
    }
    List3.clear();
    if (m_state.transfer.Mefurak == Travel::Whole) {
        List3.append(m_handedOver);
    } else {
        const auto append = [&](const QString& ending) {
            for (const QString& path : std::as_const(m_handedOver)) {
                if (path.endsWith(ending))
                    List3.append(path);
            }
        };
        append(QStringLiteral("txt"));
        const auto sheet = std::find_if(m_handedOver.cbegin(), m_handedOver.cend(),
                                        [](const QString& path) { return IsSheet(LeafName(path)); });
        if (sheet != m_handedOver.cend())
            List3.append(*sheet);
        append(QStringLiteral("prk"));
    }
    addProofPicture();
    NumToSend = static_cast<std::int16_t>(std::min(List3.count(), 32767));
    Label33.text = QStringLiteral("10");
    Command4_Click();
}

void FtpFrm::Command4_Click() {
    if (sending || AllDone == 1 || m_room->desk.left)
        return;
    if (List3.isEmpty()) {
        m_platform.dialogs.message(QStringLiteral("list3 is empty"));
        return;
    }
    UploadRoom& room = *m_room;
    Phase end = Phase::Silent;
    room.session.beginPass();
    room.pass.UserStopped = 0;
    for (int round = 1; round <= bulkRounds; ++round) {
        enter(Phase::Sending);
        stopTimers();
        room.desk.StopFlag = false;
        for (int i = 0; i < List3.count() && room.session.ConnectFails <= bulkConnectFails && !room.desk.StopFlag &&
                        !room.desk.left;
             ++i) {
            List3.setCurrentIndex(i);
            room.pass.CurrentIndex = i;
            room.pass.UploadOneFile(List3.item(i));
        }
        if (room.desk.left)
            return;
        if (room.desk.StopFlag) {
            room.pass.tellStopped();
            end = Phase::Stopped;
            break;
        }
        enter(Phase::Checking);
        room.check.ListServerFiles();
        if (room.desk.left)
            return;
        if (room.check.NumOnServer == NumToSend && (room.check.freshCount || !room.desk.StopFlag)) {
            SendSuccess();
            end = Phase::Success;
            break;
        }
        if (room.desk.StopFlag) {
            room.pass.tellStopped();
            end = Phase::Stopped;
            break;
        }
        if (room.check.NumOnServer < NumToSend) {
            Frame9.visible = true;
            room.session.RoundNo = static_cast<std::int16_t>(round);
            Label4.text = QString::number(round);
            Label33.text = Label20.text = QStringLiteral("10");
            end = Phase::NotAll;
        }
    }
    finish(end);
}

void FtpFrm::Command17_Click() {
    if (sending || ListRezefFiles.currentIndex() < 0)
        return;
    enter(Phase::Sending);
    SendChainOrder(ListRezefFiles.currentItem());
}

void FtpFrm::Command19_Click() {
    if (sending)
        return;
    for (int i = 0; i < ListRezefFiles.count() && !m_room->desk.left; ++i) {
        enter(Phase::Sending);
        ListRezefFiles.setCurrentIndex(i);
        Label4siem.text = QStringLiteral("%1 / %2").arg(i + 1).arg(ListRezefFiles.count());
        SendChainOrder(ListRezefFiles.item(i));
        if (m_room->pass.UserStopped == 1) {
            m_room->desk.status(m_state.wording(QStringLiteral("הרצף נעצר לפי בקשה של המשתמש "),
                                                QStringLiteral("The sequence stopped at the user's request ")));
            return;
        }
    }
    if (!m_room->desk.left)
        m_room->desk.status(m_state.wording(QStringLiteral("  סיים  "), QStringLiteral("  Finished  ")));
}

void FtpFrm::SendChainOrder(const QString& name) {
    UploadRoom& room = *m_room;
    const QString folder = JoinDrivePath(WorkspacePaths::orders(m_state), name);
    Phase end = Phase::NoOrder;
    room.pass.UserStopped = 0;
    if (m_platform.files.folderExists(folder)) {
        m_state.transfer.OrderFolder = folder;
        listFolder();
        CountOrderPictures();
        NumToSend = static_cast<std::int16_t>(std::min(List3.count(), 32767));
        List4Makor.append(List3.items());
        m_state.transfer.ShemTikiya = name;
        AllDone = 0;
        room.check.ListServerFiles();
        room.check.DropAlreadySent();
        end = List3.isEmpty() ? Phase::Silent : RunAttempts();
    }
    if (!room.desk.left)
        finish(end);
}

void FtpFrm::Command22_Click() {
    if (sending)
        return;
    Command22.visible = false;
    m_room->pass.FaultPressed = true;
    Command19_Click();
    Command22.visible = true;
    Q_EMIT changed();
}

void FtpFrm::Command25_Click() {
    if (sending || ListRezefFiles.currentIndex() < 0)
        return;
    const Phase before = m_phase;
    m_state.transfer.ShemTikiya = ListRezefFiles.currentItem();
    enter(Phase::Checking);
    m_room->check.ListServerFiles();
    enter(before);
}

void FtpFrm::Command26_Click() {
    if (!m_proofWanted || m_proofText.isEmpty())
        return;
    Picture13.visible = true;
    Picture13File = JoinDrivePath(WorkspacePaths::root(m_state), QStringLiteral("001.jpg"));
    Q_EMIT changed();
}

void FtpFrm::Command27_Click() {
    const auto made = m_platform.files.makeFolder(m_state.DiskRoot + QStringLiteral("!!AVROO"));
    if (!made)
        m_platform.dialogs.message(made.failure().message);
    List4Tikiyot.setCurrentIndex(0);
    Q_EMIT changed();
}

bool FtpFrm::inSession(const QString& message) {
    if (!sending && m_room->session.bActiveSession)
        return true;
    m_platform.dialogs.message(message);
    return false;
}

QString FtpFrm::chosenRemoteName() {
    if (!inSession(QStringLiteral("Not in session")))
        return {};
    const QString chosen = List2.currentItem();
    if (chosen.isEmpty())
        m_platform.dialogs.message(QStringLiteral("Please select the item to GET!"));
    return chosen.mid(chosen.lastIndexOf(u'/') + 1);
}

void FtpFrm::Command3_Click() {
    if (!inSession(QStringLiteral("Not in session")))
        return;
    if (File1.name(File1Index).isEmpty()) {
        m_platform.dialogs.message(QStringLiteral("Please select a local file to put"));
        return;
    }
    m_room->session.putHere(JoinDrivePath(File1.folder(), File1.name(File1Index)));
    Q_EMIT changed();
}

void FtpFrm::Command5_Click() {
    const QString name = chosenRemoteName();
    if (!name.isEmpty())
        m_room->session.getHere(name, File1.folder());
    Q_EMIT changed();
}

void FtpFrm::Command6_Click() {
    const QString name = chosenRemoteName();
    if (!name.isEmpty())
        m_room->session.removeHere(name);
    Q_EMIT changed();
}

void FtpFrm::Command7_Click() {
    if (inSession(QStringLiteral("Not in session")))
        m_room->session.makeGoop();
    Q_EMIT changed();
}

void FtpFrm::cmdInternetOpen_Click() {
    if (sending)
        return;
    m_room->session.FtpOpenInternet();
    m_room->session.FtpConnectServer();
    Q_EMIT changed();
}

void FtpFrm::cmdClosehOpen_Click() {
    if (sending)
        return;
    m_room->session.closeSession();
    Q_EMIT changed();
}

// Both options store the same transfer type: the lab's server takes every file, pictures too, as ASCII with its bytes
// unchanged.
void FtpFrm::optBin_Click() {
    m_room->session.dwType = 1;
    optBin.checked = true;
    optAscii.checked = false;
    Q_EMIT changed();
}

void FtpFrm::optAscii_Click() {
    m_room->session.dwType = 1;
    optAscii.checked = true;
    optBin.checked = false;
    Q_EMIT changed();
}

void FtpFrm::chkPassive_Click(bool checked) {
    chkPassive.checked = checked;
    Q_EMIT changed();
}

void FtpFrm::File1_Click(int index) {
    File1Index = index;
    Q_EMIT changed();
}

void FtpFrm::List2_Click(int index) {
    List2.setCurrentIndex(index);
    Q_EMIT changed();
}

void FtpFrm::ListRezefFiles_Click(int index) {
    ListRezefFiles.setCurrentIndex(index);
    Q_EMIT changed();
}

void FtpFrm::PrepareResendHere(const QString& folder) {
    const bool pieces = TravelsInPieces(folder);
    File1.setPattern(pieces ? QStringLiteral("*.jpp;*.prk;*.txt") : QStringLiteral("*.jpp;*.txt"));
    if (pieces) {
        m_state.transfer.Mefurak = Travel::Pieces;
        m_state.transfer.HazmanaP = 1;
    }
    m_state.transfer.OrderFolder = folder;
    File1.setFolder(folder);
    File1.refresh();
    beginList();
    const QString log = OrderFolder(folder).logPath();
    if (m_platform.files.fileExists(log))
        List3.append(log);
    for (const QString& entry : File1.names()) {
        const QString path = JoinDrivePath(folder, entry);
        const bool selected = m_state.transfer.Mefurak == Travel::Whole || IsPiece(entry) || IsSheet(entry);
        if (selected && path != log)
            List3.append(path);
    }
    if (List3.isEmpty()) {
        m_platform.dialogs.message(m_state.wording(
            QStringLiteral("לא בחרת קבצים למשלוח מתוך החלון הצהב\rקרא הנחיות שלב שני"),
            QStringLiteral("You chose no files to send from the yellow window.\rRead the instructions of step two.")));
        return;
    }
    m_state.transfer.SugMishloah = Sending::Chain;
    armCountdown();
}

void FtpFrm::AskAfterFatalError() {
    m_room->session.FtpFatalErrorAsk({Failure::Kind::Other, {}}, QString());
}

} // namespace lumora
