// The wording of the page that sends by FTP; that of its status line stands in FtpFrmEvents.cpp.
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/CaptionTexts.h"
#include "transfer/delivery/SendingTexts.h"
#include "transfer/ftp/FtpFrm.h"

#include <array>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array attemptTitles{
    SendingWords{u"", u""},
    SendingWords{u"נסיון שני לקבצים שלא עלו", u"Second attempt for the files that did not go up"},
    SendingWords{u"נסיון שלישי לקבצים שלא עלו", u"Third attempt for the files that did not go up"},
    SendingWords{u"נסיון רביעי ואחרון להעלות קבצים שלא עלו",
                 u"Fourth and last attempt to upload the files that did not go up"},
};

} // namespace

std::span<const PhaseLook> FtpFrm::looks() const {
    using enum SendingButton;
    constexpr SendingWords nothingTitle{u"אין מה לשלוח", u"Nothing can be sent"};
    static constexpr std::array rows{
        PhaseLook{SendingPhase::Preparing,
                  SendingSign::Seconds,
                  None,
                  {SendNow, Hold},
                  sendingTitle,
                  {u"קוראים את ההזמנה. נא להמתין.", u"Reading the order. Please wait."}},
        PhaseLook{SendingPhase::NoOrder, SendingSign::Bad, NewOrder, {NewOrder}, nothingTitle, noOrderAdvice},
        PhaseLook{
            SendingPhase::Refused, SendingSign::Bad, SendAgain, {SendAgain, NewOrder}, notCompleteTitle, refusedAdvice},
        PhaseLook{SendingPhase::NoServer, SendingSign::Bad, NewOrder, {NewOrder}, nothingTitle, noServerAdvice},
        PhaseLook{
            SendingPhase::Countdown, SendingSign::Seconds, SendNow, {SendNow, Hold, Change}, readyTitle, readyAdvice},
        PhaseLook{SendingPhase::Waiting,
                  SendingSign::Seconds,
                  SendNow,
                  {SendNow, GoOn, Change},
                  sendingTitle,
                  {u"הספירה נעצרה. כדי לשלוח יש ללחוץ על הלחצן שלח עכשיו.",
                   u"The count is stopped. Press Send now to send."}},
        PhaseLook{SendingPhase::Sending, SendingSign::Percent, None, {Stop}, sendingTitle, sendingAdvice},
        PhaseLook{SendingPhase::Checking, SendingSign::Percent, None, {Stop}, sendingTitle, checkingAdvice},
        PhaseLook{SendingPhase::Reporting, SendingSign::Percent, None, {Stop}, sendingTitle, reportingAdvice},
        PhaseLook{SendingPhase::Success, SendingSign::Good, NewOrder, {NewOrder, Close}, sentTitle, sentAdvice, true},
        // %1: files on the server, %2: files of the order; likewise in the next two rows.
        PhaseLook{SendingPhase::AllThere,
                  SendingSign::Good,
                  NewOrder,
                  {NewOrder, Close},
                  {u"ההזמנה נמצאת בשרת", u"Your order is on the server"},
                  {u"כל %2 הקבצים של משלוח זה נמצאים בשרת, ובתיקייה שם %1 קבצים. אין צורך לשלוח שוב. יש להודיע על כך "
                   u"לחנות.",
                   u"All %2 files of this sending are on the server, whose folder holds %1. There is no need to send "
                   u"again. Please tell the shop."}},
        PhaseLook{
            SendingPhase::PartThere,
            SendingSign::Unclear,
            NewOrder,
            {NewOrder, Close},
            {u"חלק מההזמנה נמצא בשרת", u"A part of your order is on the server"},
            {u"כל %2 הקבצים שנבחרו נמצאים בשרת, ובתיקייה שם %1 קבצים, אך ההזמנה אינה שלמה שם. כדי לשלוח את כולה יש "
             u"לבחור אותה בהזמנות המוכנות.",
             u"All %2 chosen files are on the server, whose folder holds %1, but the order is not whole there. To "
             u"send all of it, choose it among the finished orders."}},
        PhaseLook{SendingPhase::Unclear,
                  SendingSign::Unclear,
                  SendAgain,
                  {SendAgain, NewOrder},
                  {u"לא ברור אם כל ההזמנה הגיעה", u"It is not clear whether all has arrived"},
                  {u"הגיעו %1 מתוך %2 קבצים. כדי לבדוק ולשלוח שוב יש ללחוץ על הלחצן שלח שוב. אם זה חוזר, יש להודיע "
                   u"לחנות.",
                   u"%1 of %2 files have arrived. Press Send again to check and send once more. If this comes again, "
                   u"please tell the shop."}},
        PhaseLook{SendingPhase::NotAll,
                  SendingSign::Bad,
                  SendAgain,
                  {SendAgain, NewOrder},
                  notCompleteTitle,
                  {u"מומלץ להמתין 30 שניות ואז ללחוץ על הלחצן שלח שוב.", u"Wait 30 seconds, then press Send again."}},
        PhaseLook{SendingPhase::CallLab, SendingSign::Bad, NewOrder, {NewOrder}, notCompleteTitle, callLabAdvice},
        PhaseLook{SendingPhase::Stopped,
                  SendingSign::Bad,
                  SendAgain,
                  {SendAgain, NewOrder},
                  notCompleteTitle,
                  {u"השליחה נעצרה. כדי להמשיך יש ללחוץ על הלחצן שלח שוב.",
                   u"Sending was stopped. Press Send again to go on."}},
    };
    return rows;
}

