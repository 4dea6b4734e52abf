#include "entry/details/TileMenu.h"
#include "entry/details/nnn.h"

#include "order/ChoiceWords.h"
#include "order/HistoryState.h"
#include "order/OrderFolder.h"
#include "platform/Dialogs.h"
#include "session/CaptionTexts.h"

// What the page says.

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

struct TileText {
    const char16_t* hebrew;
    const char16_t* english;
    const char16_t* hebrewHint = u"";
    const char16_t* englishHint = u"";
};

constexpr std::array<TileText, TileCount> tileTexts = {{
    {u"הדפסת תמונות", u"Print pictures", u"בחירת גודל, נייר ומסגרת לכל ההזמנה",
     u"Choose size, paper and border for the whole order"},
    {u"הדפסה ועריכה", u"Edit and print", u"עריכת כל תמונה לפני ההדפסה", u"Edit each picture before it is printed"},
    {u"הדפסה ברצף", u"Print in sequence", u"בחירת התמונות ברצף אחד, גם תיקייה שלמה",
     u"Choose the pictures in one go, or a whole folder"},
    {u"מידע", u"Information"},
    {u"הזמנות קודמות ודואר", u"Earlier orders and mail", u"משלוח חוזר של הזמנה או משלוח בדואר",
     u"Send an order again, or send pictures by mail"},
    {u"יציאה", u"Exit"},
    {u"אלבום הורים", u"Parent album", u"הזמנת אלבום לצלמים", u"Albums for photographers"},
    {u"התחלה מחדש", u"Start again", u"חזרה לדף הפתיחה", u"Back to the start page"},
    {u"English", u"English"},
    {u"שירותים נוספים", u"More services"},
}};

} // namespace

void nnn::setTexts() {
    for (std::size_t i = 0; i < Image1.size(); ++i) {
        const TileText& text = tileTexts[i];
        Image1[i].text = m_state.wording(text.hebrew, text.english);
        Image1[i].hint = m_state.wording(text.hebrewHint, text.englishHint);
    }
    if (m_state.closedToCustomers())
        Image1[ExitTile].text = m_state.wording(u"לדף הפתיחה", u"To the first page");
    m_quickSizes = m_state.profile.QuickSizes;
    for (std::size_t i = 0; i < Option3.size(); ++i)
        Option3[i].text = paperKind(static_cast<int>(i));
    setCaptions(m_state, {
                             {LabelText2, u"שם פרטי ומשפחה", u"First and last name"},
                             {LabelText3, u"טלפון", u"Telephone"},
                             {LabelText4, u"כתובת למשלוח", u"Delivery address"},
                             {Check2, u"זכור פרטים לפעם הבאה", u"Remember my details for next time"},
                             {Command10, u"פרטים מהזיכרון", u"Details from memory"},
                             {Command12, u"המשך", u"Next"},
                             {Command8, u"המשך", u"Next"},
                             {Command6, u"המשך", u"Next"},
                             {Command3, u"המשך לבחירת התמונות", u"On to the pictures"},
                             {Command24, u"המשך לדף הבא", u"On to the next page"},
                             {Command4, u"חזור לאחור", u"Go back"},
                             {Command2, u"בטל", u"Cancel"},

                             {LabelSizes, u"גודל התמונות", u"Paper size"},
                             {LabelCombo1, u"גדלים נוספים", u"More sizes"},
                             {LabelKinds, u"סוג הנייר", u"Paper kind"},

                             {Image13[0], u"ללא מסגרת", u"No border"},
                             {Image13[1], u"מסגרת B7", u"Border B7"},
                             {Image13[2], u"מסגרת BB1", u"Border BB1"},
                             {Image13[3], u"מסגרת BB2", u"Border BB2"},
                             {Image13[4], u"מסגרת CA1", u"Border CA1"},
                             {Image13[5], u"מסגרת BB", u"Border BB"},
                             {Image13[6], u"מסגרת CA9", u"Border CA9"},
                             {Image13[7], u"מסגרת BL1", u"Border BL1"},
                             {Image13[8], u"מסגרת FA9", u"Border FA9"},
                             {Image13[9], u"מסגרת לבנה", u"White border"},

                             {Label2, u"FIT", u"FIT"},
                             {Label3, u"FIL", u"FIL"},
                             {Option4, u"כל התמונה על הנייר, עם שוליים", u"The whole picture, with margins"},
                             {Option5, u"מילוי כל הנייר, עם חיתוך", u"Fill the paper, edges are cut"},

                             {LabelChoice, u"מה שבחרתם", u"What you chose"},
                             {LabelCheck1, u"לפני שממשיכים", u"Before going on"},
                             {Check1, u"מסכים תנאי שימוש", u"I agree to the terms of use"},
                             {Command29, u"קרא תנאי שימוש", u"Read the terms of use"},
                             {Command30, u"סגור", u"Close"},
                             {LabelTerms, u"יש לסמן את תיבת ההסכמה לפני המעבר לבחירת התמונות",
                              u"Tick the box before you go on to the pictures"},
                             {Label8, u"V  V  V", u"V  V  V"},

                             {Command4Anglit, u"English"},
                             {Command4Ivrit, u"עברית"},
                             {Command14, u"ניקיון היסטוריה", u"Clean the history"},
                             {Command15, u"הבהרות ואזהרות", u"Clarifications and warnings"},
                             {Command7, u"נקה", u"Clean"},
                             {Command9, u"השאר", u"Keep them"},
                         });
    // The first and the last card say in their name how they look.
    for (std::size_t i = 1; i + 1 < Image13.size(); ++i)
        Image13[i].hint = borderWords(m_state, borderCode(static_cast<int>(i)));
    if (!Combo1.taken() && m_state.shemot.ppr != Combo1.text)
        Combo1.text = sizesPrompt();
    m_album.setTexts();
    showHistory(Frame1.visible ? HistoryState::of(m_state, m_platform.files) : HistoryState());
    showStep();
}

