// The wording of the page of finished orders, in both languages.
#include "finished/orders/MoogMeret.h"
#include "order/OrderNames.h"
#include "session/SessionState.h"

namespace lumora {

void MoogMeret::setTexts() {
    const auto set = [this](Caption& control, const QString& hebrew, const QString& english) {
        control.text = m_state.wording(hebrew, english);
    };
    set(Title, QStringLiteral("משלוח הזמנות מוגמרות"), QStringLiteral("Sending finished orders"));
    set(Label4Shalav1, QStringLiteral("שלב ראשון: איזו הזמנה לשלוח?"), QStringLiteral("Step one: which order?"));
    set(Label4Rek, QStringLiteral("אין במחשב זה הזמנות מוגמרות."),
        QStringLiteral("There are no finished orders on this computer."));
    set(Label4Bhar, QStringLiteral("נגיעה בהזמנה מציגה את הקבצים שלה."),
        QStringLiteral("Touch an order to see its files."));
    set(Label4Shalav2, QStringLiteral("שלב שני: אילו קבצים לשלוח? נגיעה בשורה מסמנת קובץ או מבטלת סימון."),
        QStringLiteral("Step two: which files? A touch marks a file, or takes its mark away."));
    set(Label4Files, QStringLiteral("קבצים בהזמנה"), QStringLiteral("files in this order"));
    set(Label4Prints, QStringLiteral("תמונות בקבצים שסומנו"), QStringLiteral("pictures in the marked files"));
    showWhatIsMarked();
    set(Label4Reka, QStringLiteral("אין בהזמנה זו קבצים לשליחה."),
        QStringLiteral("This order has no files that can be sent."));
    set(Label4Shalav3, QStringLiteral("שלב שלישי: איך לשלוח?"), QStringLiteral("Step three: how to send?"));
    set(Command1, QStringLiteral("בחר את כל הקבצים למשלוח"), QStringLiteral("Choose all the files"));
    set(Command21, QStringLiteral("בטל את כל הבחירה"), QStringLiteral("Cancel the whole choice"));
    set(Command4, QStringLiteral("   בצע משלוח"), QStringLiteral("   Send now"));
    set(Command2, QStringLiteral("שלח בדואר אלקטרוני"), QStringLiteral("Send by e-mail"));
    set(Command5, QStringLiteral("רענן רשימת הזמנות"), QStringLiteral("Refresh the list"));
    set(Command6, QStringLiteral("בטל הכל וצא מהתוכנה"), QStringLiteral("Cancel all and leave the program"));
    set(Command28, QStringLiteral("הזמנה חדשה"), QStringLiteral("New order"));
    set(Command4Orders, QStringLiteral("חזרה לרשימת ההזמנות"), QStringLiteral("Back to the orders"));
    set(Command4Pieces, QStringLiteral("חיתוך ואיחוד קבצים"), QStringLiteral("Cut and join files"));
    set(Command13, QStringLiteral("שלח לפ י שיטה 1"), QStringLiteral("Send by method 1"));
    set(Command18, QStringLiteral("Exit  יציאה"), QStringLiteral("Exit"));
    set(Command19, QStringLiteral("עצור משלוח"), QStringLiteral("Stop sending"));
    set(Label9, QStringLiteral("המשלוח חולק לחלקים קטנים"), QStringLiteral("The sending was cut into small parts"));
    set(Label2, QStringLiteral("התמונות ארוזות למשלוח והן תשלחנה ב"),
        QStringLiteral("The pictures are packed for sending and will go in"));
    set(Label3, QStringLiteral("מנות"), QStringLiteral("packages"));
    set(Label4Dakot, QStringLiteral("דקות במנה זו:"), QStringLiteral("Minutes on this package:"));
    set(Label24, QStringLiteral("לחצן יציאה יהיה פעיל לאחר משלוח כל המנות"),
        QStringLiteral("The exit button will work after all the packages are sent"));
    showWalk();
    showOutcome();
}

void MoogMeret::showWhatIsMarked() {
    Label4Pieces.text =
        List3.currentIndex() >= 0 && !TravelsInPieces(List3.currentItem())
            ? m_state.wording(
                  QStringLiteral("לאחר הזמנה בחלקים מסומנים רק חלקים (prk) ודף ההזמנה. את שאר הקבצים לשליחה "
                                 "יש לסמן בנגיעה."),
                  QStringLiteral("After an order in pieces only pieces (prk) and the order sheet are marked. "
                                 "Touch the other files that are to be sent."))
            : m_state.wording(QStringLiteral("ההזמנה נשלחת בחלקים: מסומנים החלקים (prk) ודף ההזמנה."),
                              QStringLiteral("The order travels in pieces: the pieces (prk) and the order sheet are "
                                             "marked."));
}

} // namespace lumora