QString FtpFrm::advice(const PhaseLook& row) const {
    if (row.phase == SendingPhase::Unclear && !m_sender.check.freshCount)
        return wording(
            u"לא ניתן היה לקרוא בשרת מה הגיע. כדי לבדוק ולשלוח שוב יש ללחוץ על הלחצן שלח שוב. אם זה חוזר, יש "
            u"להודיע לחנות.",
            u"The server did not tell what has arrived. Press Send again to check and send once more. If "
            u"this comes again, please tell the shop.");
    const bool isStaffs = row.phase == SendingPhase::PartThere && !mayBeClosed(); // so are the finished orders
    const QString text = isStaffs ? wording(kioskPartThereAdvice) : SendingPage::advice(row);
    return text.contains(u'%') ? text.arg(m_sender.check.NumOnServer).arg(m_sender.NumToSend) : text;
}

void FtpFrm::showPhase(const PhaseLook& row) {
    using enum SendingButton;
    const bool underWay = isUnderWay(row.phase);
    const bool ended = row.main == SendAgain || row.phase == SendingPhase::CallLab;
    Command15.enabled = Command21.enabled = underWay;
    Command15.visible = row.buttons.testFlag(Stop);
    Image5.visible = row.buttons.testFlag(SendNow);
    Image5.enabled = Command23.enabled = row.main == SendNow && !isAnswerAwaited(); // before that no order is listed
    if (!underWay && row.phase != SendingPhase::Preparing)
        Picture1.visible = false;
    Pic4Blink.visible = row.sign == SendingSign::Seconds && row.phase != SendingPhase::Waiting;
    Command23.visible = row.buttons.testAnyFlags(SendingButtons(Hold) | GoOn);
    Command10.visible = row.buttons.testFlag(SendAgain);
    Command11.visible = Command11.enabled = row.buttons.testFlag(Close) && mayBeClosed();
    Command23.text = row.buttons.testFlag(GoOn) ? wording(u"המשך", u"Go on") : wording(u"עצור משלוח", u"Stop sending");
    PicInProgKatan.visible = underWay && inPieces();
    Pic4Failure.visible = ended && (m_incomplete || !reason().isEmpty());
    Label46.visible = !isThanked(row.phase); // the thank-you has the number
    wholeNumber.text = Label46.text;
    if (const QString phone = m_state.profile.LabPhone.trimmed(); !phone.isEmpty())
        nextSteps.text += wording(forQuestionsWords).arg(phone);
    showMinutes();
    showLabButtons();
}

void FtpFrm::showMinutes() {
    if (m_minutesLeft)
        Label4Diff.text = QString::number(*m_minutesLeft);
    const bool kept = m_sender.session.isKept();
    if (kept)
        Label4Minutes.text = m_minutesLeft == 1 ? wording(u"דקה", u"minute") : wording(u"דקות", u"minutes");
    Label4Diff.visible = Label4DiffTitle.visible = Label4Minutes.visible =
        m_minutesLeft &&
        (kept ? phase() == SendingPhase::Sending && *m_minutesLeft > 0 : isUnderWay(phase()) && inPieces());
    Label4Bytes.visible = phase() == SendingPhase::Sending && !Label4Bytes.text.isEmpty();
}

