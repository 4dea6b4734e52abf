// All texts of the red-eye page.

#include "editing/redeye/RedI.h"

#include "session/SessionState.h"

namespace lumora {

void RedI::setTexts() {
    const auto say = [this](const char16_t* hebrew, const char16_t* english) {
        return m_state.wording(hebrew, english);
    };
    kofez.text = QStringLiteral("Kizoor");
    Label38.text =
        say(u"הצב העכבר על העין האדומה \r\nשנה את גודל העיגול הצהוב עם הגלגלת של העכבר\r\nעד אשר הוא יהיה תואם לגודל "
            u"האישון לא צריך לדייק מאוד\r\nאחר כך לחץ על הימני של העכבר ובחר תיקון בסיסי\r\nחזור כך עבור כל עין אדומה",
            u"Put the pointer on the red eye.\r\nTurn the mouse wheel until the yellow circle\r\nis about as large as "
            u"the pupil; it need not be exact.\r\nThen press the right button and choose Basic correction.\r\nDo the "
            u"same for each red eye.");
    switch (m_step) {
    case Step::FindEye:
        Label40.text = say(u"\r\nלחץ עם העכבר על העין האדומה\r\nוחזור לכאן וקרא הנחיות נוספות",
                           u"\r\nTap the red eye,\r\nthen come back here and read on");
        break;
    case Step::Place:
        Label40.text = say(u"בעזרת הלחצנים לחצני התכלת מתחת מקם את העיגול הצהוב מסביב לאישון",
                           u"With the light-blue buttons below, place the yellow circle round the pupil");
        break;
    case Step::Aim:
    case Step::Corrected:
        Label40.text = say(
            u"לאחר שמקמת את העיגול הצהב\r\nהשתמש בלחצנים הסגולים כדי להגדיל\r\nאו להקטין את העיגול שיהיה בגודל האישון "
            u"\r\nלעיתים לא חייבים לדייק\r\nיש ללחוץ לחיצה אחת ממושכת\r\nאחר כך חזור לכאן וקרא הנחיות להמשך",
            u"When the yellow circle is in place,\r\nuse the purple buttons to make it larger\r\nor smaller until it "
            u"fits the pupil.\r\nIt need not be exact.\r\nPress once and hold;\r\nthen come back here and read on");
        break;
    }
    Label41.text = say(u"לאחר שמקמת וכוונת העיגול הצהוב לחץ על תיקון",
                       u"When the yellow circle is in place and fits, press Correct");
    Label44.text = say(u"אם לא נעלם כל האודם\r\nלחץ שוב על לחצן תיקון \r\nלמטה משמאל\r\n",
                       u"If some of the red is left,\r\npress Correct once more,\r\nat the lower right\r\n");
    Label45.text = say(u" לחיצה רק לאחר \r\nשכל האודם בעיין נעלם \r\nכל לחיצה תשחיר יותר \r\nנא לא להגזים",
                       u" Press only when\r\nall the red has gone.\r\nEach press darkens more,\r\nso do not overdo it");
    Bsisi.text = say(u"תיקון בסיסי", u"Basic correction");
    amok2.text = say(u"תיקון נוסף 2", u"Further correction 2");
    amok3.text = say(u"תיקון נוסף  3", u"Further correction 3");
    amok4.text = say(u"תיקון נוסף  4", u"Further correction 4");
    amok5.text = say(u"תיקון נוסף 5", u"Further correction 5");
    amok.text = say(u"תיקון מעמיק", u"Deep correction");
    Memokad.text = say(u"תיקון ממוקד", u"Focused correction");
    Rstor.text = say(u"בטל תיקונים", u"Cancel corrections");
    LabelTitle.text = say(u"תיקון עיניים אדומות", u"Red-eye correction");
    Image2.text = say(u"תיקון", u"Correct");
    Image16.text = say(u"תיקון מעמיק", u"Correct deeper");
    Image6.text = say(u"השחר אישון", u"Darken pupil");
    Frame6.text = say(u"השחר", u"Darken");
    Image7.text = say(u"צעד אחורה", u"Undo");
    Image5.text = say(u"בטל תיקונים", u"Cancel all");
    Image8.text = say(u"אשר את התמונה", u"Accept");
    Image9.text = say(u"צא בלי לשמור", u"Leave without saving");
    Image10.text = say(u"הקטן עיגול", u"Smaller circle");
    Image11.text = say(u"הגדל עיגול", u"Larger circle");
    Image12.text = say(u"הזז עיגול למעלה", u"Circle up");
    Image13.text = say(u"הזז עיגול למטה", u"Circle down");
    Image14.text = say(u"הזז עיגול לשמאל", u"Circle left");
    Image15.text = say(u"הזז עיגול לימין", u"Circle right");
    Command3.text = say(u"תיקון ידני סביב מרכז העיגול", u"By hand, round the middle");
    Command6.text = say(u"צייר שוב את התמונה הקטנה", u"Draw the small picture again");
    Command13.text = say(u"חפש את האדום החזק", u"Find the strongest red");
    CommandCloser.text = say(u"הצג מקרוב", u"Closer");
    CommandFurther.text = say(u"הצג מרחוק", u"Further");
    Image2.hint = say(u"מוריד את האדום מתוך העיגול", u"Takes the red out of the circle");
    Image16.hint = say(u"כל לחיצה מורידה עוד אדום", u"Each press takes out more red");
    Image7.hint = say(u"מבטל את התיקון האחרון", u"Takes back the last correction");
    Image5.hint = say(u"מחזיר את התמונה כפי שהייתה", u"Brings the picture back as it was");
    Image8.hint = say(u"שומר את התיקונים וחוזר לעריכה", u"Keeps the corrections and goes back to the editor");
    Image9.hint = say(u"חוזר לעריכה בלי התיקונים", u"Goes back to the editor without the corrections");
    CommandMenu.text = say(u"עוד תיקונים", u"More corrections");
    CommandMenuClose.text = say(u"חזור לתמונה", u"Back to the picture");
    CommandHelp.text = say(u"הסבר", u"Help");
    CommandHelpClose.text = say(u"הבנתי", u"I see");
    FrameHelp.text = say(u"כך מתקנים עין אדומה", u"How to correct a red eye");
    words.steps = {say(u"הקש על העין", u"Tap the red eye"), say(u"התאם את העיגול", u"Fit the circle"),
                   say(u"לחץ על תיקון", u"Press Correct"), say(u"אשר את התמונה", u"Accept")};
    words.picture = say(u"התמונה: %1", u"The picture: %1");
    words.overview = say(u"התמונה כולה, הקש על העין האדומה", u"The whole picture: tap the red eye");
    Label40.visible = m_step != Step::Corrected;
    Label41.visible = m_step == Step::Aim;
    Label44.visible = m_step == Step::Corrected;
    const QString hold = say(u" (לחיצה ממושכת)", u" (press and hold)");
    for (Caption* button : {&Image10, &Image11, &Image12, &Image13, &Image14, &Image15})
        button->hint = button->text + hold;
    Image6.hint = Label45.text.simplified();
    showState();
}

QString RedI::helpText() const {
    return Label41.text + u'\n' + Label44.text.trimmed() + u'\n' + Label45.text.trimmed();
}

} // namespace lumora
