// The wording of the page of finished orders, in both languages.
#include "common/DrivePathText.h"
#include "finished/orders/MoogMeret.h"
#include "order/FinishedOrder.h"
#include "order/OrderNames.h"

namespace lumora {

using namespace Qt::StringLiterals;

void MoogMeret::setTexts() {
    const auto set = [this](Caption& control, const QString& hebrew, const QString& english) {
        control.text = m_state.wording(hebrew, english);
    };
    set(Title, u"משלוח הזמנות מוגמרות"_s, u"Sending finished orders"_s);
    set(Label4Shalav1, u"שלב ראשון: איזו הזמנה לשלוח?"_s, u"Step one: which order?"_s);
    set(Label4Rek, u"אין במחשב זה הזמנות מוגמרות."_s, u"There are no finished orders on this computer."_s);
    set(Label4Bhar, u"נגיעה בהזמנה מציגה את הקבצים שלה."_s, u"Touch an order to see its files."_s);
    set(Label4Shalav2, u"שלב שני: אילו קבצים לשלוח? נגיעה בשורה מסמנת קובץ או מבטלת סימון."_s,
        u"Step two: which files? A touch marks a file, or takes its mark away."_s);
    set(Label4Files, u"קבצים בהזמנה"_s, u"files in this order"_s);
    set(Label4Prints, u"תמונות בקבצים שסומנו"_s, u"pictures in the marked files"_s);
    set(Label4Reka, u"אין בהזמנה זו קבצים לשליחה."_s, u"This order has no files that can be sent."_s);
    set(Label4Tmuna, u"תצוגה של הקובץ הראשון"_s, u"A look at the first file"_s);
    set(Label4Shalav3, u"שלב שלישי: איך לשלוח?"_s, u"Step three: how to send?"_s);
    set(Command1, u"בחר את כל הקבצים למשלוח"_s, u"Choose all the files"_s);
    set(Command21, u"בטל את כל הבחירה"_s, u"Cancel the whole choice"_s);
    set(Command4, u"   בצע משלוח"_s, u"   Send now"_s);
    set(Command2, u"שלח בדואר אלקטרוני"_s, u"Send by e-mail"_s);
    set(Command5, u"רענן רשימת הזמנות"_s, u"Refresh the list"_s);
    set(Command6, u"בטל הכל וצא מהתוכנה"_s, u"Cancel all and leave the program"_s);
    set(Command28, u"הזמנה חדשה"_s, u"New order"_s);
    set(Command4Orders, u"חזרה לרשימת ההזמנות"_s, u"Back to the orders"_s);
    set(Command4Pieces, u"חיתוך ואיחוד קבצים"_s, u"Cut and join files"_s);
    set(Command13, u"שלח לפ י שיטה 1"_s, u"Send by method 1"_s);
    set(Command18, u"Exit  יציאה"_s, u"Exit"_s);
    set(Command19, u"עצור משלוח"_s, u"Stop sending"_s);
    set(Label9, u"המשלוח חולק לחלקים קטנים"_s, u"The sending was cut into small parts"_s);
    set(Label2, u"התמונות ארוזות למשלוח והן תשלחנה ב"_s, u"The pictures are packed for sending and will go in"_s);
    set(Label3, u"מנות"_s, u"packages"_s);
    set(Label4Dakot, u"דקות במנה זו:"_s, u"Minutes on this package:"_s);
    set(Label24, u"לחצן יציאה יהיה פעיל לאחר משלוח כל המנות"_s,
        u"The exit button will work after all the packages are sent"_s);
    showWhatIsMarked();
    showWalk();
    showOutcome();
}

MoogMeret::OrderRow MoogMeret::orderRow(const QString& folderName) const {
    OrderRow row{folderName, {}};
    if (const auto order = FinishedOrderOf(folderName))
        row.text = m_state.wording(u"מס' %1   %2"_s, u"No. %1   %2"_s)
                       .arg(order->number, order->date.toString(u"dd.MM.yyyy"_s));
    if (TravelsInPieces(folderName))
        row.hint = m_state.wording(u"הזמנה בחלקים"_s, u"An order in pieces"_s);
    return row;
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

void MoogMeret::showWalk() {
    Label13.text = QString::number(static_cast<int>(m_walk.minutes()));
    Label4Mana.text =
        m_state.wording(u"מנה %1 מתוך %2"_s, u"Package %1 of %2"_s).arg(List1.currentIndex() + 1).arg(List1.count());
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
