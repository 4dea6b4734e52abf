// The wording of the page of finished orders.
#include "common/DrivePath.h"
#include "common/Warning.h"
#include "finished/orders/MoogMeret.h"
#include "order/FinishedOrder.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/UnfinishedOrders.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/CaptionTexts.h"

namespace lumora {

using namespace Qt::StringLiterals;

void MoogMeret::setTexts() {
    setCaptions(
        m_state,
        {
            {Title, u"משלוח הזמנות מוגמרות", u"Sending finished orders"},
            {Label4Shalav1, u"שלב ראשון: איזו הזמנה לשלוח?", u"Step one: which order?"},
            {Label4Rek, u"אין במחשב זה הזמנות מוגמרות.", u"There are no finished orders on this computer."},
            {Label4Bhar, u"נגיעה בהזמנה מציגה את הקבצים שלה.", u"Touch an order to see its files."},
            {Label4Shalav2, u"שלב שני: אילו קבצים לשלוח? נגיעה בשורה מסמנת קובץ או מבטלת סימון.",
             u"Step two: which files? A touch marks a file, or takes its mark away."},
            {Label4Files, u"קבצים בהזמנה", u"files in this order"},
            {Label4Prints, u"תמונות בקבצים שסומנו", u"pictures in the marked files"},
            {Label4Reka, u"אין בהזמנה זו קבצים לשליחה.", u"This order has no files that can be sent."},
            {Label4Tmuna, u"תצוגה של הקובץ הראשון", u"A look at the first file"},
            {Label4Shalav3, u"שלב שלישי: איך לשלוח?", u"Step three: how to send?"},
            {Command1, u"בחר את כל הקבצים למשלוח", u"Choose all the files"},
            {Command21, u"בטל את כל הבחירה", u"Cancel the whole choice"},
            {Command4, u"   בצע משלוח", u"   Send now"},
            {Command2, u"שלח בדואר אלקטרוני", u"Send by e-mail"},
            {Label4EinDoar, u"לא הוגדר כאן שרת דואר, ולכן אי אפשר לשלוח בדואר.",
             u"No mail server is set up here, so nothing can be sent by mail."},
            {Command5, u"רענן רשימת הזמנות", u"Refresh the list"},
            {Command6, u"בטל הכל וצא מהתוכנה", u"Cancel all and leave the program"},
            {Command28, u"הזמנה חדשה", u"New order"},
            {Command4Orders, u"חזרה לרשימת ההזמנות", u"Back to the orders"},
            {Command4Pieces, u"חיתוך ואיחוד קבצים", u"Cut and join files"},
            {Label4Mamtinot, u"ממתינות לשליחה", u"Waiting to be sent"},
            {Command4Nase, u"נסה עכשיו", u"Try now"},
            {Command4Vater, u"ותר", u"Give up"},
            {Command13, u"שלח לפ י שיטה 1", u"Send by method 1"},
            {Command18, u"Exit  יציאה", u"Exit"},
            {Command19, u"עצור משלוח", u"Stop sending"},
            {Label9, u"המשלוח חולק לחלקים קטנים", u"The sending was cut into small parts"},
            {Label2, u"התמונות ארוזות למשלוח והן תשלחנה ב", u"The pictures are packed for sending and will go in"},
            {Label3, u"מנות", u"packages"},
            {Label4Dakot, u"דקות במנה זו:", u"Minutes on this package:"},
            {Label24, u"לחצן יציאה יהיה פעיל לאחר משלוח כל המנות",
             u"The exit button will work after all the packages are sent"},
        });
    showWhatIsMarked();
    showWalk();
    showOutcome();
}

MoogMeret::OrderRow MoogMeret::orderRow(const QString& folderName) const {
    OrderRow row{folderName, {}, {}};
    if (const auto order = FinishedOrderOf(folderName))
        row.text = m_state.wording(u"מס' %1   %2"_s, u"No. %1   %2"_s)
                       .arg(order->number, order->date.toString(u"dd.MM.yyyy"_s));
    if (TravelsInPieces(folderName))
        row.hint = m_state.wording(u"הזמנה בחלקים"_s, u"An order in pieces"_s);
    if (m_notFinished.contains(folderName))
        row.mark = m_state.wording(u"לא הושלמה"_s, u"not finished"_s);
    if (m_givenUp.contains(folderName))
        row.mark = m_state.wording(u"ויתרו על שליחתה"_s, u"given up"_s);
    return row;
}

QString MoogMeret::waitingRow(const CountedOrder& waiting) const {
    const UnfinishedOrder& order = waiting.order;
    const OrderDetails details = detailsOf(order.folder.path());
    const QString tries = m_state.wording(u"ניסיונות: %1, גודל: %2 מ\"ב"_s, u"tries: %1, size: %2 MB"_s)
                              .arg(QString::number(order.state.tries), megabytesOf(order.folder));
    QStringList lines{orderRow(order.folder.name()).text, QString(details.n1 + u' ' + details.n2).trimmed(), tries,
                      m_state.wording(order.state.why.hebrew, order.state.why.english)};
    if (!waiting.byItself)
        lines += m_state.wording(u"אינה נשלחת מעצמה"_s, u"is not sent by itself"_s);
    lines.removeAll(QString());
    return lines.join(u'\n');
}

bool MoogMeret::asksToGiveUp(const QString& number) {
    return asks(u"הזמנה מספר %1 לא תישלח עוד מעצמה. התיקייה שלה נשארת במחשב זה. לוותר עליה?",
                u"Order number %1 will not be sent by itself any more. Its folder stays on this computer. Give it up?",
                {number});
}

void MoogMeret::tellNotGivenUp(const Failure& failure) {
    writeWarning(failure.message);
    m_platform.dialogs.message(
        m_state.wording(u"הוויתור לא נרשם במחשב זה, וההזמנה תמשיך להישלח.\nיש לפנות מקום בדיסק או "
                        u"לתקן את ההרשאות של תיקיית הנתונים.",
                        u"This can't be written on this computer, and the order goes on being "
                        u"sent.\nFree some disk space, or correct the permissions of the data "
                        u"folder."));
}

bool MoogMeret::asks(const char16_t* hebrew, const char16_t* english, const QStringList& numbers) {
    QString question = m_state.wording(hebrew, english);
    for (const QString& number : numbers)
        question = question.arg(number);
    return m_platform.dialogs.ask(question);
}

void MoogMeret::tellReplaced(const OrderFolder& again) {
    m_platform.dialogs.message(m_state
                                   .wording(u"הזמנה זו הוכנה מחדש במספר %1, ונשלחת רק במספר ההוא.",
                                            u"This order was prepared again under number %1, and is sent only there.")
                                   .arg(OrderNumberOf(again.name())));
}

void MoogMeret::tellNotFinished() {
    m_platform.dialogs.message(
        m_state.wording(u"הזמנה זו לא הושלמה. ייתכן שתוכנית אחרת במחשב זה מכינה אותה עכשיו.",
                        u"This order was not finished. Another program on this computer may be preparing it now."));
}

void MoogMeret::tellGone(const UnfinishedOrder& order) {
    m_platform.dialogs.message(GoneText(m_state, order));
}

bool MoogMeret::asksToFinish() {
    return asks(u"הזמנה זו לא הושלמה. להשלים אותה עכשיו?", u"This order was not finished. Finish it now?");
}

bool MoogMeret::asksToSendWithoutDetails() {
    return asks(u"להזמנה זו חסרים הפרטים. לשלוח את מה שיש?",
                u"The details of this order are missing. Send what is there?");
}

bool MoogMeret::asksToGoOnWithoutGone(const UnfinishedOrder& order) {
    return m_platform.dialogs.ask(GoneText(m_state, order) +
                                  m_state.wording(u" להמשיך בלעדיהן?", u" Go on without them?"));
}

bool MoogMeret::asksToThrowAway(const QString& number) {
    return m_platform.dialogs.ask(ThrowAwayQuestion(m_state, number));
}

void MoogMeret::showWhatIsMarked() {
    Label4Pieces.text =
        List3.currentIndex() >= 0 && !TravelsInPieces(List3.currentItem())
            ? m_state.wording(u"לאחר הזמנה בחלקים מסומנים רק חלקים (prk) ודף ההזמנה. את שאר הקבצים לשליחה "
                              "יש לסמן בנגיעה."_s,
                              u"After an order in pieces only pieces (prk) and the order sheet are marked. "
                              "Touch the other files that are to be sent."_s)
            : m_state.wording(u"ההזמנה נשלחת בחלקים: מסומנים החלקים (prk) ודף ההזמנה."_s,
                              u"The order travels in pieces: the pieces (prk) and the order sheet are marked."_s);
}

QString MoogMeret::packageText() const {
    return m_state.wording(u"מנה %1 מתוך %2"_s, u"Package %1 of %2"_s).arg(List1.currentIndex() + 1).arg(List1.count());
}

void MoogMeret::showWalk() {
    Label13.text = QString::number(static_cast<int>(m_walk.minutes()));
    Label4Mana.text = packageText();
    Label4Shem.text = List1.currentIndex() < 0 ? QString() : LeafName(List1.currentItem());
    Q_EMIT changed();
}

void MoogMeret::showOutcome() {
    const int sent = m_walk.count(PackageWalk::Fate::Sent);
    if (m_phase != Phase::Walked || !mailSetUp())
        Label4Sof.text.clear();
    else if (m_walk.allSent())
        Label4Sof.text =
            m_state.wording(u"כל %1 המנות נשלחו בדואר."_s, u"All %1 packages were sent by mail."_s).arg(sent);
    else
        Label4Sof.text = m_state
                             .wording(u"נשלחו %1 מתוך %2 מנות. כל הקבצים שמורים במחשב זה. כדי לשלוח מנה שלא נשלחה "
                                      "יש ללחוץ עליה ברשימה."_s,
                                      u"%1 of %2 packages were sent. All files are kept on this computer. Press a "
                                      "package that was not sent to send it."_s)
                             .arg(sent)
                             .arg(m_walk.count());
    Q_EMIT changed();
}

} // namespace lumora
