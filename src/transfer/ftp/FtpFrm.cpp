#include "transfer/ftp/FtpFrm.h"

#include "order/OrderJournal.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "transfer/report/InetForm.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int countdownTick = 1000;
constexpr int blinkTick = 500;
constexpr int countdownFrom = 15;
// The count ends when its last second begins.
constexpr int countdownEnd = 1;
constexpr int secondsAfterFailure = 10;

} // namespace

FtpFrm::FtpFrm(SessionState& state, const Platform& platform, PageChain& chain)
    : SendingPage(PageId::FtpFrm, state, platform, chain, *this, Countdown(countdownFrom, countdownEnd))
    , m_files(platform.files)
    , Timer1(countdownTick, [this] { countSecond(); })
    , Timer2(blinkTick, [this] { blink(); })
    , Timer4Line(countdownTick, [this] { watchLine(); })
    , m_sender(state, platform, *this) {}

void FtpFrm::load() {
    chkPassive.checked = true;
    optBin.checked = true;
    Command22.visible = m_state.transfer.SugMishloah == Sending::Chain;
    FtpEnableControls(false);
    showSeconds();
    Timer2.start();
    Timer4Line.start();
}

void FtpFrm::begin() {
    if (m_state.KodMishloach == u"HOM"_s) {
        Label15.visible = Label4Ktovet.visible = true;
        Label4Ktovet.text = m_state.shemot.n3;
    }
    m_sender.session.takeSettings();
    m_platform.pump.pump();
    m_sender.session.PauseBar(3);
    if (m_sender.stop.left)
        return;
    if (m_state.transfer.SugMishloah == Sending::NewOrder)
        beginNewOrder();
    else if (m_state.transfer.SugMishloah == Sending::Resend)
        beginResend();
    else
        enter(SendingPhase::NoOrder);
}

bool FtpFrm::inPieces() const {
    return m_state.transfer.Mefurak == Travel::Pieces;
}

bool FtpFrm::busy() const {
    return isUnderWay(phase()) || m_byHand;
}

// The start controls do nothing during a sending, before the order is listed and after all has arrived.
bool FtpFrm::canSend() const {
    return !busy() && !hasArrived(phase()) && phase() != SendingPhase::Preparing && !m_sender.stop.left &&
           !isAnswerAwaited();
}

void FtpFrm::stopTimers() {
    Timer2.stop();
    Timer1.stop();
}

void FtpFrm::showSeconds() {
    Label33.text = Label20.text = QString::number(countdown().seconds());
}

void FtpFrm::showSecondsAfterFailure() {
    m_countdown.set(secondsAfterFailure);
    showSeconds();
}

void FtpFrm::countSecond() {
    if (!canSend()) {
        Timer1.stop();
        return;
    }
    if (m_platform.pump.pumping())
        return;
    const bool over = m_countdown.tick();
    showSeconds();
    Q_EMIT changed();
    if (!over)
        return;
    stopTimers();
    sendOrder();
}

void FtpFrm::blink() {
    Image10.visible = !Image10.visible;
    Image11.visible = !Image10.visible;
    Q_EMIT changed();
}

void FtpFrm::startCount() {
    if (isAnswerAwaited()) {
        enter(SendingPhase::Waiting);
        return;
    }
    Timer1.start();
    enter(SendingPhase::Countdown);
}

void FtpFrm::holdCount() {
    if (!Timer1.running())
        return;
    Timer1.stop();
    keepHeld(true);
    enter(SendingPhase::Waiting);
}

void FtpFrm::holdOrGoOn() {
    if (Timer1.running())
        holdCount();
    else if (canSend() && !lists().List4Makor.isEmpty()) {
        keepHeld(false);
        startCount();
    }
}

void FtpFrm::sendNow() {
    if (!canSend())
        return;
    stopTimers();
    m_sender.session.RoundNo = 0;
    sendOrder();
}

void FtpFrm::sendAgain() {
    if (!canSend())
        return;
    if (phase() == SendingPhase::Refused) {
        begin();
        return;
    }
    m_sender.pass.UserStopped = 0;
    m_sender.refill();
    sendNow();
}

void FtpFrm::sendOrder() {
    if (!canSend())
        return;
    const std::optional<SendingPhase> end = m_sender.RunAttempts();
    if (!end) {
        m_sender.session.closeSession();
        return;
    }
    if (*end == SendingPhase::NumberTaken) {
        prepareOrderAgain();
        return;
    }
    if (*end == SendingPhase::NotAll)
        showFailure();
    finish(*end);
    if (*end == SendingPhase::Success || *end == SendingPhase::NotAll)
        showProof();
}

void FtpFrm::stopSending() {
    if (!busy())
        return;
    m_sender.stopNow();
    Command15.enabled = Command21.enabled = false;
    const QString stopping = wording(u"עוצר את המשלוח", u"Stopping the sending");
    Label4Do.text = stopping; // the status line will change with the next event
    status(stopping);
}

void FtpFrm::showFailure() {
    Label2.visible = true;
    Label9.visible = true;
    Image6.visible = true;
    Label2.text = reason().isEmpty()
                      ? wording(u"חלק מהקבצים לא הגיעו לשרת.", u"Some of the files did not arrive at the server.")
                      : reason();
    forgetReason(); // Label2 shows it
    showSecondsAfterFailure();
}

