// The wording of the page that sends by HTTP.
#include "session/CaptionTexts.h"
#include "transfer/delivery/SendingTexts.h"
#include "transfer/http/UploadForm.h"

#include <algorithm>
#include <array>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr SendingWords allWentUp{u"הזמנה זו עלתה במלואה", u"This order went up in full"};
constexpr SendingWords partWentUp{u"מה שבהזמנה עלה", u"What is in the order went up"};
constexpr SendingWords startsIn{u" המשלוח יחל בעוד ", u"The sending starts in"};
constexpr SendingWords secondsWord{u"שניות", u"seconds"};
constexpr SendingWords stoppedTitle{u"המשלוח נעצר", u"The sending is stopped"};
constexpr SendingWords threeAttempts{u"לאחר שלוש נסיונות המחשב לא הצליח להעלות את כל ההזמנה",
                                     u"After three attempts the computer could not upload the whole order"};
constexpr SendingWords filesLeft{u"מספר הקבצים שנותרו למשלוח ", u"Files left to send "};

} // namespace

// The page never enters Unclear or PartThere, and NumberTaken leads to another page.
std::span<const PhaseLook> UploadForm::looks() const {
    using enum SendingButton;
    static constexpr std::array rows{
        PhaseLook{SendingPhase::Preparing,
                  SendingSign::Asking,
                  None,
                  {Stop},
                  sendingTitle,
                  {u"קוראים את ההזמנה ובודקים מה כבר הגיע לשרת. נא להמתין.",
                   u"Reading the order and checking what is on the server already. Please wait."}},
        PhaseLook{SendingPhase::NoOrder,
                  SendingSign::Bad,
                  NewOrder,
                  {NewOrder, Close, Refresh},
                  notCompleteTitle,
                  noOrderAdvice},
        PhaseLook{SendingPhase::Refused,
                  SendingSign::Bad,
                  NewOrder,
                  {NewOrder, Close, Refresh},
                  notCompleteTitle,
                  refusedAdvice},
        PhaseLook{SendingPhase::NoServer,
                  SendingSign::Bad,
                  NewOrder,
                  {NewOrder, Close, Refresh},
                  notCompleteTitle,
                  noServerAdvice},
        PhaseLook{
            SendingPhase::Countdown, SendingSign::Seconds, SendNow, {SendNow, Hold, Change}, readyTitle, readyAdvice},
        PhaseLook{SendingPhase::Waiting,
                  SendingSign::Held,
                  GoOn,
                  {GoOn, NewOrder, Refresh, Change},
                  stoppedTitle,
                  {u"המשלוח נעצר. כדי לשלוח יש ללחוץ על הלחצן המשך את המשלוח.",
                   u"The sending is stopped. Press Continue the sending to send."}},
        PhaseLook{SendingPhase::Stopped,
                  SendingSign::Held,
                  GoOn,
                  {GoOn, NewOrder, Refresh},
                  stoppedTitle,
                  {u"ההזמנה שמורה במחשב זה. כדי להמשיך יש ללחוץ על הלחצן המשך את המשלוח. מה שכבר הגיע לא יישלח שוב.",
                   u"The order is kept on this computer. Press Continue the sending to go on. What has arrived is not "
                   u"sent again."}},
        PhaseLook{SendingPhase::Sending, SendingSign::Percent, None, {Stop}, sendingTitle, sendingAdvice},
        PhaseLook{SendingPhase::Checking, SendingSign::Asking, None, {Stop}, sendingTitle, checkingAdvice},
        PhaseLook{SendingPhase::Reporting, SendingSign::Percent, None, {Stop}, sendingTitle, reportingAdvice},
        PhaseLook{SendingPhase::Success, SendingSign::Good, NewOrder, {NewOrder, Close}, sentTitle, sentAdvice, true},
        PhaseLook{SendingPhase::AllThere, SendingSign::Good, NewOrder, {NewOrder, Close}, sentTitle, sentAdvice, true},
        PhaseLook{
            SendingPhase::CallLab, SendingSign::Bad, NewOrder, {NewOrder, Close}, notCompleteTitle, callLabAdvice},
        PhaseLook{SendingPhase::NotAll,
                  SendingSign::Bad,
                  SendAgain,
                  {SendAgain, NewOrder, Refresh},
                  notCompleteTitle,
                  {u"ההזמנה שמורה במחשב זה. יש להמתין מעט וללחוץ על הלחצן שלח שוב.",
                   u"The order is kept on this computer. Wait a little, then press Send again."}},
    };
    return rows;
}

