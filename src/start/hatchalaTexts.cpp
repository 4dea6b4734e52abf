// The wording of the start page, in both languages.
#include "order/KioskOffer.h"
#include "platform/Dialogs.h"
#include "session/CaptionTexts.h"
#include "session/LeftOutBox.h"
#include "session/SessionState.h"
#include "start/ShopRows.h"
#include "start/hatchala.h"

#include <QUrl>

namespace lumora {

using namespace Qt::StringLiterals;

void hatchala::setTexts() {
    offerToStaff();
    setCaptions(m_state,
                {
                    {Title, u"ברוכים הבאים", u"Welcome"},
                    {Label4How, u"הדפסת תמונות בשלושה צעדים פשוטים:", u"Printing pictures takes three simple steps:"},
                    {Label4Step[0], u"בוחרים תמונות מהמחשב, מכרטיס הזיכרון או מהמצלמה",
                     u"Choose pictures from the computer, a memory card or a camera"},
                    {Label4Step[1], u"בוחרים גודל, סוג נייר וכמות", u"Choose the size, the paper and how many"},
                    {Label4Step[2], u"התוכנה שולחת את ההזמנה למעבדה", u"The program sends the order to the lab"},
                    {Image1, u"התחל", u"Start", u"", u"Start Button"},
                    {Image11, u"מחירון", u"Price list", u"", u"Navigate to Price List Page on the web"},
                    {Image5, u"לאתר שלנו", u"Our site", u"", u"Navigate to our site"},
                    {Image6, u"יצירת קשר עם המעבדה", u"Reach the lab"},
                    {Image3, u"יציאה", u"Exit", u"", u"Exit this program"},
                    {Check1, u"English Tips"},
                    {Command4Ivrit, u"עברית"},
                    {Label3, u"", u"With this button \nyou can navigaet \nTo our site"},
                    {Label4, u"", u"With this button \nyou can exit \n"},
                    {Picture3, u"מה עושה הכפתור?",
                     u" please select \n Wher do you want \n to recieve the \n Printed Pictures "},
                    {List1Caption, u"היכן תרצו לקבל את התמונות?",
                     u"please select\nWher do you want\nto recieve the\nPrinted Pictures"},
                    {shopsBack, u"חזרה", u"Back"},
                    {Label7, u"מיד מתחילים", u"Starting right away"},
                    {Label8, u"V  V  V"},
                    {Pic4Hemshech, u"הזמנה לא הושלמה", u"An order was not finished"},
                    {Command4Bitul, u"זרוק", u"Throw away"},
                    {Command1, u"משלוח", u"Sending"},
                    {Command2, u"התחל", u"Start"},
                    {Command3, u"Read"},
                    {Command4, u"myzofen"},
                    {Command5, u"shoora"},
                    {Command6, u"open zofen"},
                });
    Image8.text = QUrl(m_state.profile.SiteUrl).host();
    Check1.visible = !m_state.english();
    Command4Ivrit.visible = m_state.english();
    Label3.visible = Label4.visible = m_state.english();
    Image3.visible = !m_state.closedToCustomers();
    Label4.visible = Label4.visible && Image3.visible;
    setHelp();
    showOffer();
    showWaiting();
    showKept();

    const int chosen = List1.currentIndex();
    List1.clear();
    List1.append(ShopRows(m_state, m_deployment).texts());
    List1.setCurrentIndex(chosen);
    showProfile();
    Q_EMIT changed();
}

void hatchala::showKept() {
    Notice.visible = !m_kept.number.isEmpty();
    Notice.text =
        m_state.wording(u"הזמנה מספר %1 מוכנה ונשמרה בתחנה.", u"Order number %1 is ready and kept at this station.")
            .arg(m_kept.number);
    if (m_kept.leftOut > 0)
        Notice.text += u' ' + LeftOutText(m_state, m_kept.leftOut);
}

void hatchala::showOffer() {
    Pic4Hemshech.visible = !m_unfinished.isEmpty();
    Q_EMIT changed();
    if (m_unfinished.isEmpty())
        return;
    const bool digits = asksForDigits();
    Command4Hemshech.visible = Command4Bitul.visible = !digits;
    Label4Sfarot.visible = Command4Mehak.visible = digits;
    for (Caption& digit : Command4Sifra)
        digit.visible = digits;
    if (digits) {
        showDigits();
        return;
    }
    const UnfinishedOrder& order = m_unfinished.first();
    Command4Hemshech.enabled = !m_asksForGone || !order.lacksAllPictures();
    setCaptions(m_state, {
                             {Command4Hemshech, m_asksForGone ? u"המשך בלעדיהן" : u"המשך",
                              m_asksForGone ? u"Go on without them" : u"Go on"},
                             {Command4Achar, m_asksForGone ? u"המתן" : u"אחר כך", m_asksForGone ? u"Wait" : u"Later"},
                         });
    Label4Hemshech.text = offerText(order);
    Label4Od.visible = !m_asksForGone && m_unfinished.size() > 1;
    Label4Od.text = m_state.wording(u"ועוד הזמנות שלא הושלמו: %1", u"More orders that were not finished: %1")
                        .arg(m_unfinished.size() - 1);
}

// Nothing here tells whose order it is.
void hatchala::showDigits() {
    setCaptions(m_state,
                {
                    {Command4Achar, u"זו לא ההזמנה שלי", u"It is not my order"},
                    {Label4Hemshech, u"זו ההזמנה שלכם? נא להקיש את שלוש הספרות האחרונות של מספר הטלפון שבהזמנה.",
                     u"Is it yours? Type the last three digits of the telephone number of the order."},
                    {Label4Od, u"הספרות אינן מתאימות. נא לנסות שוב.", u"These digits do not match. Please try again."},
                    {Command4Mehak, u"", u"", u"מחק ספרה", u"Take back a digit"},
                });
    Label4Od.visible = m_wrongDigits > 0 && m_digits.isEmpty();
    Label4Sfarot.text = m_digits.leftJustified(telephoneEnd, u'_').split(QString(), Qt::SkipEmptyParts).join(u' ');
    for (std::size_t i = 0; i < Command4Sifra.size(); ++i)
        Command4Sifra[i].text = QString::number(i);
}

QString hatchala::offerText(const UnfinishedOrder& order) const {
    const QString& number = order.state.number;
    if (m_asksForGone)
        return GoneText(m_state, order);
    switch (order.state.phase) {
    case OrderState::Phase::Preparing:
        return m_state
            .wording(u"הזמנה מספר %1: הוכנו %2 מתוך %3 תמונות.", u"Order number %1: %2 of %3 pictures are prepared.")
            .arg(number)
            .arg(order.prepared)
            .arg(order.pictures);
    case OrderState::Phase::Prepared:
        return m_state.wording(u"הזמנה מספר %1 מוכנה ועדיין לא נשלחה.", u"Order number %1 is ready and was not sent.")
            .arg(number);
    case OrderState::Phase::Arrived:
        return m_state
            .wording(u"הזמנה מספר %1 הגיעה, והמעבדה עדיין לא קיבלה על כך הודעה.",
                     u"Order number %1 has arrived, and the lab was not told of it yet.")
            .arg(number);
    default:
        break;
    }
    if (order.state.filesInAll == 0)
        return m_state
            .wording(u"השליחה של הזמנה מספר %1 לא הושלמה.", u"The sending of order number %1 was not finished.")
            .arg(number);
    return m_state
        .wording(u"השליחה של הזמנה מספר %1 לא הושלמה: נשלחו %2 מתוך %3 קבצים.",
                 u"The sending of order number %1 was not finished: %2 of %3 files were sent.")
        .arg(number)
        .arg(order.state.filesSent)
        .arg(order.state.filesInAll);
}

void hatchala::showWaiting() {
    const int count = m_state.waitingOrders;
    QStringList notes;
    if (count == 1)
        notes += m_state.wording(u"הזמנה אחת ממתינה לשליחה", u"1 order waits to be sent");
    else if (count > 1)
        notes += m_state.wording(u"%1 הזמנות ממתינות לשליחה", u"%1 orders wait to be sent").arg(count);
    if (!m_state.slipTrouble.isEmpty())
        notes += m_state.wording(u"מדפסת הפתקים אינה מדפיסה", u"the printer of the slips does not print");
    Label4Mamtinot.visible = !notes.isEmpty();
    Label4Mamtinot.text = notes.join(u" · "_s);
    Label4Mamtinot.hint = m_state.slipTrouble;
}

bool hatchala::asksToThrowAway(const QString& number) {
    return m_platform.dialogs.ask(ThrowAwayQuestion(m_state, number));
}

void hatchala::setHelp() {
    const auto help = [this](Hover over, const QString& hebrew, const QString& english) {
        Image12[static_cast<std::size_t>(over)].text = m_state.wording(hebrew, english);
    };
    help(Hover::Image1, u"מתחילים הזמנה חדשה: פרטים, תמונות ומשלוח למעבדה"_s,
         u"Begins a new order: your details, your pictures, and off to the lab"_s);
    help(Hover::Image11, u"מציג את מחירי ההדפסה באתר שלנו"_s, u"Shows the prices of prints on our web site"_s);
    help(Hover::Image5, u"פותח את אתר האינטרנט שלנו"_s, u"Opens our web site"_s);
    help(Hover::Image3, u"סוגר את התוכנה. דבר אינו נשלח"_s, u"Ends the program. Nothing is sent"_s);
    help(Hover::Image6, u"יש שאלה? נשמח לעזור בטלפון או בדואר אלקטרוני"_s,
         u"Any question? We are glad to help, by telephone or by e-mail"_s);
}

} // namespace lumora
