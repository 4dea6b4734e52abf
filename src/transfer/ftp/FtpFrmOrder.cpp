// What the sending page sends: the files of a new order or of a resend, in the order in which they travel.
#include "common/DrivePathText.h"
#include "editing/editor/gdisave.h"
#include "order/BrokenFiles.h"
#include "order/OrderDetailsReader.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/PieceName.h"
#include "order/PrintCode.h"
#include "platform/Dialogs.h"
#include "session/PageChain.h"
#include "session/Workspace.h"
#include "transfer/delivery/OrderSummary.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/http/UploadRoom.h"

#include <algorithm>
#include <utility>

namespace lumora {

bool FtpFrm::settingsFound() {
    if (CheckFtpSettings(m_state))
        return true;
    stopTimers();
    enter(Phase::NoServer);
    m_platform.dialogs.message(
        m_state.wording(QStringLiteral("המחשב לא מצא שרת זמין\rנסה במועד מאוחר יותר"),
                        QStringLiteral("The computer found no available server.\rTry at a later time.")));
    m_platform.dialogs.message(m_state.wording(
        QStringLiteral("אין צורך לבצע את הבחירה מהתחלה\rפשוט יש להפעיל את התוכנה מהתחלה\rולבחור מהאפשרויות "
                       "\r  ש ל י ח ה    ח ו ז ר ת  "),
        QStringLiteral(
            "There is no need to choose again.\rJust start the program\rand pick from the options\r  R E S E N D  ")));
    return false;
}

bool FtpFrm::orderIsChosen() const {
    return OrderFolder::chosen(m_state).isChosen();
}

void FtpFrm::beginList() {
    for (TextList* list : {&List3, &List4Makor, &List4Broken, &List6, &List7})
        list->clear();
    NumToSend = 0;
    m_room->check.NumOnServer = 0;
    m_state.transfer.ShemTikiya = OrderFolder::chosen(m_state).name();
    if (orderIsChosen())
        Label46.text = m_state.transfer.ShemTikiya;
}

void FtpFrm::listFolder() {
    const QString& folder = m_state.transfer.OrderFolder;
    beginList();
    File1Index = -1;
    if (!orderIsChosen()) {
        Label7.text = QStringLiteral("0");
        return;
    }
    File1.setFolder(folder);
    File1.refresh();
    Label7.text = QString::number(File1.count());
    const QString log = OrderFolder(folder).logPath();
    ReadOrderDetails(m_platform.files, log, m_state.shemot);
    ShowOrderSummary();
    // The order text always travels ahead of the pictures.
    if (m_platform.files.fileExists(log))
        List3.append(log);
    if (m_state.transfer.Mefurak == Travel::Whole) {
        for (const QString& name : File1.names())
            List3.append(JoinDrivePath(folder, name));
    } else {
        const auto sheet = std::find_if(File1.names().begin(), File1.names().end(), IsSheet);
        // Without a sheet the entry is the folder itself, and its put fails.
        List3.append(JoinDrivePath(folder, sheet == File1.names().end() ? QString() : *sheet));
        for (const QString& name : File1.names()) {
            if (IsPiece(name))
                List3.append(JoinDrivePath(folder, name));
        }
    }
    addProofPicture();
}

void FtpFrm::addProofPicture() {
    const QString proof = WorkspacePaths::proofPicture(m_state);
    if (m_platform.files.fileExists(proof))
        List3.append(proof);
}

void FtpFrm::CountOrderPictures() {
    List8.clear();
    for (const QString& path : List3.items())
        List8.append(LeafName(path));
    m_state.shemot.TotalPics = sumOfCopies(List8.items(), CopiesIn::FileNames);
    Label21.text = QString::number(m_state.shemot.TotalPics);
}

void FtpFrm::ShowOrderSummary() {
    Picture2Lines = OrderSummaryLines(m_state, m_platform.clock.now().date());
    if (m_state.transfer.SugMishloah == Sending::Chain || !m_chain.isRegistered(PageId::gdisave))
        return;
    m_chain.load<gdisave>().saveProof(
        OrderSummaryPicture(Picture2Lines, m_state.english() ? Qt::LeftToRight : Qt::RightToLeft));
}

void FtpFrm::armCountdown() {
    m_room->desk.pump();
    CountOrderPictures();
    NumToSend = static_cast<std::int16_t>(std::min(List3.count(), 32767));
    if (List3.isEmpty()) {
        enter(Phase::NoOrder);
        return;
    }
    List4Makor.clear();
    List4Makor.append(List3.items());
    if (m_room->desk.left)
        return;
    Timer1.start();
    enter(Phase::Countdown);
}

void FtpFrm::Command13_Click() {
    if (sending || !settingsFound())
        return;
    enter(Phase::Preparing);
    listFolder();
    armCountdown();
}

void FtpFrm::Command1_Click() {
    if (sending)
        return;
    if (const QStringList lines = std::exchange(m_state.handOver.lines, {}); !lines.isEmpty())
        m_handedOver = lines;
    if (!settingsFound())
        return;
    enter(Phase::Preparing);
    beginList();
    m_chain.unload(PageId::MoogMeret);
    if (!orderIsChosen()) {
        Label7.text = QStringLiteral("0");
        enter(Phase::NoOrder);
        return;
    }
    List3.append(m_handedOver);
    Label7.text = QString::number(List3.count());
    const QString& folder = m_state.transfer.OrderFolder;
    ReadResentDetails(m_platform.files, OrderFolder(folder).logPath(), m_state.shemot);
    ShowOrderSummary();
    addProofPicture();
    for (const QString& path : ReadBrokenFiles(m_platform.files, OrderFolder(folder))) {
        if (List3.contains(path))
            List4Broken.append(path);
    }
    armCountdown();
}

} // namespace lumora