void UploadForm::showPhase(const PhaseLook& row) {
    using enum SendingButton;
    Image5.visible = row.buttons.testFlag(SendAgain);
    Command2.visible = row.buttons.testFlag(Refresh);
    Command3.visible = row.buttons.testFlag(Hold);
    sendNow.visible = row.buttons.testFlag(SendNow);
    Command15.visible = Command15.enabled = row.buttons.testFlag(Stop);
    Command10.visible = row.buttons.testFlag(GoOn);
    Command10.enabled = !isAnswerAwaited();
    endClose.visible = row.buttons.testFlag(Close) && mayBeClosed();
    Label11.visible = row.phase == SendingPhase::AllThere && !m_lacking;
    if (row.phase == SendingPhase::Waiting)
        Picture1.visible = Pic4Timer.visible = Picture5.visible = false;
    if (!isUnderWay(row.phase) && row.phase != SendingPhase::Preparing)
        Pic4Hamten.visible = false;
    showCount();
    showTrouble();
    showLeft();
    showOrder();
    showLabButtons();
}

void UploadForm::showCount() {
    const bool counts = phase() == SendingPhase::Countdown;
    const QString seconds = QString::number(countdown().seconds());
    Label8.text = seconds;
    Label4Count.visible = counts || (phase() == SendingPhase::AllThere && !m_lacking);
    Label11.text = wording(m_state.transfer.leftOut.isEmpty() ? allWentUp : partWentUp);
    Label4Count.text =
        counts ? wording(startsIn).trimmed() + u' ' + seconds + u' ' + wording(secondsWord) : Label11.text;
}

// A failure during the sending is shown without alarm; at the end it explains why the order was not sent.
void UploadForm::showTrouble() {
    const bool told = m_attemptFailed || !reason().isEmpty();
    Pic4Trouble.visible = told && isUnderWay(phase());
    Pic4Failure.visible = told && look().sign == SendingSign::Bad;
}

void UploadForm::showAttemptsOver() {
    Label1.text = m_attemptFailed ? wording(threeAttempts) : QString();
}

void UploadForm::showLeft() {
    const QString files = m_left ? QString::number(*m_left) : QString();
    Label12.text = files;
    Label4Left.text = wording(filesLeft).trimmed() + u": "_s + files;
    Label4Left.visible = m_left && !hasArrived(phase());
}

void UploadForm::showOrder() {
    Label15.text = Label16.text = m_orderName;
    Label15.visible = !isThanked(phase()); // the thank-you has the number
    Pic4Order.visible = hasOrder(phase()) || !m_orderName.isEmpty();
}

void UploadForm::showAnswers() {
    TxtWeb.text = lists().TxtWeb;
    TxtFromWeb.text = lists().TxtFromWeb;
    TxtUrl.text = lists().TxtUrl;
}

void UploadForm::setTexts() {
    Command24.visible = m_state.mayOpenOperatorArea();
    setCaptions(m_state, {{Command2, u"רענן רשימה", u"Refresh list"},
                          {Command3, u"עצור את המשלוח", u"Stop the sending"},
                          {Command10, u"המשך את המשלוח", u"Continue the sending"},
                          {Command15, u"עצור", u"Stop"},
                          {sendNow, u"שלח עכשיו", u"Send now"},
                          {Command28, u"הזמנה חדשה", u"New order"},
                          {endClose, u"סגור", u"Close"},
                          {Image5, u"שלח שוב", u"Send again"},
                          {Label9, u"שולח", u"Sending"},
                          {Label13, startsIn.hebrew, startsIn.english},
                          {Label14, secondsWord.hebrew, secondsWord.english},
                          {Label4Notru, filesLeft.hebrew, filesLeft.english},
                          {Label4Rshom, u"נא לרשום את מספר ההזמנה ", u"Please write down the order number"},
                          {Label4Alu, u" הקבצים עלו בהצלחה ", u"The files went up successfully"},
                          {Label4Tashlum, u"נא להתקשר לחנות לגבי תשלום", u"Please call the shop about payment"}});
    setLabTexts();
    tellPhase();
    Q_EMIT changed();
}

} // namespace lumora
