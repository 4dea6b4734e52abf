// Shows the events of a sending by FTP in the page's controls and words.
#include "order/OrderFolder.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "transfer/delivery/UploadProgress.h"
#include "transfer/ftp/FtpFrm.h"

#include <algorithm>
#include <array>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The status line of a moment: its words, and on which side its number stands. With WholeFiles an order in pieces
// leaves the status line unchanged, since it would change with every piece.
struct StatusLine {
    enum class Number { None, First, Last };
    enum class Told { Always, WholeFiles };

    SendingMoment moment;
    SendingWords words;
    Number number = Number::None;
    Told told = Told::Always;
};

using enum StatusLine::Number;
using enum StatusLine::Told;

constexpr int mostBeforeTheEnd = 99; // per cent
constexpr double bytesOfMegabyte = 1e6;

constexpr std::array statusLines{
    StatusLine{SendingMoment::Opening, {u"  קשר ראשוני ", u"  First contact "}, Last, WholeFiles},
    StatusLine{SendingMoment::Connecting,
               {u"  נסיון ליצור קשר עם השרת  ", u"  Trying to reach the server  "},
               First,
               WholeFiles},
    StatusLine{SendingMoment::NotConnected,
               {u"אין תקשורת עם השרת לאחר מספר נסיונות", u"No contact with the server after several attempts: "},
               Last},
    StatusLine{SendingMoment::Connected, {u"יצר קשר עם השרת", u"Contact made with the server"}, None, WholeFiles},
    StatusLine{
        SendingMoment::InsideServer, {u"יוצר קשר בתוך השרת", u"Making contact inside the server"}, None, WholeFiles},
    StatusLine{SendingMoment::FolderMissing,
               {u"תקשורת נכשלה מנסה שוב להתקשר", u"Communication failed, trying to connect again"}},
    StatusLine{SendingMoment::CutOff, {u"נותק הקשר", u"The connection was cut"}},
    StatusLine{SendingMoment::OutsideFolder, {u"מחוץ לתיקייה הרצוייה", u"Outside the desired folder"}},
    StatusLine{SendingMoment::Continuing, {u"מיד ממשיך בהעברת קבצים", u"Continuing the transfer at once"}},
    StatusLine{SendingMoment::Ready, {u"מתכונן להעברת קבצים", u"Preparing to transfer files"}},
    StatusLine{SendingMoment::Unreached,
               {u"מנסה להתקשר\rנא לא לסגור את התוכנה ", u"Trying to connect\rPlease do not close the program "},
               None,
               WholeFiles},
    StatusLine{SendingMoment::Skipped,
               {u"מדלג על הקובץ אשר קיים בשרת", u"Skipping the file that exists on the server"},
               None,
               WholeFiles},
    StatusLine{SendingMoment::FileDone, {u" סיים להעלות קובץ", u" Finished uploading file "}, Last, WholeFiles},
    StatusLine{SendingMoment::Listed, {u"קבצים שהועלו בהצלחה", u" files uploaded successfully "}, First},
    StatusLine{SendingMoment::Counted, {u" קבצים שהועלו בהצלחה ", u" files uploaded successfully "}, First},
    StatusLine{SendingMoment::CheckingBroken, {u"בודק קבצים שנכשלו", u"Checking the files that failed"}},
    StatusLine{SendingMoment::Incomplete, {u"לא כל הקבצים הועלו", u"Not all the files were uploaded"}},
};

} // namespace

void FtpFrm::status(const QString& text) {
    Label3.text = text;
    Q_EMIT changed();
}

void FtpFrm::captionFollowsStatus() {
    caption = Label3.text;
    Q_EMIT changed();
}

void FtpFrm::reached(SendingMoment moment, int number) {
    Dialogs& dialogs = m_platform.dialogs;
    switch (moment) {
    case SendingMoment::AttemptBegins:
        showAttempt(number);
        if (number == 1)
            forgetReason();
        [[fallthrough]];
    case SendingMoment::RoundBegins:
        enter(SendingPhase::Sending);
        stopTimers();
        break;
    case SendingMoment::RoundFailed:
        Frame9.visible = true;
        Label4.text = QString::number(number);
        showSecondsAfterFailure();
        break;
    case SendingMoment::CheckBegins:
        enter(SendingPhase::Checking);
        break;
    case SendingMoment::PassBegins:
        m_incomplete = false;
        Label4Bytes.text.clear();
        if (m_sender.session.isKept())
            m_minutesLeft.reset();
        Picture6.visible = Frame9.visible = Image6.visible = false;
        break;
    case SendingMoment::PassEnds:
        m_minutesLeft = 0;
        showMinutes();
        break;
    case SendingMoment::Incomplete:
        showIncomplete(number);
        break;
    case SendingMoment::NothingToSend:
        dialogs.message(u"list3 is empty"_s);
        break;
    case SendingMoment::Stopped:
        pageSize = PageSize::Full;
        Label4File.text.clear();
        showStoppedBoxes();
        break;
    case SendingMoment::SessionOpen:
        FtpEnableControls(true);
        break;
    case SendingMoment::SessionClosed:
        txtProxy.text.clear();
        FtpEnableControls(false);
        break;
    case SendingMoment::NoInternet:
        dialogs.message(
            wording(u"לא נוצר קשר אינטרנט לאחר מספר נסיונות", u"No internet contact after several attempts: ") +
            QString::number(number));
        break;
    case SendingMoment::NoSession:
        dialogs.message(u"No in session!"_s);
        break;
    case SendingMoment::NoDirectory:
        dialogs.message(u"Please enter the directory to CD"_s);
        break;
    case SendingMoment::FolderFound:
        Frame9.visible = false;
        break;
    case SendingMoment::WalkStep:
        if (!inPieces() || phase() == SendingPhase::Checking)
            captionFollowsStatus();
        break;
    case SendingMoment::Reaching:
        Label2.visible = false;
        File1Enabled.enabled = false;
        Command12.visible = false;
        Label46.text = OrderFolder::chosen(m_state).name();
        break;
    case SendingMoment::Unreached:
        Command12.visible = true;
        Command12.enabled = false;
        break;
    case SendingMoment::WalkDone:
        pageSize = PageSize::Small;
        break;
    default:
        break;
    }
    const auto* line = std::find_if(statusLines.begin(), statusLines.end(),
                                    [&](const StatusLine& each) { return each.moment == moment; });
    if (line == statusLines.end() || (line->told == WholeFiles && inPieces())) {
        Q_EMIT changed();
        return;
    }
    const QString words = wording(line->words);
    status(line->number == First  ? QString::number(number) + words
           : line->number == Last ? words + QString::number(number)
                                  : words);
}