void nnn::showHistory(const HistoryState& history) {
    Frame1.text =
        m_state.wording(u"למחוק את קבצי ההדפסה של ההזמנות הקודמות?", u"Delete the print files of earlier orders?");
    if (history.count() > 0)
        Frame1.text += u'\n' + m_state
                                   .wording(u"הזמנות שלא הוכח שהגיעו: %1; של התחנה: %2; שיצאו בדואר: %3.",
                                            u"Orders not proven to have arrived: %1; of the local station: %2; sent by "
                                            "mail: %3.")
                                   .arg(history.notProven.size())
                                   .arg(history.station.size())
                                   .arg(history.mail.size());
}

bool nnn::asksToMarkLegacy(const HistoryState& history) {
    return m_platform.dialogs.ask(
        m_state
            .wording(u"%1 הזמנות הוכנו בגרסה קודמת. לסמן את כולן כהזמנות שהגיעו?",
                     u"%1 orders were made by an earlier version. Mark all of them as arrived?")
            .arg(history.legacy.size()));
}

bool nnn::asksToCleanNotProven(const HistoryState& history) {
    return m_platform.dialogs.ask(
        m_state
            .wording(u"למחוק גם את קבצי ההדפסה של %1 הזמנות שאינן בשרת בוודאות: שלא הוכח שהגיעו, של התחנה ושיצאו "
                     u"בדואר? אם לא, הם יישמרו.",
                     u"Delete also the print files of %1 orders that are not known to be on the server: not proven to "
                     u"have arrived, of the local station or sent by mail? If not, they are kept.")
            .arg(history.count()));
}

QString nnn::sizesPrompt() const {
    return m_state.wording(u"גדלים נוספים", u"More Sizes");
}

QString nnn::paperKind(int index) const {
    return index == 0 ? m_state.wording(u"מט", u"Matte") : m_state.wording(u"מבריק", u"Glossy");
}

bool nnn::termsAgreed(const CheckCaption& box) {
    if (!box.checked)
        tell(u"רק עם הנך מסכים מסכימה לתנאי שימוש \nסמן את התיבה   מסכים לתנאי שימוש\nתוכל לקרוא את תנאי השימוש אם "
             u"אינך יודע אותם",
             u"Please tick the box \"I agree to the terms of use\" before you go on.\nYou can read the terms here if "
             u"you do not know them.");
    return box.checked;
}

} // namespace lumora
