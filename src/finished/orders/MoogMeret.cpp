#include "finished/orders/MoogMeret.h"

#include "common/FixedText.h"
#include "finished/orders/UnreadableFolders.h"
#include "imaging/files/PictureFile.h"
#include "order/HistoryState.h"
#include "order/OrderDetailsReader.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/OrderNames.h"
#include "order/OrderSender.h"
#include "platform/Dialogs.h"
#include "platform/Instances.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/Workspace.h"

#include <algorithm>
#include <array>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int walkTick = 30; // milliseconds
// A sheet is shrunk to this many times the preview window, so that half of it is visible and its text is legible.
constexpr int previewWindows = 2;

// The controls that each phase shows; Leaving changes nothing.
constexpr struct {
    Caption MoogMeretControls::*control;
    std::array<bool, 4> in; // Orders, Picked, Walking, Walked
} shownBy[] = {
    {&MoogMeretControls::Picture3, {true, true, false, false}},
    {&MoogMeretControls::hintPanel, {true, false, false, false}},
    {&MoogMeretControls::walkPanel, {false, false, true, true}},
    {&MoogMeretControls::waysPanel, {false, true, false, true}},
    {&MoogMeretControls::endPanel, {false, false, false, true}},
    {&MoogMeretControls::Picture2, {false, true, false, false}},
    {&MoogMeretControls::Label4Shalav3, {false, true, false, false}},
    {&MoogMeretControls::Command4, {true, true, false, false}},
    {&MoogMeretControls::Command2, {true, true, false, true}},
    {&MoogMeretControls::Command28, {true, true, false, true}},
    {&MoogMeretControls::Label13, {false, false, true, false}},
    {&MoogMeretControls::Label4Mana, {false, false, true, false}},
    {&MoogMeretControls::Label4Shem, {false, false, true, false}},
    {&MoogMeretControls::Label24, {false, false, true, false}},
    {&MoogMeretControls::Command19, {false, false, true, false}},
    {&MoogMeretControls::Label4Shaa, {false, false, true, true}},
    {&MoogMeretControls::Command18, {false, false, false, true}},
    {&MoogMeretControls::Command4Orders, {false, false, false, true}},
};

} // namespace

MoogMeret::MoogMeret(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::MoogMeret)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_files(platform.files)
    , Timer3(walkTick, [this] { stepWalk(); }) {
    connect(&chain, &PageChain::ended, this, [this] { enter(Phase::Leaving); });
    connect(&chain, &PageChain::unloaded, this, [this](const Page* page) {
        if (page == this)
            enter(Phase::Leaving);
    });
}

void MoogMeret::load() {
    if (m_platform.instances.another() &&
        !m_platform.dialogs.ask(
            u"Create another instance of this project\n"_s +
                m_state.wording(u"התוכנה כבר פועלת במחשב זה. להמשיך גם כאן?"_s,
                                u"The program is running on this computer already. Go on here too?"_s),
            u"Send E-Mail Project"_s)) {
        leaveProgram();
        return;
    }
    Command4Pieces.visible = m_state.SplitPage && m_chain.canFollow(PageId::MoogMeret, Outcome::PiecesWanted);
    const QStringList handedOver = std::exchange(m_state.handOver.lines, {});
    List1.append(handedOver);
    listOrderInHand();
    const QString& customer = m_state.shemot.n1;
    for (Caption* label : {&Label23, &Label20, &Label10, &Label7})
        label->text = customer == notChosen ? QString() : customer;
    refreshOrders();
    // The order that the preparation hands over is picked.
    if (!handedOver.isEmpty())
        pickOrder(List2.find(DrivePath(handedOver.first()).folder().text()));
}

void MoogMeret::enter(Phase phase) {
    m_phase = phase;
    if (phase == Phase::Leaving) {
        Timer3.stop();
        return;
    }
    for (const auto& [control, in] : shownBy)
        (this->*control).visible = in[static_cast<std::size_t>(phase)];
    Command2.enabled = mailIsOffered();
    Label4EinDoar.visible = Command2.visible && !Command2.enabled;
    Q_EMIT changed();
}

bool MoogMeret::mayAct() const {
    return m_phase != Phase::Walking && m_phase != Phase::Leaving && !sending();
}

// --- the orders and their files ---

// Lists the files of the session's order, as the preparation left it.
void MoogMeret::listOrderInHand() {
    const DrivePath& folder = m_state.transfer.OrderFolder;
    Label1.text = u"0"_s;
    if (folder.folder() != WorkspacePaths::orders(m_state) || !m_platform.files.folderExists(folder))
        return;
    listFiles(folder);
    for (const QString& name : File1.items())
        List1.append((folder / name).text());
    Label1.text = QString::number(File1.count());
    Q_EMIT changed();
}

void MoogMeret::refreshOrders() {
    if (!mayAct())
        return;
    const DrivePath orders = WorkspacePaths::orders(m_state) / u"";
    listFiles(m_state.DiskRoot);
    openFolder(orders);
    List2.clear();
    List3.clear();
    m_notFinished.clear();
    m_givenUp.clear();
    for (const QString& name : Dir1.items()) {
        List2.append((orders / name).text());
        List3.append(name);
        if (CompletionOf(m_platform.files, OrderFolder(orders / name)) != Completion::Finished)
            m_notFinished += name;
        if (m_state.Waiting && OrderJournal(m_platform.files, OrderFolder(orders / name)).state().givenUp)
            m_givenUp += name;
    }
    Picture1 = {};
    Label4Rek.visible = List3.isEmpty();
    Label4Bhar.visible = !List3.isEmpty();
    listWaiting();
    enter(Phase::Orders);
}

