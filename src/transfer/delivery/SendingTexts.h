#pragma once

#include "transfer/delivery/SendingPhase.h"

// The words that the phases of both sending pages share.
namespace lumora {

inline constexpr SendingWords sendingTitle{u"שליחת ההזמנה", u"Sending your order"};
inline constexpr SendingWords readyTitle{u"ההזמנה מוכנה לשליחה", u"Your order is ready to be sent"};
inline constexpr SendingWords sentTitle{u"ההזמנה נשלחה", u"Your order was sent"};
inline constexpr SendingWords notCompleteTitle{u"השליחה לא הושלמה", u"The sending is not complete"};

inline constexpr SendingWords noOrderAdvice{u"אין כאן הזמנה לשליחה.", u"There is no order to send here."};
inline constexpr SendingWords refusedAdvice{
    u"לא נשלח דבר. ההזמנה שמורה במחשב זה וניתן לשלוח אותה מתוך ההזמנות המוכנות.",
    u"Nothing was sent. The order is kept on this computer and can be sent from the finished orders."};
inline constexpr SendingWords noServerAdvice{
    u"לא הוגדר שרת לקבלת הזמנות. ההזמנה שמורה במחשב זה. יש להודיע לחנות.",
    u"No server is set for orders. The order is kept on this computer. Please tell the shop."};
inline constexpr SendingWords readyAdvice{u"ההזמנה מוכנה. השליחה תתחיל מעצמה בתום הספירה.",
                                          u"The order is ready. Sending begins by itself when the count ends."};
inline constexpr SendingWords answerAwaitedAdvice{u"לפני השליחה יש לענות על התמונות שאינן בהזמנה.",
                                                  u"Before the sending, please answer about the pictures left out."};
inline constexpr SendingWords sendingAdvice{u"ההזמנה נשלחת. נא לא לסגור את התוכנה.",
                                            u"The order is being sent. Please do not close the program."};
inline constexpr SendingWords checkingAdvice{u"בודקים אילו קבצים הגיעו לשרת. נא להמתין.",
                                             u"Checking which files have arrived. Please wait."};
inline constexpr SendingWords reportingAdvice{u"כל ההזמנה הגיעה. מודיעים לחנות, נא להמתין.",
                                              u"The whole order has arrived. Telling the shop, please wait."};
inline constexpr SendingWords partReportingAdvice{u"מה שבהזמנה הגיע. מודיעים לחנות, נא להמתין.",
                                                  u"What is in the order has arrived. Telling the shop, please wait."};
inline constexpr SendingWords sentAdvice{u"כל ההזמנה הגיעה. אפשר לסגור או להתחיל הזמנה חדשה.",
                                         u"The whole order has arrived. You can close, or begin a new order."};
inline constexpr SendingWords partSentAdvice{u"מה שבהזמנה הגיע. אפשר לסגור או להתחיל הזמנה חדשה.",
                                             u"What is in the order has arrived. You can close, or begin a new order."};
// A kiosk is closed by nobody, and its finished orders are the staff's.
inline constexpr SendingWords toFirstPageWords{u"לדף הפתיחה", u"To the first page"};
inline constexpr SendingWords kioskSendingAdvice{u"ההזמנה נשלחת. נא להמתין.", u"The order is being sent. Please wait."};
inline constexpr SendingWords kioskRefusedAdvice{
    u"לא נשלח דבר. ההזמנה שמורה במחשב זה. יש לפנות לצוות החנות.",
    u"Nothing was sent. The order is kept on this computer. Please tell the staff of the shop."};
// %1: files on the server, %2: files of the order.
inline constexpr SendingWords kioskPartThereAdvice{
    u"כל %2 הקבצים שנבחרו נמצאים בשרת, ובתיקייה שם %1 קבצים, אך ההזמנה אינה שלמה שם. יש לפנות לצוות החנות.",
    u"All %2 chosen files are on the server, whose folder holds %1, but the order is not whole there. Please tell the "
    u"staff of the shop."};
inline constexpr SendingWords kioskSentAdvice{u"כל ההזמנה הגיעה. אפשר להתחיל הזמנה חדשה.",
                                              u"The whole order has arrived. You can begin a new order."};
inline constexpr SendingWords kioskPartSentAdvice{u"מה שבהזמנה הגיע. אפשר להתחיל הזמנה חדשה.",
                                                  u"What is in the order has arrived. You can begin a new order."};
inline constexpr SendingWords untoldAdvice{
    u"ההזמנה הגיעה, ולא ידוע אם המעבדה קיבלה על כך הודעה. יש להודיע על כך לחנות.",
    u"Your order has arrived, and it is not known whether the lab was told of it. Please tell the shop."};
inline constexpr SendingWords callLabAdvice{u"ההזמנה שמורה במחשב זה. יש להתקשר למעבדה.",
                                            u"The order is kept on this computer. Please call the lab."};

inline constexpr SendingWords changeWords{u"שינוי ההזמנה", u"Change the order"};
inline constexpr SendingWords thanksWords{u"תודה!", u"Thank you!"};
// %1: the customer's first name, which may be of another direction than the sentence.
inline constexpr SendingWords thanksByNameWords{u"תודה, \u2068%1\u2069!", u"Thank you, \u2068%1\u2069!"};
inline constexpr SendingWords nextStepsWords{u"עכשיו המעבדה מדפיסה את התמונות.", u"The lab prints your pictures now."};
// %1: the lab's telephone.
inline constexpr SendingWords forQuestionsWords{u" לשאלות, לאיסוף ולתשלום: %1",
                                                u" For questions, collecting and payment: %1"};
inline constexpr SendingWords slipNumberWords{u"מספר ההזמנה", u"Order number"};
inline constexpr SendingWords slipPrintsWords{u"תמונות", u"Prints"};
inline constexpr SendingWords slipTelephoneWords{u"טלפון", u"Telephone"};
inline constexpr SendingWords slipTakenWords{u"הפתק שלכם מודפס. נא לקחת אותו.",
                                             u"Your slip is being printed. Please take it."};
inline constexpr SendingWords slipCodeWords{u"קוד של ההזמנה, לסריקה בחנות",
                                            u"A code of the order, to scan in the shop"};
inline constexpr SendingWords cardMayGoWords{u"אפשר להוציא עכשיו את הכרטיס.", u"You can take your card out now."};

inline constexpr SendingWords goesOnByItselfAdvice{
    u"ההזמנה שמורה במחשב זה, ואנחנו ממשיכים לשלוח אותה. אין צורך להמתין.",
    u"Your order is kept on this computer. We go on sending it; you need not wait."};
// %1: the lab's telephone.
inline constexpr SendingWords labPhoneAdvice{u" טלפון המעבדה: %1", u" The lab's telephone: %1"};

// %1: the number.
inline constexpr SendingWords numberTakenWords{
    u"המספר %1 כבר שייך בשרת להזמנה אחרת. ההזמנה תוכן מחדש במספר אחר.",
    u"Number %1 already belongs to another order on the server. Your order is prepared again under another number."};
inline constexpr SendingWords notKeptWords{
    u"לא ניתן לרשום במחשב זה עד היכן הגיעה השליחה. השליחה נמשכת. יש לפנות מקום בדיסק או לתקן את ההרשאות של תיקיית "
    u"הנתונים.",
    u"How far the sending has come can't be written on this computer. The sending goes on. Free some disk space, or "
    u"correct the permissions of the data folder."};
inline constexpr SendingWords byNamesOnlyWords{u"ההגעה הוכחה לפי שמות בלבד: השרת אינו מוסר אורכים.",
                                               u"Arrival is proven by names only: the server tells no lengths."};
inline constexpr SendingWords reportUnknownWords{
    u"הדיווח למעבדה התחיל, ולא ידוע אם התקבל. לפני דיווח נוסף יש לשאול במעבדה.",
    u"The report to the lab was begun; whether the lab has got it is not known. Ask the lab before you report again."};
inline constexpr SendingWords reportAgainWords{u"דווח שוב", u"Report again"};

inline constexpr SendingWords fewerReportingWords{u"ההזמנה הגיעה. מודיעים לחנות, נא להמתין.",
                                                  u"Your order has arrived. Telling the shop, please wait."};
// %1: prints that have arrived, %2: prints that the order's log names.
inline constexpr SendingWords fewerToldWords{
    u"הגיעו %1 מתוך %2 התמונות שברישום ההזמנה, כפי שאישרתם, והמעבדה קיבלה על כך הודעה.",
    u"%1 of the %2 pictures in the order's log have arrived, as you agreed, and the lab was told."};
inline constexpr SendingWords fewerArrivedWords{
    u"הגיעו %1 מתוך %2 התמונות שברישום ההזמנה, כפי שאישרתם.",
    u"%1 of the %2 pictures in the order's log have arrived, as you agreed."};
inline constexpr SendingWords fewerUntoldWords{
    u"הגיעו %1 מתוך %2 התמונות שברישום ההזמנה, והמעבדה לא קיבלה על כך הודעה. יש להתקשר למעבדה.",
    u"%1 of the %2 pictures in the order's log have arrived, and the lab was not told. Please call the lab."};

} // namespace lumora
