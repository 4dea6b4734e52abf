// The wording of the page that sends by HTTP.
#include "session/CaptionTexts.h"
#include "session/SessionState.h"
#include "transfer/http/UploadForm.h"

#include <algorithm>
#include <array>

namespace lumora {

namespace {

using enum SendingButton;

constexpr SendingWords httpSendingTitle{u"שליחת ההזמנה", u"Sending your order"};
constexpr SendingWords httpSentTitle{u"ההזמנה נשלחה", u"Your order was sent"};
constexpr SendingWords httpNotCompleteTitle{u"השליחה לא הושלמה", u"The sending is not complete"};
constexpr SendingWords httpSentAdvice{u"כל ההזמנה הגיעה. אפשר לסגור או להתחיל הזמנה חדשה.",
                                      u"The whole order has arrived. You can close the program or begin a new order."};

constexpr std::array httpLooks{
    PhaseLook{SendingPhase::Preparing,
              SendingSign::Asking,
              None,
              {},
              httpSendingTitle,
              {u"קוראים את ההזמנה ובודקים מה כבר הגיע לשרת. נא להמתין.",
               u"Reading the order and checking what is on the server already. Please wait."}},
    PhaseLook{SendingPhase::NoOrder,
              SendingSign::Bad,
              NewOrder,
              {NewOrder, Close, Refresh},
              httpNotCompleteTitle,
              {u"אין כאן הזמנה לשליחה.", u"There is no order to send here."}},
    PhaseLook{SendingPhase::NoServer,
              SendingSign::Bad,
              NewOrder,
              {NewOrder, Close, Refresh},
              httpNotCompleteTitle,
              {u"לא הוגדר שרת לקבלת הזמנות. ההזמנה שמורה במחשב זה. יש להודיע לחנות.",
               u"No server is set for orders. The order is kept on this computer. Please tell the shop."}},
    PhaseLook{SendingPhase::Countdown,
              SendingSign::Seconds,
              Hold,
              {Hold},
              {u"ההזמנה מוכנה לשליחה", u"Your order is ready to be sent"},
              {u"ההזמנה מוכנה. השליחה תתחיל מעצמה בתום הספירה.",
               u"The order is ready. Sending begins by itself when the count ends."}},
    PhaseLook{SendingPhase::Waiting,
              SendingSign::Held,
              GoOn,
              {GoOn, NewOrder, Refresh},
              {u"המשלוח נעצר", u"The sending is stopped"},
              {u"המשלוח נעצר. כדי לשלוח יש ללחוץ על הלחצן המשך את המשלוח.",
               u"The sending is stopped. Press Continue the sending to send."}},
    PhaseLook{SendingPhase::Sending,
              SendingSign::Percent,
              None,
              {},
              httpSendingTitle,
              {u"ההזמנה נשלחת. נא לא לסגור את התוכנה.", u"The order is being sent. Please do not close the program."}},
    PhaseLook{SendingPhase::Checking,
              SendingSign::Asking,
              None,
              {},
              httpSendingTitle,
              {u"בודקים אילו קבצים הגיעו לשרת. נא להמתין.", u"Checking which files have arrived. Please wait."}},
    PhaseLook{SendingPhase::Reporting,
              SendingSign::Percent,
              None,
              {},
              httpSendingTitle,
              {u"כל ההזמנה הגיעה. מודיעים לחנות, נא להמתין.",
               u"The whole order has arrived. Telling the shop, please wait."}},
    PhaseLook{SendingPhase::Success, SendingSign::Good, NewOrder, {NewOrder, Close}, httpSentTitle, httpSentAdvice},
    PhaseLook{SendingPhase::AllThere, SendingSign::Good, NewOrder, {NewOrder, Close}, httpSentTitle, httpSentAdvice},
    PhaseLook{SendingPhase::NotAll,
              SendingSign::Bad,
              SendAgain,
              {SendAgain, NewOrder, Refresh},
              httpNotCompleteTitle,
              {u"ההזמנה שמורה במחשב זה. יש להמתין מעט וללחוץ על הלחצן שלח שוב.",
               u"The order is kept on this computer. Wait a little, then press Send again."}},
};

} // namespace

// The page never enters Stopped or Unclear.
const PhaseLook& UploadForm::lookOf(SendingPhase phase) const {
    const auto* row =
        std::find_if(httpLooks.begin(), httpLooks.end(), [&](const PhaseLook& each) { return each.phase == phase; });
    return row == httpLooks.end() ? httpLooks.back() : *row;
}

void UploadForm::showPhase(const PhaseLook& row) {
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
    Label4Left.text = Label4Notru.text.trimmed() + QStringLiteral(": ") + Label12.text;
    Label4Left.visible = !hasArrived(phase());
}

void UploadForm::showAnswers() {
    TxtWeb.text = lists().TxtWeb;
    TxtFromWeb.text = lists().TxtFromWeb;
    TxtUrl.text = lists().TxtUrl;
}

void UploadForm::setTexts() {
    setCaptions(m_state, {
                             {Command2, u"רענן רשימה", u"Refresh list"},
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
                             {Label4Tashlum, u"נא להתקשר לחנות לגבי תשלום", u"Please call the shop about payment"},
                         });
    Label4Left.text = Label4Notru.text.trimmed() + QStringLiteral(": ") + Label12.text;
    tellPhase();
    Q_EMIT changed();
}

} // namespace lumora
