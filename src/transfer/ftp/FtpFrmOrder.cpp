// Lists the files that the page sends, for a new order or for a resend.
#include "common/DrivePath.h"
#include "editing/editor/gdisave.h"
#include "order/OrderDetailsReader.h"
#include "order/OrderFolder.h"
#include "order/PrintCode.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "transfer/delivery/OrderFiles.h"
#include "transfer/delivery/OrderSummary.h"
#include "transfer/ftp/FtpFrm.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

bool FtpFrm::settingsFound() {
    if (CheckFtpSettings(m_state.profile))
        return true;
    stopTimers();
    enter(SendingPhase::NoServer);
    showNoServerBoxes();
    return false;
}

void FtpFrm::clearLists() {
    m_sender.clearLists();
    const OrderFolder order = OrderFolder::chosen(m_state);
    m_state.transfer.ShemTikiya = order.name();
    if (order.isChosen())
        Label46.text = m_state.transfer.ShemTikiya;
}

void FtpFrm::listFolder() {
    const OrderFolder order = OrderFolder::chosen(m_state);
    clearLists();
    File1Index = -1;
    if (!order.isChosen()) {
        showFileCount(0);
        return;
    }
    File1.setFolder(order.path());
    File1.refresh();
    showFileCount(File1.count());
    ReadOrderDetails(m_platform.files, order.logPath(), m_state.shemot);
    ShowOrderSummary();
    m_sender.lists.List3.append(FtpOrderFiles(m_platform.files, order, File1.names(), inPieces()));
    addProofPicture();
}

void FtpFrm::addProofPicture() {
    const DrivePath proof = WorkspacePaths::proofPicture(m_state);
    if (m_platform.files.fileExists(proof))
        m_sender.lists.List3.append(proof.text());
}

void FtpFrm::countPictures() {
    TextList& names = m_sender.lists.List8;
    names.clear();
    for (const QString& path : lists().List3.items())
        names.append(LeafName(path));
    m_state.shemot.TotalPics = sumOfCopies(names.items(), CopiesIn::FileNames);
    m_printCount = m_state.shemot.TotalPics;
    showCounts();
}

void FtpFrm::ShowOrderSummary() {
    Picture2Lines = OrderSummaryLines(m_state, m_platform.clock.now().date());
    if (m_state.transfer.SugMishloah == Sending::Chain || !m_chain.isRegistered(PageId::gdisave))
        return;
    m_chain.load<gdisave>().saveProof(
        OrderSummaryPicture(Picture2Lines, m_state.english() ? Qt::LeftToRight : Qt::RightToLeft));
}

// What was listed must not be sent by another button either.
void FtpFrm::refuseOrder() {
    if (m_sender.stop.left)
        return;
    clearLists();
    enter(SendingPhase::NoOrder);
}

void FtpFrm::armCountdown() {
    m_platform.pump.pump();
    countPictures();
    if (lists().List3.isEmpty() || !mayBeSent()) {
        refuseOrder();
        return;
    }
    m_sender.beginOrder();
    if (!m_sender.stop.left)
        startCount();
}

void FtpFrm::beginNewOrder() {
    if (isUnderWay(phase()) || !settingsFound())
        return;
    enter(SendingPhase::Preparing);
    listFolder();
    armCountdown();
}

void FtpFrm::beginResend() {
    if (isUnderWay(phase()))
        return;
    if (const QStringList lines = std::exchange(m_state.handOver.lines, {}); !lines.isEmpty())
        m_handedOver = lines;
    if (!settingsFound())
        return;
    enter(SendingPhase::Preparing);
    clearLists();
    m_chain.unload(PageId::MoogMeret);
    const OrderFolder order = OrderFolder::chosen(m_state);
    if (!order.isChosen()) {
        showFileCount(0);
        enter(SendingPhase::NoOrder);
        return;
    }
    if (m_handedOver.isEmpty()) {
        // The proof picture alone would count as the order.
        listFolder();
    } else {
        FtpLists& lists = m_sender.lists;
        lists.List3.append(m_handedOver);
        showFileCount(lists.List3.count());
        ReadResentDetails(m_platform.files, order.logPath(), m_state.shemot);
        ShowOrderSummary();
        addProofPicture();
    }
    armCountdown();
}

} // namespace lumora