void FtpFrm::setTexts() {
    Command24.visible = m_state.mayOpenOperatorArea();
    if (m_state.kiosk.on)
        Image4.visible = m_state.staff && phase() != SendingPhase::Success;
    setCaptions(
        m_state,
        {{Command12, u"שלח ", u"Send "},
         {Command10, u"שלח שוב", u"Send again"},
         {Command28, u"הזמנה חדשה", u"New order"},
         {Command15, u"עצור", u"Stop"},
         {Command18, u"עצור ספירה", u"Stop the count"},
         {Command11, u"יציאה", u"Exit"},
         {Command8, u"יציאה", u"Exit"},
         {Command14, u"לא לסגור", u"Do not close"},
         {Command16, u"סגור את התוכנה למרות שלא נשלחו התמונות",
          u"Close the program although the pictures were not sent"},
         {Command22, u"במקרה של תקלה בתקשורת לחץ כאן", u"In case of a communication fault press here"},
         {Command24, u"הצג יותר פרטים", u"Show more details"},
         {Command9, u"הסתר פרטים", u"Hide details"},
         {Image4, u"פתח את תיקיית ההזמנה", u"Open the order folder"},
         {Image5, u"שלח עכשיו", u"Send now"},
         {Command27, u"Copy"},
         {Label15, u"רשום לפננו שבקשת לקבל את התמונות המודפסות במשלוח לביתך",
          u"We have noted that you asked to get the printed pictures by delivery to your home"},
         {Label4Nichshal, u"המחשב לא הצליח להעלות ", u"The computer failed to upload "},
         {Label4Mitoch, u"קבצים מתוך ", u"files out of "},
         {Label4Yooadoo, u" קבצים שיועדו למשלוח ", u" files meant for sending "},
         {Label9, u"ההזמנה שמורה במחשב זה, וקבצים שכבר הגיעו לשרת לא יישלחו שוב.",
          u"The order is kept on this computer, and files that have arrived are not sent again."},
         {Label4DiffTitle, u"זמן משוער שנותר לסיום המשלוח", u"Estimated time left to the end of the sending"},
         {Label4Minutes, u"דקות", u"minutes"},
         {numberPrompt, u"מספר ההזמנה שלכם", u"Your order number"},
         {PicInProgKatan, u"חלקי ההזמנה", u"Pieces of the order"},
         {Picture7, u"שים לב !!\rהתמונות עדיין לא נשלחו ברשת\rאם תסגור את התוכנה כעת \rיתכן ולא כל התמונות יודפסו",
          u"Please note!\rThe pictures have not been sent yet.\rIf you close the program now,\rperhaps not all "
          u"pictures "
          u"will be printed."}});
    if (!mayBeClosed())
        setCaptions(m_state, {{Command14, u"להישאר כאן", u"Stay here"},
                              {Command16, u"לחזור לדף הפתיחה בלי לשלוח", u"Back to the first page without sending"},
                              {Picture7, u"התמונות עדיין לא נשלחו.", u"The pictures have not been sent yet."}});
    setLabTexts();
    showCounts();
    tellPhase();
    Q_EMIT changed();
}

void FtpFrm::showFileCount(int files) {
    Label7.text = QString::number(files);
}

void FtpFrm::showCounts() {
    Label4Counts.visible = Label4Prints.visible = m_printCount.has_value();
    if (!m_printCount)
        return;
    const QString prints = QString::number(*m_printCount);
    Label21.text = prints;
    Label4Counts.text = wording(u"%1 תמונות, %2 קבצים", u"%1 prints, %2 files").arg(prints).arg(m_fileCount);
    Label4Prints.text = wording(u"תמונות בהזמנה: %1", u"Prints in this order: %1").arg(prints);
}

void FtpFrm::showAttempt(int attempt) {
    Label34.text = wording(attemptTitles.at(static_cast<std::size_t>(attempt - 1)));
    Label34.visible = true;
}

void FtpFrm::showStoppedBoxes() {
    Dialogs& dialogs = m_platform.dialogs;
    dialogs.message(wording(u" התהליך הופסק ביוזמת המשתמש ", u" The process was stopped by the user "));
    dialogs.message(wording(u"אם תרצה להמשיך המשלוח לחץ על לחצן שלח דרך האינטרנט\r"
                            u"אם אינך מתכוון להמשיך במשלוח הנך מתבקש להודיע על כך לחנות תודה",
                            u"To go on with the sending, press Send again.\r"
                            u"If you do not mean to go on, please tell the shop. Thank you."));
}

void FtpFrm::showNoServerBoxes() {
    Dialogs& dialogs = m_platform.dialogs;
    dialogs.message(wording(u"המחשב לא מצא שרת זמין\rנסה במועד מאוחר יותר",
                            u"The computer found no available server.\rTry at a later time."));
    dialogs.message(
        wording(u"אין צורך לבצע את הבחירה מהתחלה\rפשוט יש להפעיל את התוכנה מהתחלה\rולבחור מהאפשרויות "
                u"\r  ש ל י ח ה    ח ו ז ר ת  ",
                u"There is no need to choose again.\rJust start the program\rand pick from the options\r  R E S E N "
                u"D  "));
}

} // namespace lumora
