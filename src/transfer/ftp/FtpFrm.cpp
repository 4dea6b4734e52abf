#include "transfer/ftp/FtpFrm.h"

#include "common/FixedText.h"
#include "platform/Dialogs.h"
#include "session/PageChain.h"
#include "transfer/http/UploadRoom.h"

#include <QTimer>

namespace lumora {

namespace {

const QString filesToSend = QStringLiteral("*.gbr;*.jpp;*.prk");
constexpr int countdownTick = 1000;
constexpr int blinkTick = 500;
// Below this the countdown is over.
constexpr int countdownEnd = 2;

} // namespace

FtpFrm::FtpFrm(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::FtpFrm)
    , File1(platform.files, filesToSend)
    , Timer1(countdownTick, [this] { Timer1_Tick(); })
    , Timer2(blinkTick, [this] { Timer2_Tick(); })
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_room(std::make_unique<UploadRoom>(*this, state, platform, [this] { Q_EMIT changed(); })) {
    // The page acts once it is in front, so that what it does is seen; made alone it sends nothing.
    connect(&chain, &PageChain::shown, this, [this](Page* page) {
        if (page == this)
            QTimer::singleShot(0, this, &FtpFrm::activateWhenFree);
    });
    // The window may be closed, and the page unloaded, while a pass runs inside a pump: it must not go on unseen.
    connect(&chain, &PageChain::ended, this, &FtpFrm::leavePage);
    connect(&chain, &PageChain::unloaded, this, [this](Page* page) {
        if (page == this)
            leavePage();
    });
}

FtpFrm::~FtpFrm() = default;

void FtpFrm::load() {
    chkPassive.checked = true;
    optBin.checked = true;
    Label33.text = Label20.text = QStringLiteral("15");
    Image10.visible = true;
    Image11.visible = false;
    Command10.visible = false;
    Command28.visible = false;
    Command15.enabled = Command21.enabled = false;
    Command22.visible = m_state.transfer.SugMishloah == Sending::Chain;
    Label15.visible = Label4Ktovet.visible = false;
    Label4DiffTitle.visible = Label4Diff.visible = m_state.transfer.Mefurak == Travel::Pieces;
    Label4Reason.visible = false;
    Picture1.visible = false;
    m_room->session.FtpEnableControls(false);
    Timer2.start();
}

// Inside the pump of a page that still hands over, clicks would not get through to this one.
void FtpFrm::activateWhenFree() {
    if (m_platform.pump.pumping())
        QTimer::singleShot(20, this, &FtpFrm::activateWhenFree);
    else
        Form_Activate();
}

void FtpFrm::Form_Activate() {
    if (m_activated)
        return;
    m_activated = true;
    AllDone = 0;
    if (m_state.KodMishloach == QStringLiteral("HOM")) {
        Label15.visible = Label4Ktovet.visible = true;
        Label4Ktovet.text = m_state.shemot.n3;
    }
    m_room->session.takeSettings();
    m_room->desk.pump();
    m_room->session.PauseBar(3);
    if (m_room->desk.left)
        return;
    if (m_state.transfer.SugMishloah == Sending::NewOrder)
        Command13_Click();
    else if (m_state.transfer.SugMishloah == Sending::Resend)
        Command1_Click();
    else
        enter(Phase::NoOrder);
}

void FtpFrm::setTexts() {
    setButtonTexts();
    setPanelTexts();
    showWhatToDo();
    Q_EMIT changed();
}

void FtpFrm::setButtonTexts() {
    const auto set = [this](Caption& control, const QString& hebrew, const QString& english) {
        control.text = m_state.wording(hebrew, english);
    };
    set(Command12, QStringLiteral("שלח "), QStringLiteral("Send "));
    set(Command10, QStringLiteral("שלח שוב"), QStringLiteral("Send again"));
    set(Command28, QStringLiteral("הזמנה חדשה"), QStringLiteral("New order"));
    set(Command15, QStringLiteral("עצור"), QStringLiteral("Stop"));
    Command21.text = QStringLiteral("Stop");
    if (m_phase == Phase::Waiting)
        set(Command23, QStringLiteral("המשך"), QStringLiteral("Go on"));
    else
        set(Command23, QStringLiteral("עצור משלוח"), QStringLiteral("Stop sending"));
    set(Command18, QStringLiteral("עצור ספירה"), QStringLiteral("Stop the count"));
    set(Command11, QStringLiteral("יציאה"), QStringLiteral("Exit"));
    set(Command8, QStringLiteral("יציאה"), QStringLiteral("Exit"));
    set(Command14, QStringLiteral("לא לסגור"), QStringLiteral("Do not close"));
    set(Command16, QStringLiteral("סגור את התוכנה למרות שלא נשלחו התמונות"),
        QStringLiteral("Close the program although the pictures were not sent"));
    set(Command22, QStringLiteral("במקרה של תקלה בתקשורת לחץ כאן"),
        QStringLiteral("In case of a communication fault press here"));
    set(Command24, QStringLiteral("הצג יותר פרטים"), QStringLiteral("Show more details"));
    set(Command9, QStringLiteral("הסתר פרטים"), QStringLiteral("Hide details"));
    set(Image3, QStringLiteral("סגור"), QStringLiteral("Close"));
    set(Image4, QStringLiteral("פתח את תיקיית ההזמנה"), QStringLiteral("Open the order folder"));
    set(Image5, QStringLiteral("שלח עכשיו"), QStringLiteral("Send now"));
    set(Command13, QStringLiteral("לפני שליחה"), QStringLiteral("Before sending"));
    set(Command1, QStringLiteral("משלוח חוזר"), QStringLiteral("Resend"));
    set(Command2, QStringLiteral("מילוי ושליחה"), QStringLiteral("Refill and send"));
    set(Command4, QStringLiteral("שליחה בסבבים"), QStringLiteral("Send in rounds"));
    Command3.text = QStringLiteral("put");
    Command5.text = QStringLiteral("get");
    Command6.text = QStringLiteral("del");
    Command7.text = QStringLiteral("make dir");
    Command17.text = QStringLiteral("SendOneOrder");
    Command19.text = QStringLiteral("All Orders");
    Command25.text = QStringLiteral("BdikaAfterUploadB");
    Command27.text = QStringLiteral("Copy");
    txtProxy.hint = QStringLiteral("TIS Compatible Proxy (No CERN):");
}

void FtpFrm::setPanelTexts() {
    const auto set = [this](Caption& control, const QString& hebrew, const QString& english) {
        control.text = m_state.wording(hebrew, english);
    };
    set(Label15, QStringLiteral("רשום לפננו שבקשת לקבל את התמונות המודפסות במשלוח לביתך"),
        QStringLiteral("We have noted that you asked to get the printed pictures by delivery to your home"));
    set(Label4Nichshal, QStringLiteral("המחשב לא הצליח להעלות "), QStringLiteral("The computer failed to upload "));
    set(Label4Mitoch, QStringLiteral("קבצים מתוך "), QStringLiteral("files out of "));
    set(Label4Yooadoo, QStringLiteral(" קבצים שיועדו למשלוח "), QStringLiteral(" files meant for sending "));
    set(Label4Hamtana, QStringLiteral("מומלץ להמתין 30 שניות ואז ללחוץ על הלחצן  שלח שוב"),
        QStringLiteral("It is advised to wait 30 seconds and then press Send again"));
    set(Label9, QStringLiteral("ההזמנה שמורה במחשב זה, וקבצים שכבר הגיעו לשרת לא יישלחו שוב."),
        QStringLiteral("The order is kept on this computer, and files that have arrived are not sent again."));
    set(Label4DiffTitle, QStringLiteral("זמן משוער שנותר לסיום המשלוח"),
        QStringLiteral("Estimated time left to the end of the sending"));
    set(Picture7,
        QStringLiteral("שים לב !!\rהתמונות עדיין לא נשלחו ברשת\rאם תסגור את התוכנה כעת \rיתכן ולא כל התמונות יודפסו"),
        QStringLiteral("Please note!\rThe pictures have not been sent yet.\rIf you close the program now,\rperhaps not "
                       "all pictures will be printed."));
}

void FtpFrm::showWhatToDo() {
    QString& text = Label4Do.text;
    switch (m_phase) {
    case Phase::Preparing:
        text = m_state.wording(QStringLiteral("קוראים את ההזמנה. נא להמתין."),
                               QStringLiteral("Reading the order. Please wait."));
        break;
    case Phase::NoServer:
        text = m_state.wording(QStringLiteral("לא הוגדר שרת לקבלת הזמנות. ההזמנה שמורה במחשב זה. יש להודיע לחנות."),
                               QStringLiteral("No server is set for orders. The order is kept on this computer. Please "
                                              "tell the shop."));
        break;
    case Phase::NoOrder:
        text =
            m_state.wording(QStringLiteral("אין כאן הזמנה לשליחה."), QStringLiteral("There is no order to send here."));
        break;
    case Phase::Countdown:
        text = m_state.wording(QStringLiteral("ההזמנה מוכנה. השליחה תתחיל מעצמה בתום הספירה."),
                               QStringLiteral("The order is ready. Sending begins by itself when the count ends."));
        break;
    case Phase::Waiting:
        text = m_state.wording(QStringLiteral("הספירה נעצרה. כדי לשלוח יש ללחוץ על הלחצן שלח עכשיו."),
                               QStringLiteral("The count is stopped. Press Send now to send."));
        break;
    case Phase::Sending:
        text = m_state.wording(QStringLiteral("ההזמנה נשלחת. נא לא לסגור את התוכנה."),
                               QStringLiteral("The order is being sent. Please do not close the program."));
        break;
    case Phase::Checking:
        text = m_state.wording(QStringLiteral("בודקים אילו קבצים הגיעו לשרת. נא להמתין."),
                               QStringLiteral("Checking which files have arrived. Please wait."));
        break;
    case Phase::Reporting:
        text = m_state.wording(QStringLiteral("כל ההזמנה הגיעה. מודיעים לחנות, נא להמתין."),
                               QStringLiteral("The whole order has arrived. Telling the shop, please wait."));
        break;
    case Phase::Success:
        text = m_state.wording(QStringLiteral("כל ההזמנה הגיעה. אפשר לסגור או להתחיל הזמנה חדשה."),
                               QStringLiteral("The whole order has arrived. You can close, or begin a new order."));
        break;
    case Phase::NotAll:
        text = m_state.wording(QStringLiteral("מומלץ להמתין 30 שניות ואז ללחוץ על הלחצן שלח שוב."),
                               QStringLiteral("Wait 30 seconds, then press Send again."));
        break;
    case Phase::Stopped:
        text = m_state.wording(QStringLiteral("השליחה נעצרה. כדי להמשיך יש ללחוץ על הלחצן שלח שוב."),
                               QStringLiteral("Sending was stopped. Press Send again to go on."));
        break;
    case Phase::Silent:
        text = silentEndText();
        break;
    }
}

// The counts differ and yet the verification has no verdict.
QString FtpFrm::silentEndText() const {
    const bool all = m_room->check.missing().isEmpty() && m_room->check.NumOnServer > NumToSend;
    return (all ? m_state.wording(QStringLiteral("כל %2 הקבצים של משלוח זה נמצאים בשרת, ובתיקייה שם %1 קבצים. אין צורך "
                                                 "לשלוח שוב. יש להודיע על כך לחנות."),
                                  QStringLiteral("All %2 files of this sending are on the server, whose folder holds "
                                                 "%1. There is no need to send again. Please tell the shop."))
                : m_state.wording(QStringLiteral("הגיעו %1 מתוך %2 קבצים. כדי לבדוק ולשלוח שוב יש ללחוץ על הלחצן שלח "
                                                 "שוב. אם זה חוזר, יש להודיע לחנות."),
                                  QStringLiteral("%1 of %2 files have arrived. Press Send again to check and send once "
                                                 "more. If this comes again, please tell the shop.")))
        .arg(m_room->check.NumOnServer)
        .arg(NumToSend);
}

void FtpFrm::enter(Phase phase) {
    m_phase = phase;
    sending = phase == Phase::Sending || phase == Phase::Checking || phase == Phase::Reporting;
    Command15.enabled = Command21.enabled = phase == Phase::Sending || phase == Phase::Checking;
    const bool nothing = phase == Phase::NoOrder || phase == Phase::NoServer;
    const bool resumable = phase == Phase::NotAll || phase == Phase::Stopped || phase == Phase::Silent;
    Image5.visible = !nothing && phase != Phase::Success;
    Command23.visible = !nothing;
    // The order stays in its folder, so that what is missing can be sent.
    Command10.visible = resumable;
    Command28.visible = nothing || resumable || phase == Phase::Success;
    setButtonTexts();
    showWhatToDo();
    Q_EMIT changed();
}

void FtpFrm::stopTimers() {
    Timer2.stop();
    Timer1.stop();
}

void FtpFrm::Timer1_Tick() {
    if (sending || AllDone == 1 || m_room->desk.left) {
        Timer1.stop();
        return;
    }
    if (m_platform.pump.pumping())
        return;
    const int left = static_cast<int>(Val(Label33.text));
    Label33.text = Label20.text = QString::number(left - 1);
    Q_EMIT changed();
    if (left >= countdownEnd)
        return;
    stopTimers();
    if (Pic4Quik.visible)
        Command19_Click();
    else
        Command12_Click();
}

void FtpFrm::Timer2_Tick() {
    Image10.visible = !Image10.visible;
    Image11.visible = !Image10.visible;
    Q_EMIT changed();
}

void FtpFrm::Command23_Click() {
    if (sending || AllDone == 1 || List4Makor.isEmpty())
        return;
    if (Timer1.running()) {
        Timer1.stop();
        enter(Phase::Waiting);
    } else {
        Timer1.start();
        enter(Phase::Countdown);
    }
}

void FtpFrm::Command18_Click() {
    if (!Timer1.running())
        return;
    Timer1.stop();
    enter(Phase::Waiting);
}

void FtpFrm::Command15_Click() {
    if (m_phase != Phase::Sending && m_phase != Phase::Checking)
        return;
    m_room->desk.StopFlag = true;
    Command15.enabled = Command21.enabled = false;
    const QString stopping =
        m_state.wording(QStringLiteral("נעצר לאחר הקובץ הנוכחי"), QStringLiteral("Stopping after the present file"));
    Label4Do.text = stopping; // the status line goes on with what happens meanwhile
    m_room->desk.status(stopping);
}

void FtpFrm::Command21_Click() {
    Command15_Click();
}

void FtpFrm::Command10_Click() {
    if (sending || AllDone == 1 || m_phase == Phase::Preparing)
        return;
    m_room->pass.UserStopped = 0;
    List3.clear();
    if (!List4Makor.isEmpty())
        List3.append(List4Makor.items());
    Image5_Click();
}

void FtpFrm::Image5_Click() {
    if (sending || AllDone == 1 || m_phase == Phase::Preparing)
        return;
    stopTimers();
    m_room->session.RoundNo = 0;
    Command12_Click();
}

void FtpFrm::leaveProgram() {
    leavePage();
    m_chain.endProgram();
}

void FtpFrm::leavePage() {
    m_room->desk.left = true;
    stopTimers();
    // A pass that is under way may stand in a call of the session; it closes at its next step.
    if (!sending)
        m_room->session.closeSession();
}

void FtpFrm::Image3_Click() {
    if (AllDone == 1) {
        leaveProgram();
        return;
    }
    Timer1.stop();
    Picture7.visible = true;
    Q_EMIT changed();
}

void FtpFrm::Command14_Click() {
    Picture7.visible = false;
    // After a stop or a failure nothing goes out until the customer says so.
    if (m_phase == Phase::Countdown || m_phase == Phase::Waiting) {
        Timer1.start();
        enter(Phase::Countdown);
    }
    Q_EMIT changed();
}

void FtpFrm::Command16_Click() {
    leaveProgram();
}

void FtpFrm::Command11_Click() {
    leaveProgram();
}

void FtpFrm::Command8_Click() {
    leaveProgram();
}

void FtpFrm::Command28_Click() {
    if (sending)
        return;
    m_chain.follow(PageId::FtpFrm, Outcome::NewOrderWanted);
}

void FtpFrm::Image4_Click() {
    Command12.enabled = false;
    m_platform.shell.copyToClipboard({});
    m_platform.shell.copyToClipboard(m_state.MisparHazmana);
    if (m_platform.files.folderExists(m_state.transfer.OrderFolder))
        m_platform.shell.openFolder(m_state.transfer.OrderFolder);
    Q_EMIT changed();
}

void FtpFrm::Command24_Click() {
    Frame2.visible = true;
    Q_EMIT changed();
}

void FtpFrm::Command9_Click() {
    Frame2.visible = false;
    Q_EMIT changed();
}

} // namespace lumora
