#include "transfer/http/UploadForm.h"

#include "order/OrderFolder.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int panelTick = 1;
constexpr int httpSecond = 1000;
constexpr int panelStep = 6;
constexpr int httpCountFrom = 5;
// The count ends one second after it shows 0.
constexpr int httpCountEnd = 0;

} // namespace

UploadForm::UploadForm(SessionState& state, const Platform& platform, PageChain& chain)
    : SendingPage(PageId::UploadForm, state, platform, chain, *this, Countdown(httpCountFrom, httpCountEnd))
    , Timer1(panelTick, [this] { growPanel(); })
    , Timer2(httpSecond, [this] { countSecond(); })
    , Timer4Line(httpSecond, [this] { watchLine(); })
    , m_sender(state, platform, *this) {
    showAnswers();
}

void UploadForm::begin() {
    Timer4Line.start();
    refreshList();
}

bool UploadForm::idle() const {
    return !isUnderWay(phase()) && !m_busy && !m_sender.stop.left;
}

void UploadForm::leave() {
    m_sender.leave();
    stopTimers();
    Timer4Line.stop();
}

void UploadForm::stopTimers() {
    Timer1.stop();
    Timer2.stop();
}

void UploadForm::startPanel() {
    if (isAnswerAwaited()) {
        enter(SendingPhase::Waiting);
        return;
    }
    Picture1.visible = Pic4Timer.visible = Picture5.visible = true;
    Picture1Width = 1;
    m_countdown.restart();
    Timer1.start();
    enter(SendingPhase::Countdown);
}

void UploadForm::refreshList() {
    if (!idle())
        return;
    stopTimers();
    Picture6.visible = false;
    m_sender.BuildOrderFileList();
    m_sender.stop.StopFlag = false;
    // The server is not asked: the lab may have removed the order's files.
    if (m_sender.onlyReportIsLeft()) {
        if (m_sender.report.endWhereLeft() == SendingPhase::Success)
            succeed();
        else
            endAllThere();
        return;
    }
    m_busy = true;
    Q_EMIT changed();
    m_platform.pump.pump();
    m_busy = false;
    if (m_sender.stop.StopFlag && !m_sender.stop.left)
        enter(SendingPhase::Stopped);
    else
        findMissing();
}

void UploadForm::findMissing() {
    if (!idle())
        return;
    if (lists().List4Kvazim.isEmpty()) {
        enter(SendingPhase::NoOrder);
        return;
    }
    if (m_state.profile.HttpHost.isEmpty()) {
        enter(SendingPhase::NoServer);
        return;
    }
    const bool mayGo = mayBeSent(lists().List4Kvazim.items());
    if (m_sender.stop.left)
        return;
    if (!mayGo) {
        enter(SendingPhase::Refused);
        return;
    }
    m_busy = true;
    forgetReason();
    enter(SendingPhase::Preparing);
    const std::optional<SendingPhase> end = m_sender.findMissing();
    m_busy = false;
    if (m_sender.stop.left)
        return;
    if (end) {
        endIncomplete(*end);
        return;
    }
    if (!lists().List4Hossarim.isEmpty()) {
        startPanel();
        return;
    }
    stopTimers();
    Pic4Timer.visible = Image4.visible = Picture5.visible = false;
    if (m_sender.keepFoundThere()) {
        succeed();
        return;
    }
    endAllThere();
}

void UploadForm::growPanel() {
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
    if (!lists().List4Hossarim.isEmpty())
        Timer2.start();
    Q_EMIT changed();
}

void UploadForm::countSecond() {
    if (m_platform.pump.pumping())
        return;
    if (!idle() || phase() != SendingPhase::Countdown) {
        Timer2.stop();
        return;
    }
    const bool over = m_countdown.tick();
    showCount();
    Q_EMIT changed();
    if (!over)
        return;
    Timer2.stop();
    sendMissing();
}

void UploadForm::stopSending() {
    if ((m_busy && phase() == SendingPhase::Preparing) || isUnderWay(phase()))
        m_sender.stopNow();
}

void UploadForm::stopCount() {
    if (!idle() || phase() != SendingPhase::Countdown)
        return;
    stopTimers();
    keepHeld(true);
    enter(SendingPhase::Waiting);
}

void UploadForm::endCount() {
    if (idle() && phase() == SendingPhase::Countdown)
        sendMissing();
}

void UploadForm::goOn() {
    if (idle() && phase() == SendingPhase::Waiting) {
        keepHeld(false);
        startPanel();
    } else if (phase() == SendingPhase::Stopped)
        refreshList(); // the server is asked for what has arrived until the stop
}

void UploadForm::sendAgain() {
    if (phase() != SendingPhase::NotAll)
        return;
    if (m_sender.endedEarly())
        refreshList();
    else
        sendMissing();
}

void UploadForm::sendMissing() {
    if (!idle() || lists().List4Hossarim.isEmpty())
        return;
    stopTimers();
    Picture1.visible = Pic4Timer.visible = Picture5.visible = false;
    forgetReason();
    const std::optional<SendingPhase> end = m_sender.HttpAttempts();
    if (!end)
        return;
    Label4File.text.clear();
    m_sender.keepArrival(*end);
    switch (*end) {
    case SendingPhase::Success:
        succeed();
        return;
    case SendingPhase::AllThere:
        endAllThere();
        return;
    case SendingPhase::NumberTaken:
        prepareOrderAgain();
        return;
    default:
        endIncomplete(*end);
    }
}

void UploadForm::endIncomplete(SendingPhase end) {
    m_attemptFailed = end == SendingPhase::NotAll && !m_sender.endedEarly();
    showAttemptsOver();
    Label9.visible = Pic4Hamten.visible = false;
    enter(end);
}

void UploadForm::prepareOrderAgain() {
    const auto isTaken = [this](const QString& name) { return m_sender.hasFolder(name); };
    if (SendingPage::prepareAgain(*m_sender.journal(), isTaken) || m_sender.stop.left)
        return;
    if (m_sender.stop.StopFlag) {
        endIncomplete(SendingPhase::Stopped);
        return;
    }
    const bool sentBefore = m_sender.journal()->state().phase >= OrderState::Phase::Sending;
    tellReason(sentBefore ? LineStep::FolderLost : LineStep::ForeignFolder, {Failure::Kind::InUse, m_orderName}, {});
    endIncomplete(SendingPhase::CallLab);
}

void UploadForm::endAllThere() {
    Label1.text.clear();
    m_attemptFailed = false;
    m_lacking = m_sender.lacking();
    forgetReason();
    if (m_sender.report.isDueAsAgreed() && !tellOfArrival())
        return;
    Picture1.visible = true;
    enter(SendingPhase::AllThere);
}

// A stop pressed at the end of the sending must not cut the report. False where the customer has left.
bool UploadForm::tellOfArrival() {
    m_sender.stop.StopFlag = false;
    percent = 100;
    Label7.text = u"100"_s;
    caption = u"100%"_s;
    PicSargel1Width = PicSargel2Width;
    enter(SendingPhase::Reporting);
    m_sender.HttpPause(2);
    if (!m_sender.stop.left)
        tellLab();
    return !m_sender.stop.left;
}

void UploadForm::succeed() {
    Label1.text.clear();
    m_attemptFailed = false;
    m_lacking.reset();
    forgetReason();
    if (!tellOfArrival())
        return;
    Label9.visible = Pic4Hamten.visible = Picture1.visible = false;
    Picture6.visible = true;
    enter(SendingPhase::Success);
}

void UploadForm::leaveForAnother() {
    if (idle())
        leaveForNewOrder();
}

} // namespace lumora
