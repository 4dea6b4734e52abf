// The wording of the start page, in both languages.
#include "session/SessionState.h"
#include "start/hatchala.h"

#include <QUrl>

namespace lumora {

using namespace Qt::StringLiterals;

void hatchala::setTexts() {
    const auto set = [this](Caption& control, const QString& hebrew, const QString& english) {
        control.text = m_state.wording(hebrew, english);
    };
    const auto hint = [this](Caption& control, const QString& english) { control.hint = m_state.wording({}, english); };
    set(Title, u"ברוכים הבאים"_s, u"Welcome"_s);
    set(Label4How, u"הדפסת תמונות בשלושה צעדים פשוטים:"_s, u"Printing pictures takes three simple steps:"_s);
    set(Label4Step[0], u"בוחרים תמונות מהמחשב, מכרטיס הזיכרון או מהמצלמה"_s,
        u"Choose pictures from the computer, a memory card or a camera"_s);
    set(Label4Step[1], u"בוחרים גודל, סוג נייר וכמות"_s, u"Choose the size, the paper and how many"_s);
    set(Label4Step[2], u"התוכנה שולחת את ההזמנה למעבדה"_s, u"The program sends the order to the lab"_s);
    set(Image1, u"התחל"_s, u"Start"_s);
    set(Image11, u"מחירון"_s, u"Price list"_s);
    set(Image5, u"לאתר שלנו"_s, u"Our site"_s);
    Image8.text = QUrl(m_state.profile.SiteUrl).host();
    set(Image6, u"יצירת קשר עם המעבדה"_s, u"Reach the lab"_s);
    set(Image3, u"יציאה"_s, u"Exit"_s);
    hint(Image1, u"Start Button"_s);
    hint(Image11, u"Navigate to Price List Page on the web"_s);
    hint(Image5, u"Navigate to our site"_s);
    hint(Image3, u"Exit this program"_s);
    Check1.text = u"English Tips"_s;
    set(Label3, {}, u"With this button \nyou can navigaet \nTo our site"_s);
    set(Label4, {}, u"With this button \nyou can exit \n"_s);
    Label3.visible = Label4.visible = m_state.english();
    set(Picture3, u"מה עושה הכפתור?"_s, u" please select \n Wher do you want \n to recieve the \n Printed Pictures "_s);
    set(List1Caption, u"היכן תרצו לקבל את התמונות?"_s,
        u"please select\nWher do you want\nto recieve the\nPrinted Pictures"_s);
    set(shopsBack, u"חזרה"_s, u"Back"_s);
    setHelp();
    set(Label7, u"מיד מתחילים"_s, u"Starting right away"_s);
    Label8.text = u"V  V  V"_s;
    set(Command1, u"משלוח"_s, u"Sending"_s);
    set(Command2, u"התחל"_s, u"Start"_s);
    Command3.text = u"Read"_s;
    Command4.text = u"myzofen"_s;
    Command5.text = u"shoora"_s;
    Command6.text = u"open zofen"_s;

    const int chosen = List1.currentIndex();
    List1.clear();
    if (m_state.english()) {
        List1.append({u"* Recieve by Postmail "_s, u"* Get at stor "_s});
    } else {
        for (const Shop& shop : m_deployment.profile.Shops)
            List1.append(u"* "_s + shop.name);
    }
    List1.setCurrentIndex(chosen);
    showProfile();
    Q_EMIT changed();
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