void FtpFrm::showIncomplete(int missing) {
    m_incomplete = Picture6.visible = true;
    Label12.text = QString::number(m_sender.NumToSend);
    Label31.text = QString::number(lists().List9.count());
    Label4Missing.text = QString::number(missing);
    Label4Mitoch.text =
        missing == 1 ? wording(u"קובץ מתוך ", u"file out of ") : wording(u"קבצים מתוך ", u"files out of ");
    QStringList sentence;
    for (const Caption* part : {&Label4Nichshal, &Label4Missing, &Label4Mitoch, &Label12, &Label4Yooadoo})
        sentence += part->text.trimmed();
    Picture6.text = sentence.join(u' ');
}

void FtpFrm::progressed(int index, int count) {
    if (inPieces())
        Pic4Prog.visible = true;
    // A kept session tells its bytes.
    showPercent(m_sender.session.isKept() ? percent : UploadPercent(index, count));
    Label4File.text = wording(u"קובץ %1 מתוך %2", u"File %1 of %2").arg(index + 1).arg(count);
    Q_EMIT changed();
}

void FtpFrm::showPercent(int share) {
    percent = share;
    PicInProgWidth = BarWidth(percent, Pic4ProgWidth);
    const QString number = QString::number(percent);
    caption = number + u" %"_s +
              wording(u"  נא לא לסגור את החלון עד לגמר כל המשלוח  ",
                      u"  Please do not close the window until the end of the whole sending  ");
    LabelProg.text = number + u"  %"_s;
}

// All is there once the check has found it.
void FtpFrm::movedBytes(qint64 there, qint64 all, std::optional<int> minutes) {
    const auto share = static_cast<int>(there * 100 / std::max<qint64>(all, 1));
    showPercent(std::min(share, mostBeforeTheEnd));
    const auto megabytes = [](qint64 bytes) {
        return QString::number(static_cast<double>(bytes) / bytesOfMegabyte, 'f', 1);
    };
    Label4Bytes.text =
        wording(u"%1 מתוך %2 מגה־בייט", u"%1 of %2 MB").arg(megabytes(std::min(there, all)), megabytes(all));
    m_minutesLeft = minutes;
    showMinutes();
    Q_EMIT changed();
}

void FtpFrm::sending(int index, int count, const QString& name) {
    status(wording(u"  כעת מעלה לשרת ", u"  Now uploading to the server "));
    if (!inPieces())
        caption = u"%1 / %2 "_s.arg(index + 1).arg(count) +
                  wording(u"נא לא לסגור חלון זה עד גמר כל המשלוחים    ",
                          u"Please do not close this window until all sendings end    ") +
                  OrderFolder::chosen(m_state).name();
    Label4File.hint = name;
    Q_EMIT changed();
}

void FtpFrm::pieceSent(double share, std::optional<int> minutes) {
    PicInProgKatanWidth = static_cast<int>(share * Pic4ProgWidth);
    if (minutes)
        m_minutesLeft = minutes;
    showMinutes();
    Q_EMIT changed();
}

void FtpFrm::failed(LineStep step, const Failure& failure, const QString& subject) {
    Label5.text = m_sender.session.RemoteDirectory;
    if (m_byHand) // a step by hand is no reason why an order was not sent
        status(LineTroubleText(m_state, step, failure, subject));
    else
        tellReason(step, failure, subject);
}

void FtpFrm::notKept(const Failure& failure) {
    m_sender.session.log(u' ' + failure.message);
    tellNotKept();
}

void FtpFrm::enteredFolder(int level, const QString& asTold, const QString& withoutSlash) {
    Label5.text = m_sender.session.RemoteDirectory;
    (level == 1 ? Label37 : Label40).text = asTold;
    (level == 1 ? Label38 : Label41).text = withoutSlash;
    Q_EMIT changed();
}

void FtpFrm::pausing(int round) {
    Picture1.visible = !inPieces();
    Picture1Width = round / 6;
    Q_EMIT changed();
}

} // namespace lumora
