// The lab's own area of the sending page: the older bulk path and the chain of orders.
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "transfer/delivery/OrderFiles.h"
#include "transfer/delivery/StoppableLine.h"
#include "transfer/ftp/FtpFrm.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

// Before the order is listed and while the line is in use no button of the area does anything.
bool FtpFrm::mayAct() const {
    return !busy() && phase() != SendingPhase::Preparing && !m_sender.stop.left;
}

// An order that has arrived is not listed again.
bool FtpFrm::mayList() {
    if (!mayAct())
        return false;
    if (!hasArrived(phase()))
        return true;
    showHasArrived();
    return false;
}

void FtpFrm::listNewOrder() {
    if (mayList())
        beginNewOrder();
}

void FtpFrm::listResend() {
    if (mayList())
        beginResend();
}

void FtpFrm::refillAndSendInRounds() {
    if (!mayAct() || hasArrived(phase()) || !settingsFound())
        return;
    // List3 would get the proof picture alone, and its arrival would count as that of the order.
    if (m_handedOver.isEmpty()) {
        m_platform.dialogs.message(u"list3 is empty"_s);
        return;
    }
    stopTimers(); // the count must not end while the guard asks
    m_sender.lists.List3.clear();
    m_sender.lists.List3.append(BulkFiles(m_handedOver, inPieces()));
    addProofPicture();
    if (!orderMayBeSent()) {
        refuseOrder();
        return;
    }
    m_sender.beginOrder();
    showSecondsAfterFailure();
    sendInRounds();
}

void FtpFrm::sendInRounds() {
    if (!mayAct() || hasArrived(phase()) || !settingsFound())
        return;
    // A list that no order has begun with is none to send.
    if (lists().List3.isEmpty() || lists().List4Makor.isEmpty()) {
        m_platform.dialogs.message(u"list3 is empty"_s);
        return;
    }
    const std::optional<SendingPhase> end = m_sender.runOlderRounds();
    if (end == SendingPhase::NumberTaken) {
        prepareOrderAgain();
        return;
    }
    if (end == SendingPhase::NotAll)
        showFailure();
    if (end)
        finish(*end);
}

void FtpFrm::sendChosenOrder() {
    if (!mayAct() || lists().ListRezefFiles.currentIndex() < 0)
        return;
    SendChainOrder(lists().ListRezefFiles.currentItem());
}

void FtpFrm::sendChain() {
    if (!mayAct())
        return;
    TextList& chain = m_sender.lists.ListRezefFiles;
    for (int i = 0; i < chain.count() && !m_sender.stop.left; ++i) {
        chain.setCurrentIndex(i);
        Label4siem.text = u"%1 / %2"_s.arg(i + 1).arg(chain.count());
        SendChainOrder(chain.item(i));
        if (m_sender.pass.UserStopped == 1) {
            status(wording(u"הרצף נעצר לפי בקשה של המשתמש ", u"The sequence stopped at the user's request "));
            return;
        }
    }
    if (!m_sender.stop.left)
        status(wording(u"  סיים  ", u"  Finished  "));
}

void FtpFrm::SendChainOrder(const QString& name) {
    enter(SendingPhase::Checking);
    const DrivePath folder = WorkspacePaths::orders(m_state) / name;
    std::optional<SendingPhase> end = SendingPhase::NoOrder;
    m_sender.pass.UserStopped = 0;
    m_sender.stop.StopFlag = false;
    if (m_platform.files.folderExists(folder)) {
        m_state.transfer.OrderFolder = folder;
        listFolder();
        countPictures();
        if (orderMayBeSent()) {
            m_sender.beginOrder();
            m_state.transfer.ShemTikiya = name;
            listOnServer();
            m_sender.check.DropAlreadySent();
            end = lists().List3.isEmpty() ? m_sender.silentEnd() : m_sender.RunAttempts();
        }
        if (end == SendingPhase::NumberTaken) { // no page is left in the middle of a chain
            tellForeign();
            end = SendingPhase::CallLab;
        }
        if (end == SendingPhase::NotAll)
            showFailure();
    }
    if (end && !m_sender.stop.left)
        finish(*end);
}

void FtpFrm::sendChainAfterFault() {
    if (!mayAct())
        return;
    Command22.visible = false;
    m_sender.pass.FaultPressed = true;
    sendChain();
    Command22.visible = true;
    Q_EMIT changed();
}

void FtpFrm::checkChosenOrder() {
    if (!mayAct() || lists().ListRezefFiles.currentIndex() < 0)
        return;
    holdCount();
    const SendingPhase before = phase();
    const QString own = std::exchange(m_state.transfer.ShemTikiya, lists().ListRezefFiles.currentItem());
    m_sender.stop.StopFlag = false;
    enter(SendingPhase::Checking);
    listOnServer();
    m_state.transfer.ShemTikiya = own;
    enter(before);
}

void FtpFrm::listOnServer() {
    const StoppableLine line(m_platform);
    m_sender.check.ListServerFiles();
}

void FtpFrm::chooseOrder(int index) {
    m_sender.lists.ListRezefFiles.setCurrentIndex(index);
    Q_EMIT changed();
}

void FtpFrm::showLabButtons() {
    const bool chain = !lists().ListRezefFiles.isEmpty();
    Label4Rezef.visible = !chain;
    Command17.enabled = Command19.enabled = Command25.enabled = chain && mayAct();
    Command13.enabled = Command1.enabled = mayAct();
    Command2.enabled = Command4.enabled = mayAct() && !hasArrived(phase());
    for (Caption* manual : {&cmdInternetOpen, &cmdClosehOpen, &Command3, &Command5, &Command6, &Command7})
        manual->enabled = mayAct();
    chkPassive.enabled = optBin.enabled = optAscii.enabled = mayAct() && cmdClosehOpen.visible;
    showReporting();
    Q_EMIT changed();
}

} // namespace lumora
