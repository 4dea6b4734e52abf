#include "finished/orders/MoogMeret.h"

#include "common/DrivePathText.h"
#include "finished/orders/UnreadableFolders.h"
#include "imaging/files/PictureFile.h"
#include "order/OrderNames.h"
#include "platform/Dialogs.h"
#include "platform/Instances.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <algorithm>
#include <utility>

namespace lumora {

namespace {

constexpr int walkTick = 30;
// A sheet in the preview is shrunk to this many windows, so that half of it is in sight and its text can be read.
constexpr int previewWindows = 2;

} // namespace

MoogMeret::MoogMeret(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::MoogMeret)
    , File1(platform.files)
    , Timer3(walkTick, [this] { Timer3_Tick(); })
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain) {
    for (Caption* hidden : {&Picture2, &Picture3, &Label4Rek, &Label4Pieces, &Label4Reka, &Label24, &Command13,
                            &Command19, &Command18, &Command4Orders})
        hidden->visible = false;
    List1Shown.enabled = false;
    connect(&chain, &PageChain::ended, this, [this] { Timer3.stop(); });
    connect(&chain, &PageChain::unloaded, this, [this](Page* page) {
        if (page == this)
            Timer3.stop();
    });
}

void MoogMeret::load() {
    if (m_platform.instances.another() &&
        !m_platform.dialogs.ask(QStringLiteral("Create another instance of this project\n") +
                                    m_state.wording(QStringLiteral("התוכנה כבר פועלת במחשב זה. להמשיך גם כאן?"),
                                                    QStringLiteral("The program is running on this computer already. "
                                                                   "Go on here too?")),
                                QStringLiteral("Send E-Mail Project"))) {
        leaveProgram();
        return;
    }
    Command4Pieces.visible = m_state.SplitPage && m_chain.isRegistered(PageId::SpltForm);
    const QStringList handedOver = std::exchange(m_state.handOver.lines, {});
    List1.append(handedOver);
    Command3_Click();
    const QString& customer = m_state.shemot.n1;
    for (Caption* label : {&Label23, &Label20, &Label10, &Label7})
        label->text = customer == notChosen ? QString() : customer;
    Command5_Click();
    Picture3.visible = true;
    // The order that the preparation gives over is the one to be sent.
    if (!handedOver.isEmpty())
        List3_Click(List2.find(FolderOfPath(handedOver.first())));
}

void MoogMeret::Command3_Click() {
    if (m_sending)
        return;
    const QString& folder = m_state.transfer.OrderFolder;
    Label1.text = QStringLiteral("0");
    if (FolderOfPath(folder) != WorkspacePaths::orders(m_state) || !m_platform.files.folderExists(folder))
        return;
    File1.setFolder(folder);
    for (const QString& name : File1.names().items())
        List1.append(JoinDrivePath(folder, name));
    Label1.text = QString::number(File1.names().count());
    Q_EMIT changed();
}

void MoogMeret::Command5_Click() {
    if (m_sending || m_walking)
        return;
    const QString orders = WorkspacePaths::orders(m_state) + u'\\';
    File1.setFolder(m_state.DiskRoot);
    List2.clear();
    List3.clear();
    if (Dir1Path == orders) {
        Dir1.clear();
        Dir1.append(m_platform.files.folders(orders));
    } else {
        Dir1_Change(orders);
    }
    for (const QString& name : Dir1.items()) {
        List2.append(JoinDrivePath(orders, name));
        List3.append(name);
    }
    Picture2.visible = false;
    Picture1 = {};
    leaveWalk();
    Label4Rek.visible = List3.isEmpty();
    Label4Bhar.visible = !List3.isEmpty();
    showSendButtons(true);
    Q_EMIT changed();
}

void MoogMeret::Dir1_Change(const QString& folder) {
    if (m_sending || m_walking)
        return;
    Dir1Path = folder;
    Dir1.clear();
    Dir1.append(m_platform.files.folders(folder));
    File1.setFolder(folder);
    Q_EMIT changed();
}

void MoogMeret::List3_Click(int index) {
    if (m_sending || m_walking || index < 0 || index >= List3.count())
        return;
    List3.setCurrentIndex(index);
    List2.setCurrentIndex(index);
    const QString folder = List2.currentItem();
    Picture2.visible = true;
    Label4Bhar.visible = false;
    m_state.transfer.OrderFolder = folder;
    // Neither is set back by a later folder: the lab's people may send what an order in pieces came from.
    if (TravelsInPieces(List3.currentItem())) {
        m_state.transfer.Mefurak = Travel::Pieces;
        File1.setPattern(FilesToSend::withPieces);
    }
    File1.setFolder(folder);
    leaveWalk();
    showOrder(folder);
    loadPreview();
    showSendButtons(true);
    Command1_Click();
}