// Reads the files of the folder only when it is another one than before.
void MoogMeret::openFolder(const DrivePath& folder) {
    if (std::exchange(Dir1Path, folder) != folder)
        listFiles(folder);
    Dir1.clear();
    Dir1.append(m_platform.files.folders(folder));
}

void MoogMeret::listFiles(const DrivePath& folder) {
    m_files.setFolder(folder);
    File1.clear();
    File1.append(m_files.names());
}

void MoogMeret::pickOrder(int index) {
    if (!mayAct() || index < 0 || index >= List3.count() || !mayBePicked(OrderFolder(DrivePath(List2.item(index)))))
        return;
    List3.setCurrentIndex(index);
    List2.setCurrentIndex(index);
    const DrivePath folder(List2.currentItem());
    m_state.transfer.OrderFolder = folder;
    // A later folder resets neither: the lab's people may send the print files of an order in pieces.
    if (TravelsInPieces(List3.currentItem())) {
        m_state.transfer.Mefurak = Travel::Pieces;
        m_files.setPattern(FilesToSend::withPieces);
    }
    listFiles(folder);
    enter(Phase::Picked);
    showOrder(folder);
    loadPreview();
    markAll();
}

void MoogMeret::showOrder(const DrivePath& folder) {
    Label1.text = QString::number(File1.count());
    Label4Reka.visible = File1.isEmpty();
    Label4Pieces.visible = m_state.transfer.Mefurak == Travel::Pieces;
    showWhatIsMarked();
    const OrderDetails details = detailsOf(folder);
    const QString customer = QString(details.n1 + u' ' + details.n2).trimmed();
    Label4Lakoach.visible = !customer.isEmpty();
    Label4Lakoach.text = m_state.wording(u"לקוח: %1"_s, u"Customer: %1"_s).arg(customer);
    QStringList unreadable;
    m_platform.files.collect(folder, Files::Depth::ThisFolder, &unreadable);
    TellUnreadableFolders(m_state, m_platform.dialogs, unreadable);
}

OrderDetails MoogMeret::detailsOf(const DrivePath& folder) const {
    OrderDetails details;
    const DrivePath log = OrderFolder(folder).logPath();
    if (m_platform.files.fileExists(log))
        ReadResentDetails(m_platform.files, log, details);
    return details;
}

// The preview stays empty when the first file is no picture, such as a print file or a piece.
void MoogMeret::loadPreview() {
    Picture1 = {};
    HScroll1 = VScroll1 = {};
    const auto path = m_platform.files.drives().toHost(m_files.folder() / File1.item(0));
    if (File1.isEmpty() || !path)
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

void MoogMeret::scroll(Scroll& bar, int value) {
    bar.value = std::clamp(value, 0, bar.max);
    Q_EMIT changed();
}

void MoogMeret::turnMark(int index) {
    if (!mayAct())
        return;
    File1.setCurrentIndex(index);
    m_files.turnMark(index);
    ShowFamilyCount();
}

void MoogMeret::markAll() {
    if (!mayAct())
        return;
    m_files.markAll(m_state.transfer.Mefurak);
    ShowFamilyCount();
}

void MoogMeret::markNone() {
    if (!mayAct())
        return;
    listFiles(m_files.folder());
    ShowFamilyCount();
}

void MoogMeret::ShowFamilyCount() {
    m_state.shemot.TotalPics = m_files.familyCount();
    Label5.text = QString::number(m_state.shemot.TotalPics);
    Q_EMIT changed();
}

// --- the ways on ---

// The FTP sender gets the list of files; the HTTP sender takes the whole folder and asks its server which files are
// missing.
void MoogMeret::sendAgain() {
    if (!mayAct() || m_phase == Phase::Walked)
        return;
    List1.clear();
    List1.append(m_files.resendList());
    if (List1.isEmpty()) {
        tellNothingIsMarked(m_state.wording(
            u"לא בחרת קבצים למשלוח מתוך החלון הצהב\rקרא הנחיות שלב שני"_s,
            u"You chose no files to send from the yellow window.\rRead the instructions of step two."_s));
        return;
    }
    enter(Phase::Leaving);
    m_state.transfer.SugMishloah = Sending::Resend;
    m_state.transfer.OrderFolder = m_files.folder();
    const bool byHttp = SenderForResend(m_state, OrderFolder(m_files.folder()), m_platform.files) == Sender::Http;
    if (!byHttp)
        m_state.handOver.lines = List1.items();
    m_chain.follow(PageId::MoogMeret, byHttp ? Outcome::ResentByHttp : Outcome::ResentByFtp);
}

// Both buttons of sending are hidden until the box is closed.
void MoogMeret::tellNothingIsMarked(const QString& words) {
    Command2.visible = Command4.visible = Label4EinDoar.visible = false;
    Q_EMIT changed();
    m_platform.dialogs.message(words);
    enter(m_phase);
}

void MoogMeret::beginNewOrder() {
    if (!mayAct())
        return;
    enter(Phase::Leaving);
    m_chain.follow(PageId::MoogMeret, Outcome::NewOrderWanted);
}

void MoogMeret::showPieces() {
    if (mayAct())
        m_chain.follow(PageId::MoogMeret, Outcome::PiecesWanted);
}

void MoogMeret::leaveAfterWalk() {
    if (m_phase == Phase::Walked)
        leaveProgram();
}

void MoogMeret::leaveProgram() {
    m_chain.endProgram();
}

} // namespace lumora
