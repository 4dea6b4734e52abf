#include "transfer/http/UploadForm.h"

#include "common/DrivePathText.h"
#include "common/FixedText.h"
#include "order/OrderFolder.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

#include <QTimer>

#include <algorithm>

namespace lumora {

namespace {

constexpr int panelTick = 1;
constexpr int countdownTick = 1000;
constexpr int panelStep = 6;
constexpr int countdownFrom = 5;
// A folder's path of less is none.
constexpr int shortestFolder = 4;

} // namespace

UploadForm::UploadForm(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::UploadForm)
    , Timer1(panelTick, [this] { Timer1_Tick(); })
    , Timer2(countdownTick, [this] { Timer2_Tick(); })
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_script(platform) {
    TxtUrl.text = QStringLiteral("value1=Hello&value2=World!");
    Command15.enabled = false;
    for (Caption* control : {&Picture1, &Picture5, &Picture6, &Pic4Timer, &Pic4Hamten, &Image5, &Command3, &Command10,
                             &Command28, &Label9, &Label11, &Label4Reason})
        control->visible = false;
    // The page acts once it is in front, so that what it does is seen; made alone it sends nothing.
    connect(&chain, &PageChain::shown, this, [this](Page* page) {
        if (page == this)
            QTimer::singleShot(0, this, &UploadForm::activateWhenFree);
    });
    connect(&chain, &PageChain::ended, this, &UploadForm::leavePage);
    connect(&chain, &PageChain::unloaded, this, [this](Page* page) {
        if (page == this)
            leavePage();
    });
}

// Inside the pump of a page that still hands over, clicks would not get through to this one.
void UploadForm::activateWhenFree() {
    if (m_platform.pump.pumping())
        QTimer::singleShot(20, this, &UploadForm::activateWhenFree);
    else
        Form_Activate();
}

void UploadForm::Form_Activate() {
    if (m_activated)
        return;
    m_activated = true;
    Command2_Click();
}

void UploadForm::setTexts() {
    const auto set = [this](Caption& control, const QString& hebrew, const QString& english) {
        control.text = m_state.wording(hebrew, english);
    };
    set(Command2, QStringLiteral("רענן רשימה"), QStringLiteral("Refresh list"));
    set(Command3, QStringLiteral("עצור את המשלוח"), QStringLiteral("Stop the sending"));
    set(Command10, QStringLiteral("המשך את המשלוח"), QStringLiteral("Continue the sending"));
    set(Command28, QStringLiteral("הזמנה חדשה"), QStringLiteral("New order"));
    set(Image3, QStringLiteral("סגור"), QStringLiteral("Close"));
    set(Image5, QStringLiteral("שלח שוב"), QStringLiteral("Send again"));
    set(Label9, QStringLiteral("שולח"), QStringLiteral("Sending"));
    set(Label11, QStringLiteral("הזמנה זו עלתה במלואה"), QStringLiteral("This order went up in full"));
    set(Label13, QStringLiteral(" המשלוח יחל בעוד "), QStringLiteral("The sending starts in"));
    set(Label14, QStringLiteral("שניות"), QStringLiteral("seconds"));
    set(Label4Notru, QStringLiteral("מספר הקבצים שנותרו למשלוח "), QStringLiteral("Files left to send "));
    set(Label4Rshom, QStringLiteral("נא לרשום את מספר ההזמנה "), QStringLiteral("Please write down the order number"));
    set(Label4Alu, QStringLiteral(" הקבצים עלו בהצלחה "), QStringLiteral("The files went up successfully"));
    set(Label4Tashlum, QStringLiteral("נא להתקשר לחנות לגבי תשלום"),
        QStringLiteral("Please call the shop about payment"));
    showWhatToDo();
    Q_EMIT changed();
}

void UploadForm::showWhatToDo() {
    const auto say = [this](const QString& hebrew, const QString& english) {
        Label4Do.text = m_state.wording(hebrew, english);
    };
    switch (m_phase) {
    case Phase::Checking:
        say(QStringLiteral("קוראים את ההזמנה ובודקים מה כבר הגיע לשרת. נא להמתין."),
            QStringLiteral("Reading the order and checking what is on the server already. Please wait."));
        break;
    case Phase::NoOrder:
        say(QStringLiteral("אין כאן הזמנה לשליחה."), QStringLiteral("There is no order to send here."));
        break;
    case Phase::NoServer:
        say(QStringLiteral("לא הוגדר שרת לקבלת הזמנות. ההזמנה שמורה במחשב זה. יש להודיע לחנות."),
            QStringLiteral("No server is set for orders. The order is kept on this computer. Please tell the shop."));
        break;
    case Phase::Countdown:
        say(QStringLiteral("ההזמנה מוכנה. השליחה תתחיל מעצמה בתום הספירה."),
            QStringLiteral("The order is ready. Sending begins by itself when the count ends."));
        break;
    case Phase::Stopped:
        say(QStringLiteral("המשלוח נעצר. כדי לשלוח יש ללחוץ על הלחצן המשך את המשלוח."),
            QStringLiteral("The sending is stopped. Press Continue the sending to send."));
        break;
    case Phase::Sending:
        say(QStringLiteral("ההזמנה נשלחת. נא לא לסגור את התוכנה."),
            QStringLiteral("The order is being sent. Please do not close the program."));
        break;
    case Phase::Verifying:
        say(QStringLiteral("בודקים אילו קבצים הגיעו לשרת. נא להמתין."),
            QStringLiteral("Checking which files have arrived. Please wait."));
        break;
    case Phase::Reporting:
        say(QStringLiteral("כל ההזמנה הגיעה. מודיעים לחנות, נא להמתין."),
            QStringLiteral("The whole order has arrived. Telling the shop, please wait."));
        break;
    case Phase::Success:
    case Phase::AllThere:
        say(QStringLiteral("כל ההזמנה הגיעה. אפשר לסגור או להתחיל הזמנה חדשה."),
            QStringLiteral("The whole order has arrived. You can close the program or begin a new order."));
        break;
    case Phase::NotAll:
        say(QStringLiteral("ההזמנה שמורה במחשב זה. יש להמתין מעט וללחוץ על הלחצן שלח שוב."),
            QStringLiteral("The order is kept on this computer. Wait a little, then press Send again."));
        break;
    }
}

void UploadForm::enter(Phase phase) {
    m_phase = phase;
    sending = phase == Phase::Sending || phase == Phase::Verifying || phase == Phase::Reporting;
    verifying = phase == Phase::Verifying;
    done = phase == Phase::Success || phase == Phase::AllThere;
    failed = phase == Phase::NotAll || phase == Phase::NoOrder || phase == Phase::NoServer;
    Command10.visible = phase == Phase::Stopped;
    Command28.visible = done || failed || phase == Phase::Stopped;
    Command3.visible = phase == Phase::Countdown || phase == Phase::Verifying || phase == Phase::NotAll;
    showWhatToDo();
    Q_EMIT changed();
}

bool UploadForm::idle() const {
    return !sending && !m_busy && !m_left;
}

void UploadForm::leavePage() {
    m_left = true;
    Timer1.stop();
    Timer2.stop();
}

void UploadForm::pump() {
    Q_EMIT changed();
    m_platform.pump.pump();
}

QString UploadForm::folderName() const {
    return OrderFolder::chosen(m_state).name();
}

QString UploadForm::siteAddress(const QString& rest) const {
    return m_state.profile.HttpHost + u'/' + m_state.profile.HttpTikiya + rest;
}

// The list that an earlier check has fetched into the folder is no part of the order: the server never lists it.
void UploadForm::BuildOrderFileList() {
    List4Kvazim.clear();
    const QString folder = m_state.transfer.OrderFolder.trimmed();
    if (folder.size() < shortestFolder)
        return;
    QStringList files = m_platform.files.collect(folder, Files::Depth::ThisFolder);
    files.removeIf(
        [](const QString& path) { return LeafName(path).compare(ListFileName(0), Qt::CaseInsensitive) == 0; });
    List4Kvazim.append(files);
}

void UploadForm::takeAllAsMissing() {
    List4Hossarim.clear();
    List4Hossarim.append(List4Kvazim.items());
}

void UploadForm::showMissingCount() {
    Label12.text = QString::number(List4Hossarim.count());
    Q_EMIT changed();
}

void UploadForm::startPanel() {
    Picture1.visible = Pic4Timer.visible = Picture5.visible = true;
    Picture1Width = 1;
    Label8.text = QString::number(countdownFrom);
    Label11.visible = false;
    Timer1.start();
    enter(Phase::Countdown);
}

void UploadForm::Command2_Click() {
    if (!idle())
        return;
    Timer1.stop();
    Timer2.stop();
    Picture6.visible = false;
    BuildOrderFileList();
    pump();
    Command4_Click();
}

void UploadForm::Command4_Click() {
    if (!idle())
        return;
    if (m_state.profile.HttpHost.isEmpty() || List4Kvazim.isEmpty()) {
        enter(List4Kvazim.isEmpty() ? Phase::NoOrder : Phase::NoServer);
        return;
    }
    m_busy = true;
    Image5.visible = false;
    enter(Phase::Checking);
    const ServerVerdict verdict = CheckOrderOnServer(0);
    m_busy = false;
    if (m_left)
        return;
    if (verdict != ServerVerdict::Listed)
        takeAllAsMissing();
    showMissingCount();
    if (!List4Hossarim.isEmpty()) {
        startPanel();
        return;
    }
    Label11.visible = true;
    Pic4Timer.visible = Image4.visible = Picture5.visible = false;
    Picture1.visible = true;
    Timer1.stop();
    enter(Phase::AllThere);
}

void UploadForm::Timer1_Tick() {
    if (m_platform.pump.pumping())
        return;
    if (!idle()) {
        Timer1.stop();
        return;
    }
    if (Picture1Width < Picture1FullWidth) {
        Picture1Width = std::min(Picture1Width + panelStep, Picture1FullWidth);
        Q_EMIT changed();
        return;
    }
    Timer1.stop();
    Label8.text = QString::number(countdownFrom);
    if (!List4Hossarim.isEmpty())
        Timer2.start();
    Q_EMIT changed();
}

void UploadForm::Timer2_Tick() {
    if (m_platform.pump.pumping())
        return;
    if (!idle()) {
        Timer2.stop();
        return;
    }
    const int left = static_cast<int>(Val(Label8.text));
    if (left >= 1) {
        Label8.text = QString::number(left - 1);
        Q_EMIT changed();
        return;
    }
    Timer2.stop();
    HttpAttempts();
}

void UploadForm::Command3_Click() {
    if (!idle() || !Command3.visible)
        return;
    Timer1.stop();
    Timer2.stop();
    Picture1.visible = Pic4Timer.visible = Picture5.visible = Image5.visible = false;
    enter(Phase::Stopped);
}

void UploadForm::Command10_Click() {
    if (idle() && m_phase == Phase::Stopped)
        startPanel();
}

void UploadForm::Image5_Click() {
    if (idle() && m_phase == Phase::NotAll)
        HttpAttempts();
}

// An order that has not gone stays in its folder and is found among the finished ones.
void UploadForm::Command28_Click() {
    if (!idle())
        return;
    m_chain.follow(PageId::UploadForm, Outcome::NewOrderWanted);
}

void UploadForm::Image3_Click() {
    leavePage();
    m_chain.endProgram();
}

} // namespace lumora
