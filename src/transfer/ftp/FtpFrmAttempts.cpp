// The sending itself: up to four attempts, each a pass and a check of what arrived.
#include "platform/Dialogs.h"
#include "session/PageChain.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/http/UploadRoom.h"
#include "transfer/report/InetForm.h"

#include <array>

namespace lumora {

namespace {

constexpr int attempts = 4;

struct AttemptTitle {
    QString hebrew;
    QString english;
};

const std::array<AttemptTitle, attempts>& attemptTitles() {
    static const std::array<AttemptTitle, attempts> titles = {{
        {},
        {QStringLiteral("נסיון שני לקבצים שלא עלו"), QStringLiteral("Second attempt for the files that did not go up")},
        {QStringLiteral("נסיון שלישי לקבצים שלא עלו"),
         QStringLiteral("Third attempt for the files that did not go up")},
        {QStringLiteral("נסיון רביעי ואחרון להעלות קבצים שלא עלו"),
         QStringLiteral("Fourth and last attempt to upload the files that did not go up")},
    }};
    return titles;
}

} // namespace

void FtpFrm::Command12_Click() {
    if (sending || AllDone == 1 || m_phase == Phase::Preparing || m_room->desk.left)
        return;
    enter(Phase::Sending);
    const Phase end = RunAttempts();
    if (m_room->desk.left) {
        m_room->session.closeSession();
        return;
    }
    finish(end);
    if (end == Phase::Success || end == Phase::NotAll)
        Command26_Click();
}

FtpFrm::Phase FtpFrm::RunAttempts() {
    UploadRoom& room = *m_room;
    room.pass.UserStopped = 0;
    Label34.text.clear();
    Label4Reason.text.clear();
    Label4Reason.visible = false;
    Label34.visible = true;
    for (int attempt = 1; attempt <= attempts; ++attempt) {
        if (attempt > 1) {
            const AttemptTitle& title = attemptTitles()[static_cast<std::size_t>(attempt - 1)];
            Label34.text = m_state.wording(title.hebrew, title.english);
        }
        enter(Phase::Sending);
        stopTimers();
        room.pass.run();
        if (room.desk.left)
            return Phase::Silent;
        if (room.pass.UserStopped == 1)
            return Phase::Stopped;
        enter(Phase::Checking);
        room.session.PauseBar();
        if (attempt == 1) {
            if (List3.count() < List4Makor.count()) {
                List3.clear();
                List3.append(List4Makor.items());
            }
            if (List3.isEmpty()) {
                m_platform.dialogs.message(QStringLiteral("list3 is empty"));
                return Phase::NoOrder;
            }
        }
        const bool arrived = checkAttempt(attempt);
        if (room.desk.left)
            return Phase::Silent;
        // A stop cuts the check short; what it still saw itself counts.
        if (room.desk.StopFlag && !(arrived && room.check.freshCount)) {
            room.pass.tellStopped();
            return Phase::Stopped;
        }
        if (attempt == attempts && room.check.NumOnServer <= NumToSend)
            Image6.visible = true;
        if (arrived) {
            SendSuccess();
            return Phase::Success;
        }
        if (room.check.NumOnServer < NumToSend) {
            // Every name is there and yet the count is short: the order holds one name twice. There is nothing to send
            // again.
            if (List3.isEmpty())
                return Phase::Silent;
            showNotAll();
        }
    }
    if (room.check.NumOnServer > NumToSend)
        return Phase::Silent;
    showFailure();
    return Phase::NotAll;
}

// The check of an attempt. True when all has arrived; else List3 holds what is missing, unless the server holds too
// many names.
bool FtpFrm::checkAttempt(int attempt) {
    UploadCheck& check = m_room->check;
    check.check(attempt);
    if (check.NumOnServer < NumToSend && !m_room->desk.left) {
        // A second look, since the first may have failed and counted an older listing.
        check.ListServerFiles();
        if (check.NumOnServer < NumToSend)
            check.RebuildMissing();
    }
    return check.NumOnServer == NumToSend;
}

void FtpFrm::showNotAll() {
    Picture6.visible = true;
    Label12.text = QString::number(NumToSend);
    Label31.text = QString::number(List9.count());
    Label4Missing.text = QString::number(m_room->check.missing().size());
    m_room->desk.status(
        m_state.wording(QStringLiteral("לא כל הקבצים הועלו"), QStringLiteral("Not all the files were uploaded")));
}

void FtpFrm::showFailure() {
    showNotAll();
    Label2.visible = true;
    Label9.visible = true;
    Label4Reason.visible = false; // said in Label2
    Label2.text = Label4Reason.text.isEmpty()
                      ? m_state.wording(QStringLiteral("חלק מהקבצים לא הגיעו לשרת."),
                                        QStringLiteral("Some of the files did not arrive at the server."))
                      : Label4Reason.text;
    Label33.text = Label20.text = QStringLiteral("10");
}

void FtpFrm::SendSuccess() {
    AllDone = 1;
    enter(Phase::Reporting);
    for (Caption* control : {&Frame9, &Picture1, &Label2, &Label6, &Label7, &Label8, &Image10, &Image11, &Frame5})
        control->visible = false;
    File1Enabled.enabled = false;
    Command15.enabled = false;
    Command11.enabled = true;
    m_room->desk.status(m_state.wording(QStringLiteral(" מיד מסיימים "), QStringLiteral(" Finishing at once ")));
    m_room->desk.captionFollowsStatus();
    m_room->desk.pump();
    if (m_state.profile.ReportOn > 0 && m_chain.isRegistered(PageId::InetForm)) {
        auto& reports = m_chain.load<InetForm>();
        reports.Command1_Click();
        reports.Command2_Click();
    }
    pageSize = PageSize::Full;
    Label4Reason.text.clear();
    Label4Reason.visible = false;
    m_room->desk.status(
        m_state.wording(QStringLiteral("הקבצים הועלו בהצלחה"), QStringLiteral("The files were uploaded successfully")));
    m_room->desk.captionFollowsStatus();
    Command12.enabled = false;
    Picture2.visible = true;
    Image4.visible = false;
    percent = 100;
    PicInProgWidth = Pic4ProgWidth;
    LabelProg.text = QStringLiteral("100  %");
}

void FtpFrm::finish(Phase phase) {
    pageSize = PageSize::Full;
    Label4File.text.clear();
    Picture1.visible = false;
    File1Enabled.enabled = phase != Phase::Success;
    if (phase == Phase::Success) {
        Picture7.visible = false; // its warning no longer holds
        Label34.visible = false;
    }
    if (phase == Phase::NotAll) {
        Command12.visible = true;
        Command12.enabled = false;
    }
    enter(phase);
}

} // namespace lumora
