// What the red-eye page says.
#include "editing/redeye/RedI.h"
#include "session/CaptionTexts.h"

namespace lumora {
namespace {

struct StepText {
    const char16_t* hebrew;
    const char16_t* english;
};

// What to do next, by the page's step: to find the eye, to place the circle, to fit it, and once it was corrected.
constexpr StepText fitTheCircle = {
    u"לאחר שמקמת את העיגול הצהב\r\nהשתמש בלחצנים הסגולים כדי להגדיל\r\nאו להקטין את העיגול שיהיה בגודל האישון "
    u"\r\nלעיתים לא חייבים לדייק\r\nיש ללחוץ לחיצה אחת ממושכת\r\nאחר כך חזור לכאן וקרא הנחיות להמשך",
    u"When the yellow circle is in place,\r\nuse the purple buttons to make it larger\r\nor smaller until it "
    u"fits the pupil.\r\nIt need not be exact.\r\nPress once and hold;\r\nthen come back here and read on"};
constexpr std::array<StepText, 4> instructions = {
    {{u"\r\nלחץ עם העכבר על העין האדומה\r\nוחזור לכאן וקרא הנחיות נוספות",
      u"\r\nTap the red eye,\r\nthen come back here and read on"},
     {u"בעזרת הלחצנים לחצני התכלת מתחת מקם את העיגול הצהוב מסביב לאישון",
      u"With the light-blue buttons below, place the yellow circle round the pupil"},
     fitTheCircle,
     fitTheCircle}};

} // namespace

void RedI::setTexts() {
    const StepText& instruction = instructions[static_cast<std::size_t>(m_step)];
    setCaptions(
        m_state,
        {
            {kofez, u"Kizoor"},
            {Label38,
             u"הצב העכבר על העין האדומה \r\nשנה את גודל העיגול הצהוב עם הגלגלת של העכבר\r\nעד אשר הוא יהיה תואם לגודל "
             u"האישון לא צריך לדייק מאוד\r\nאחר כך לחץ על הימני של העכבר ובחר תיקון בסיסי\r\nחזור כך עבור כל עין אדומה",
             u"Put the pointer on the red eye.\r\nTurn the mouse wheel until the yellow circle\r\nis about as large as "
             u"the pupil; it need not be exact.\r\nThen press the right button and choose Basic correction.\r\nDo the "
             u"same for each red eye."},
            {Label40, instruction.hebrew, instruction.english},
            {Label41, u"לאחר שמקמת וכוונת העיגול הצהוב לחץ על תיקון",
             u"When the yellow circle is in place and fits, press Correct"},
            {Label44, u"אם לא נעלם כל האודם\r\nלחץ שוב על לחצן תיקון \r\nלמטה משמאל\r\n",
             u"If some of the red is left,\r\npress Correct once more,\r\nat the lower right\r\n"},
            {Label45, u" לחיצה רק לאחר \r\nשכל האודם בעיין נעלם \r\nכל לחיצה תשחיר יותר \r\nנא לא להגזים",
             u" Press only when\r\nall the red has gone.\r\nEach press darkens more,\r\nso do not overdo it"},
            {Bsisi, u"תיקון בסיסי", u"Basic correction"},
            {amok2, u"תיקון נוסף 2", u"Further correction 2"},
            {amok3, u"תיקון נוסף  3", u"Further correction 3"},
            {amok4, u"תיקון נוסף  4", u"Further correction 4"},
            {amok5, u"תיקון נוסף 5", u"Further correction 5"},
            {amok, u"תיקון מעמיק", u"Deep correction"},
            {Memokad, u"תיקון ממוקד", u"Focused correction"},
            {Rstor, u"בטל תיקונים", u"Cancel corrections"},
            {LabelTitle, u"תיקון עיניים אדומות", u"Red-eye correction"},
            {Image2, u"תיקון", u"Correct", u"מוריד את האדום מתוך העיגול", u"Takes the red out of the circle"},
            {Image16, u"תיקון מעמיק", u"Correct deeper", u"כל לחיצה מורידה עוד אדום", u"Each press takes out more red"},
            {Image6, u"השחר אישון", u"Darken pupil"},
            {Frame6, u"השחר", u"Darken"},
            {Image7, u"צעד אחורה", u"Undo", u"מבטל את התיקון האחרון", u"Takes back the last correction"},
            {Image5, u"בטל תיקונים", u"Cancel all", u"מחזיר את התמונה כפי שהייתה",
             u"Brings the picture back as it was"},
            {Image8, u"אשר את התמונה", u"Accept", u"שומר את התיקונים וחוזר לעריכה",
             u"Keeps the corrections and goes back to the editor"},
            {Image9, u"צא בלי לשמור", u"Leave without saving", u"חוזר לעריכה בלי התיקונים",
             u"Goes back to the editor without the corrections"},
            {Image10, u"הקטן עיגול", u"Smaller circle"},
            {Image11, u"הגדל עיגול", u"Larger circle"},
            {Image12, u"הזז עיגול למעלה", u"Circle up"},
            {Image13, u"הזז עיגול למטה", u"Circle down"},
            {Image14, u"הזז עיגול לשמאל", u"Circle left"},
            {Image15, u"הזז עיגול לימין", u"Circle right"},
            {Command3, u"תיקון ידני סביב מרכז העיגול", u"By hand, round the middle"},
            {Command6, u"צייר שוב את התמונה הקטנה", u"Draw the small picture again"},
            {Command13, u"חפש את האדום החזק", u"Find the strongest red"},
            {CommandCloser, u"הצג מקרוב", u"Closer"},
            {CommandFurther, u"הצג מרחוק", u"Further"},
            {CommandMenu, u"עוד תיקונים", u"More corrections"},
            {CommandMenuClose, u"חזור לתמונה", u"Back to the picture"},
            {CommandHelp, u"הסבר", u"Help"},
            {CommandHelpClose, u"הבנתי", u"I see"},
            {FrameHelp, u"כך מתקנים עין אדומה", u"How to correct a red eye"},
        });
    setWordings(m_state,
                {
                    {words.steps[0], u"הקשה על העין", u"Tap the red eye"},
                    {words.steps[1], u"התאמת העיגול", u"Fit the circle"},
                    {words.steps[2], u"לחיצה על תיקון", u"Press Correct"},
                    {words.steps[3], u"אישור התמונה", u"Accept"},
                    {words.picture, u"התמונה: %1", u"The picture: %1"},
                    {words.overview, u"התמונה כולה: יש להקיש על העין האדומה", u"The whole picture: tap the red eye"},
                });
    Label40.visible = m_step != Step::Corrected;
    Label41.visible = m_step == Step::Aim;
    Label44.visible = m_step == Step::Corrected;
    const QString hold = m_state.wording(u" (לחיצה ממושכת)", u" (press and hold)");
    for (Caption* button : {&Image10, &Image11, &Image12, &Image13, &Image14, &Image15})
        button->hint = button->text + hold;
    Image6.hint = Label45.text.simplified();
    showState();
}

QString RedI::helpText() const {
    return Label41.text + u'\n' + Label44.text.trimmed() + u'\n' + Label45.text.trimmed();
}

} // namespace lumora