void MoogMeret::showOrder(const QString& folder) {
    Label1.text = QString::number(File1.names().count());
    Label4Reka.visible = File1.names().isEmpty();
    Label4Pieces.visible = m_state.transfer.Mefurak == Travel::Pieces;
    showWhatIsMarked();
    const OrderDetails details = detailsOf(folder);
    const QString customer = QString(details.n1 + u' ' + details.n2).trimmed();
    Label4Lakoach.visible = !customer.isEmpty();
    Label4Lakoach.text = m_state.wording(QStringLiteral("לקוח: %1"), QStringLiteral("Customer: %1")).arg(customer);
    QStringList unreadable;
    m_platform.files.collect(folder, Files::Depth::ThisFolder, &unreadable);
    TellUnreadableFolders(m_state, m_platform.dialogs, unreadable);
}

// A first file that is no picture, as a print file or a piece, leaves the window empty.
void MoogMeret::loadPreview() {
    Picture1 = {};
    HScroll1 = VScroll1 = {};
    const auto path = m_platform.files.drives().toHost(JoinDrivePath(File1.folder(), File1.names().item(0)));
    if (File1.names().isEmpty() || !path)
        return;
    const auto size = readPictureSize(*path);
    if (!size)
        return;
    const QSize whole(size->width, size->height);
    const QSize shown = whole.boundedTo(
        whole.scaled(previewWidth * previewWindows, previewHeight * previewWindows, Qt::KeepAspectRatio));
    const auto picture = loadPictureScaled(*path, {std::max(shown.width(), 1), std::max(shown.height(), 1)});
    if (!picture)
        return;
    Picture1 = *picture;
    HScroll1.max = std::max(0, Picture1.width() - previewWidth) / scrollStep;
    VScroll1.max = std::max(0, Picture1.height() - previewHeight) / scrollStep;
}

void MoogMeret::HScroll1_Change(int value) {
    HScroll1.value = std::clamp(value, 0, HScroll1.max);
    Q_EMIT changed();
}

void MoogMeret::VScroll1_Change(int value) {
    VScroll1.value = std::clamp(value, 0, VScroll1.max);
    Q_EMIT changed();
}

void MoogMeret::File1_Click(int index) {
    if (m_sending || m_walking)
        return;
    File1.turnMark(index);
    ShowFamilyCount();
}

void MoogMeret::Command1_Click() {
    if (m_sending || m_walking)
        return;
    File1.markAll(m_state.transfer.Mefurak);
    ShowFamilyCount();
}

void MoogMeret::Command21_Click() {
    if (m_sending || m_walking)
        return;
    File1.refresh();
    ShowFamilyCount();
}

void MoogMeret::ShowFamilyCount() {
    m_state.shemot.TotalPics = File1.familyCount();
    Label5.text = QString::number(m_state.shemot.TotalPics);
    Q_EMIT changed();
}

void MoogMeret::showSendButtons(bool shown) {
    Command2.visible = Command4.visible = shown;
    Q_EMIT changed();
}

// The list goes to the FTP sender; the HTTP sender takes the order's folder whole, and asks its server what is missing.
void MoogMeret::Command4_Click() {
    if (m_leaving || m_sending || m_walking || !Command4.visible)
        return;
    showSendButtons(false);
    List1.clear();
    List1.append(File1.resendList());
    if (List1.isEmpty()) {
        m_platform.dialogs.message(m_state.wording(
            QStringLiteral("לא בחרת קבצים למשלוח מתוך החלון הצהב\rקרא הנחיות שלב שני"),
            QStringLiteral("You chose no files to send from the yellow window.\rRead the instructions of step two.")));
        showSendButtons(true);
        return;
    }
    m_leaving = true;
    m_state.transfer.SugMishloah = Sending::Resend;
    m_state.transfer.OrderFolder = File1.folder();
    const bool byHttp = m_state.transfer.SugSheliach == Sender::Http;
    if (!byHttp)
        m_state.handOver.lines = List1.items();
    m_chain.follow(PageId::MoogMeret, byHttp ? Outcome::ResentByHttp : Outcome::ResentByFtp);
}

void MoogMeret::Command6_Click() {
    leaveProgram();
}

// Hidden while packages are on their way.
void MoogMeret::Command18_Click() {
    if (Command18.visible)
        leaveProgram();
}

void MoogMeret::Command28_Click() {
    if (m_leaving || m_sending || m_walking)
        return;
    m_leaving = true;
    m_chain.follow(PageId::MoogMeret, Outcome::NewOrderWanted);
}

void MoogMeret::Command4Orders_Click() {
    Command5_Click();
}

// It leads back here.
void MoogMeret::Command4Pieces_Click() {
    if (!m_leaving && !m_sending && !m_walking)
        m_chain.follow(PageId::MoogMeret, Outcome::PiecesWanted);
}

void MoogMeret::leaveProgram() {
    m_leaving = true;
    Timer3.stop();
    m_chain.endProgram();
}

} // namespace lumora