// A stop pressed at the end of the sending must not cut the report.
void FtpFrm::tellOfArrival() {
    m_sender.stop.StopFlag = false;
    enter(SendingPhase::Reporting);
    status(wording(u" מיד מסיימים ", u" Finishing at once "));
    captionFollowsStatus();
    m_platform.pump.pump();
    tellLab();
}

void FtpFrm::succeed() {
    for (Caption* control : {&Frame9, &Picture1, &Label2, &Label6, &Label7, &Label8, &Image10, &Image11, &Frame5})
        control->visible = false;
    File1Enabled.enabled = false;
    tellOfArrival();
    if (m_sender.stop.left)
        return;
    forgetReason();
    status(wording(u"הקבצים הועלו בהצלחה", u"The files were uploaded successfully"));
    captionFollowsStatus();
    Command12.enabled = false;
    Picture2.visible = true;
    Image4.visible = false;
    percent = 100;
    PicInProgWidth = Pic4ProgWidth;
    LabelProg.text = u"100  %"_s;
    Picture7.visible = false; // nothing is left to warn about
}

void FtpFrm::finish(SendingPhase end) {
    m_sender.report.keepArrival(m_sender.arrival(end), end, m_sender.provenByNameOnly());
    showEnd(end);
}

void FtpFrm::showEnd(SendingPhase end) {
    m_lacking.reset();
    if (end == SendingPhase::AllThere && m_sender.report.isAsAgreed())
        m_lacking = m_sender.completeness();
    if (end == SendingPhase::Success)
        succeed();
    else if (end == SendingPhase::AllThere && m_sender.report.isDueAsAgreed())
        tellOfArrival();
    if (m_sender.stop.left)
        return;
    pageSize = PageSize::Full;
    Label4File.text.clear();
    Label34.visible = !hasArrived(end); // after success the number of attempts is of no interest
    Picture1.visible = false;
    File1Enabled.enabled = end != SendingPhase::Success;
    if (end == SendingPhase::NotAll) {
        Command12.visible = true;
        Command12.enabled = false;
    }
    enter(end);
}

void FtpFrm::leave() {
    m_sender.leave();
    stopTimers();
    Timer4Line.stop();
    // The session may be inside a call; what made the call closes it at its next step.
    if (!busy())
        m_sender.session.closeSession();
}

void FtpFrm::close() {
    if (hasArrived(phase()) || phase() == SendingPhase::Reporting) {
        leaveProgram();
        return;
    }
    Timer1.stop();
    Picture7.visible = true;
    Q_EMIT changed();
}

void FtpFrm::stay() {
    Picture7.visible = false;
    // After a stop or a failure only the customer starts the sending.
    if (phase() == SendingPhase::Countdown || phase() == SendingPhase::Waiting)
        startCount();
    Q_EMIT changed();
}

void FtpFrm::leaveForAnother() {
    if (!busy())
        leaveForNewOrder();
}

void FtpFrm::openOrderFolder() {
    if (m_state.closedToCustomers())
        return;
    Command12.enabled = false;
    m_platform.shell.copyToClipboard({});
    m_platform.shell.copyToClipboard(m_state.MisparHazmana);
    const DrivePath& folder = m_state.transfer.OrderFolder;
    if (m_platform.files.folderExists(folder))
        m_platform.shell.openFolder(folder, [&state = m_state, &platform = m_platform, folder] {
            if ((state.Careful || state.kiosk.on) && !state.closedToCustomers())
                platform.dialogs.message(
                    state
                        .wording(u"לא ניתן להציג כאן תיקיות. ההזמנה שמורה בתיקייה:\n%1",
                                 u"Folders can't be shown here. The order is kept in this folder:\n%1")
                        .arg(folder.text()));
        });
    Q_EMIT changed();
}

void FtpFrm::showLabArea(bool shown) {
    Frame2.visible = shown && m_state.mayOpenOperatorArea();
    Q_EMIT changed();
}

void FtpFrm::showProof() {
    if (!m_proofWanted || m_proofText.isEmpty())
        return;
    Picture13.visible = true;
    Picture13File = WorkspacePaths::summaryPicture(m_state);
    Q_EMIT changed();
}

void FtpFrm::FtpEnableControls(bool enable) {
    cmdClosehOpen.visible = enable;
    cmdInternetOpen.visible = txtProxy.visible = Label4Proxy.visible = !enable;
    showLabButtons();
}

bool FtpFrm::orderMayBeSent() {
    return SendingPage::mayBeSent(lists().List3.items()) && !m_sender.stop.left;
}

void FtpFrm::prepareOrderAgain() {
    const auto isTaken = [this](const QString& name) { return lists().List5.contains(name); };
    if (SendingPage::prepareAgain(*m_sender.session.journal(), isTaken))
        return;
    tellForeign();
    finish(SendingPhase::CallLab);
}

void FtpFrm::tellForeign() {
    failed(LineStep::ForeignFolder, {Failure::Kind::InUse, m_state.transfer.ShemTikiya}, {});
}

ReportCalls* FtpFrm::reportCalls() {
    return m_chain.isRegistered(PageId::InetForm) ? &m_chain.load<InetForm>() : nullptr;
}

} // namespace lumora
