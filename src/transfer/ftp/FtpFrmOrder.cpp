// Lists the files that the page sends, for a new order or for a resend.
#include "common/DrivePath.h"
#include "editing/editor/gdisave.h"
#include "order/OrderDetailsReader.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/PieceName.h"
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

void FtpFrm::listFiles(const DrivePath& folder, const QString& pattern) {
    m_files.setPattern(pattern);
    m_files.setFolder(folder);
    m_files.refresh();
    m_sender.lists.File1.clear();
    m_sender.lists.File1.append(m_files.names());
}

void FtpFrm::listFolder() {
    const OrderFolder order = OrderFolder::chosen(m_state);
    clearLists();
    m_sender.lists.File1.clear();
    if (!order.isChosen()) {
        showFileCount(0);
        return;
    }
    listFiles(order.path(), ftpOrderPattern);
    showFileCount(m_files.count());
    ReadOrderDetails(m_platform.files, order.logPath(), m_state.shemot);
    ShowOrderSummary();
    m_sender.lists.List3.append(FtpOrderFiles(m_platform.files, order, m_files.names(), inPieces()));
    addProofPicture();
}

// As the page of finished orders chooses them: the log, then the sheets and prints or, of an order in pieces, the
// pieces.
QStringList FtpFrm::filesForResend(const DrivePath& folder) {
    const bool pieces = TravelsInPieces(folder.text());
    if (pieces) {
        m_state.transfer.Mefurak = Travel::Pieces;
        m_state.transfer.HazmanaP = 1;
    }
    listFiles(folder, pieces ? u"*.jpp;*.prk;*.txt"_s : u"*.jpp;*.txt"_s);
    const OrderFolder order(folder);
    QStringList paths;
    if (m_platform.files.fileExists(order.logPath()))
        paths += order.logPath().text();
    for (const QString& entry : m_files.names()) {
        const DrivePath path = folder / entry;
        if ((!inPieces() || IsPiece(entry) || IsSheet(entry)) && path != order.logPath() &&
            path != order.brokenFilesPath())
            paths += path.text();
    }
    return paths;
}

void FtpFrm::addProofPicture() {
    const DrivePath proof = WorkspacePaths::proofPicture(m_state);
    if (m_platform.files.fileExists(proof))
        m_sender.lists.List3.append(proof.text());
}

void FtpFrm::countPictures() {
    TextList& names = m_sender.lists.List8;
    names.clear();
    names.append(LeafNames(lists().List3.items()));
    m_state.shemot.TotalPics = sumOfCopies(names.items(), CopiesIn::FileNames);
    m_printCount = m_state.shemot.TotalPics;
    m_fileCount = lists().List3.count();
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
    const bool nothing = lists().List3.isEmpty();
    clearLists();
    enter(nothing ? SendingPhase::NoOrder : SendingPhase::Refused);
}

void FtpFrm::armCountdown() {
    m_platform.pump.pump();
    countPictures();
    // The log's total counts what was left out too.
    if (!m_state.transfer.leftOut.isEmpty())
        Picture2Lines = OrderSummaryLines(m_state, m_platform.clock.now().date());
    // The server is not asked: the lab may have removed the order's files.
    if (!lists().List3.isEmpty() && m_sender.onlyReportIsLeft()) {
        m_sender.beginOrder();
        showEnd(m_sender.report.endWhereLeft());
        return;
    }
    if (lists().List3.isEmpty() || !orderMayBeSent()) {
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
    m_state.transfer.SugMishloah = Sending::Resend;
    FtpLists& lists = m_sender.lists;
    const QStringList all = filesForResend(order.path());
    lists.List3.append(m_handedOver.isEmpty() ? all : m_handedOver);
    showFileCount(lists.List3.count());
    ReadResentDetails(m_platform.files, order.logPath(), m_state.shemot);
    ShowOrderSummary();
    if (!lists.List3.isEmpty())
        addProofPicture(); // alone it would count as the order
    armCountdown();
}

} // namespace lumora
