// The wording of the page that sends by HTTP.
#include "session/CaptionTexts.h"
#include "transfer/delivery/SendingTexts.h"
#include "transfer/http/UploadForm.h"

#include <array>

namespace lumora {

using namespace Qt::StringLiterals;

// The page never enters Stopped or Unclear.
std::span<const PhaseLook> UploadForm::looks() const {
    using enum SendingButton;
    constexpr SendingWords sentAdvice{u"כל ההזמנה הגיעה. אפשר לסגור או להתחיל הזמנה חדשה.",
                                      u"The whole order has arrived. You can close the program or begin a new order."};
    static constexpr std::array rows{
        PhaseLook{SendingPhase::Preparing,
                  SendingSign::Asking,
                  None,
                  {},
                  sendingTitle,
                  {u"קוראים את ההזמנה ובודקים מה כבר הגיע לשרת. נא להמתין.",
                   u"Reading the order and checking what is on the server already. Please wait."}},
        PhaseLook{SendingPhase::NoOrder,
                  SendingSign::Bad,
                  NewOrder,
                  {NewOrder, Close, Refresh},
                  notCompleteTitle,
                  noOrderAdvice},
        PhaseLook{SendingPhase::NoServer,
                  SendingSign::Bad,
                  NewOrder,
                  {NewOrder, Close, Refresh},
                  notCompleteTitle,
                  noServerAdvice},
        PhaseLook{SendingPhase::Countdown, SendingSign::Seconds, Hold, {Hold}, readyTitle, readyAdvice},
        PhaseLook{SendingPhase::Waiting,
                  SendingSign::Held,
                  GoOn,
                  {GoOn, NewOrder, Refresh},
                  {u"המשלוח נעצר", u"The sending is stopped"},
                  {u"המשלוח נעצר. כדי לשלוח יש ללחוץ על הלחצן המשך את המשלוח.",
                   u"The sending is stopped. Press Continue the sending to send."}},
        PhaseLook{SendingPhase::Sending, SendingSign::Percent, None, {}, sendingTitle, sendingAdvice},
        PhaseLook{SendingPhase::Checking, SendingSign::Asking, None, {}, sendingTitle, checkingAdvice},
        PhaseLook{SendingPhase::Reporting, SendingSign::Percent, None, {}, sendingTitle, reportingAdvice},
        PhaseLook{SendingPhase::Success, SendingSign::Good, NewOrder, {NewOrder, Close}, sentTitle, sentAdvice},
        PhaseLook{SendingPhase::AllThere, SendingSign::Good, NewOrder, {NewOrder, Close}, sentTitle, sentAdvice},
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
    Command10.visible = row.buttons.testFlag(GoOn);
    endClose.visible = row.buttons.testFlag(Close);
    showCount();
    showTrouble();
    Label4Left.visible = !Label12.text.isEmpty() && !hasArrived(row.phase);
}

void UploadForm::showCount() {
    Label8.text = QString::number(countdown().seconds());
    Label4Count.visible = phase() == SendingPhase::Countdown || Label11.visible;
    Label4Count.text = phase() == SendingPhase::Countdown
                           ? Label13.text.trimmed() + u' ' + Label8.text + u' ' + Label14.text.trimmed()
                           : Label11.text;
}

// A failure during the sending is shown without alarm; at the end it explains why the order was not sent.
void UploadForm::showTrouble() {
    const bool told = !Label1.text.isEmpty() || Label4Reason.visible;
    Pic4Trouble.visible = told && isUnderWay(phase());
    Pic4Failure.visible = told && look().sign == SendingSign::Bad;
}

void UploadForm::showLeft(int files) {
    Label12.text = QString::number(files);
    Label4Left.text = Label4Notru.text.trimmed() + u": "_s + Label12.text;
    Label4Left.visible = !hasArrived(phase());
}

void UploadForm::showAnswers() {
    TxtWeb.text = lists().TxtWeb;
    TxtFromWeb.text = lists().TxtFromWeb;
    TxtUrl.text = lists().TxtUrl;
}

void UploadForm::setTexts() {
    setCaptions(m_state, {{Command2, u"רענן רשימה", u"Refresh list"},
                          {Command3, u"עצור את המשלוח", u"Stop the sending"},
                          {Command10, u"המשך את המשלוח", u"Continue the sending"},
                          {Command28, u"הזמנה חדשה", u"New order"},
                          {Image3, u"סגור", u"Close"},
                          {endClose, u"סגור", u"Close"},
                          {Image5, u"שלח שוב", u"Send again"},
                          {Label9, u"שולח", u"Sending"},
                          {Label11, u"הזמנה זו עלתה במלואה", u"This order went up in full"},
                          {Label13, u" המשלוח יחל בעוד ", u"The sending starts in"},
                          {Label14, u"שניות", u"seconds"},
                          {Label4Notru, u"מספר הקבצים שנותרו למשלוח ", u"Files left to send "},
                          {Label4Rshom, u"נא לרשום את מספר ההזמנה ", u"Please write down the order number"},
                          {Label4Alu, u" הקבצים עלו בהצלחה ", u"The files went up successfully"},
                          {Label4Tashlum, u"נא להתקשר לחנות לגבי תשלום", u"Please call the shop about payment"}});
    Label4Left.text = Label4Notru.text.trimmed() + u": "_s + Label12.text;
    tellPhase();
    Q_EMIT changed();
}

} // namespace lumora
