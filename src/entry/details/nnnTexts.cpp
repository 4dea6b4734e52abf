#include "entry/details/TileMenu.h"
#include "entry/details/nnn.h"

#include "common/DrivePathText.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

// What the page says and shows; nnn.cpp has what the customer does on it.

namespace lumora {

namespace {

struct TileText {
    QString hebrew;
    QString english;
    QString hebrewHint;
    QString englishHint;
};

const std::array<TileText, TileCount>& tileTexts() {
    static const std::array<TileText, TileCount> texts = {{
        {u"הדפסת תמונות"_qs, u"Print pictures"_qs, u"בחירת גודל, נייר ומסגרת לכל ההזמנה"_qs,
         u"Choose size, paper and border for the whole order"_qs},
        {u"הדפסה ועריכה"_qs, u"Edit and print"_qs, u"עריכת כל תמונה לפני ההדפסה"_qs,
         u"Edit each picture before it is printed"_qs},
        {u"הדפסה ברצף"_qs, u"Print in sequence"_qs, u"בחירת התמונות ברצף אחד, גם תיקייה שלמה"_qs,
         u"Choose the pictures in one go, or a whole folder"_qs},
        {u"מידע"_qs, u"Information"_qs, {}, {}},
        {u"הזמנות קודמות ודואר"_qs, u"Earlier orders and mail"_qs, u"משלוח חוזר של הזמנה או משלוח בדואר"_qs,
         u"Send an order again, or send pictures by mail"_qs},
        {u"יציאה"_qs, u"Exit"_qs, {}, {}},
        {u"אלבום הורים"_qs, u"Parent album"_qs, u"הזמנת אלבום לצלמים"_qs, u"Albums for photographers"_qs},
        {u"התחלה מחדש"_qs, u"Start again"_qs, u"חזרה לדף הפתיחה"_qs, u"Back to the start page"_qs},
        {u"English"_qs, u"English"_qs, {}, {}},
        {u"שירותים נוספים"_qs, u"More services"_qs, {}, {}},
    }};
    return texts;
}

} // namespace

void nnn::Command5_Click() {
    m_messages = detailsMessages(m_state.english());
    setTexts();
}

void nnn::setTexts() {
    const SessionState& s = m_state;
    for (std::size_t i = 0; i < Image1.size(); ++i) {
        const TileText& text = tileTexts()[i];
        Image1[i].text = s.wording(text.hebrew, text.english);
        Image1[i].hint = s.wording(text.hebrewHint, text.englishHint);
    }
    LabelText2.text = s.wording(u"שם פרטי ומשפחה"_qs, u"First and last name"_qs);
    LabelText3.text = s.wording(u"טלפון"_qs, u"Telephone"_qs);
    LabelText4.text = s.wording(u"כתובת למשלוח"_qs, u"Delivery address"_qs);
    Check2.text = s.wording(u"זכור פרטים לפעם הבאה"_qs, u"Remember my details for next time"_qs);
    Command10.text = s.wording(u"פרטים מהזיכרון"_qs, u"Details from memory"_qs);
    Command12.text = s.wording(u"המשך"_qs, u"Next"_qs);
    Command8.text = Command12.text;
    Command6.text = Command12.text;
    Command3.text = s.wording(u"המשך לבחירת התמונות"_qs, u"On to the pictures"_qs);
    Command24.text = s.wording(u"המשך לדף הבא"_qs, u"On to the next page"_qs);
    Command4.text = s.wording(u"חזור לאחור"_qs, u"Go back"_qs);
    Command2.text = s.wording(u"בטל"_qs, u"Cancel"_qs);

    LabelSizes.text = s.wording(u"גודל התמונות"_qs, u"Paper size"_qs);
    LabelKinds.text = s.wording(u"סוג הנייר"_qs, u"Paper kind"_qs);
    for (std::size_t i = 0; i < Option1.size(); ++i)
        Option1[i].text = m_state.profile.QuickSizes[i];
    Option3[0].text = s.wording(u"מט"_qs, u"Matte"_qs);
    Option3[1].text = s.wording(u"מבריק"_qs, u"Glossy"_qs);

    const std::array<QString, 10> hebrewBorders = {u"ללא מסגרת"_qs, u"מסגרת B7"_qs,  u"מסגרת BB1"_qs, u"מסגרת BB2"_qs,
                                                   u"מסגרת CA1"_qs, u"מסגרת BB"_qs,  u"מסגרת CA9"_qs, u"מסגרת BL1"_qs,
                                                   u"מסגרת FA9"_qs, u"מסגרת לבנה"_qs};
    const std::array<QString, 10> englishBorders = {
        u"No border"_qs, u"Border B7"_qs,  u"Border BB1"_qs, u"Border BB2"_qs, u"Border CA1"_qs,
        u"Border BB"_qs, u"Border CA9"_qs, u"Border BL1"_qs, u"Border FA9"_qs, u"White border"_qs};
    for (std::size_t i = 0; i < Image13.size(); ++i)
        Image13[i].text = s.wording(hebrewBorders[i], englishBorders[i]);

    Label2.text = u"FIT"_qs;
    Label3.text = u"FIL"_qs;
    Option4.text = s.wording(u"כל התמונה על הנייר, עם שוליים"_qs, u"The whole picture, with margins"_qs);
    Option5.text = s.wording(u"מילוי כל הנייר, עם חיתוך"_qs, u"Fill the paper, edges are cut"_qs);

    Check1.text = s.wording(u"מסכים תנאי שימוש"_qs, u"I agree to the terms of use"_qs);
    Command29.text = s.wording(u"קרא תנאי שימוש"_qs, u"Read the terms of use"_qs);
    Command30.text = s.wording(u"סגור"_qs, u"Close"_qs);
    LabelTerms.text = s.wording(u"יש לסמן את תיבת ההסכמה לפני המעבר לבחירת התמונות"_qs,
                                u"Tick the box before you go on to the pictures"_qs);
    Label8.text = u"V  V  V"_qs;

    Command14.text = s.wording(u"ניקיון היסטוריה"_qs, u"Clean the history"_qs);
    Command15.text = s.wording(u"הבהרות ואזהרות"_qs, u"Clarifications and warnings"_qs);
    Frame1.text =
        s.wording(u"למחוק את קבצי ההדפסה של ההזמנות הקודמות?"_qs, u"Delete the print files of earlier orders?"_qs);
    Command7.text = s.wording(u"נקה"_qs, u"Clean"_qs);
    Command9.text = s.wording(u"השאר"_qs, u"Keep them"_qs);
    if (Combo1List.currentIndex() < 0 && m_state.shemot.ppr != Combo1.text)
        Combo1.text = sizesPrompt();
    album.setTexts();
    showStep();
}

QString nnn::sizesPrompt() const {
    return m_state.wording(u"גדלים נוספים"_qs, u"More Sizes"_qs);
}

void nnn::fillSizes() {
    Combo1List.clear();
    for (const QString& size : m_state.profile.SizeList) {
        if (!size.isEmpty() && !Combo1List.contains(size))
            Combo1List.append(size);
    }
    Combo1.text = sizesPrompt();
}

bool nnn::termsAgreed(const CheckCaption& box) {
    if (!box.checked)
        tell(
            u"רק עם הנך מסכים מסכימה לתנאי שימוש \nסמן את התיבה   מסכים לתנאי שימוש\nתוכל לקרוא את תנאי השימוש אם אינך יודע אותם"_qs,
            u"Please tick the box \"I agree to the terms of use\" before you go on.\nYou can read the terms here if you do not know them."_qs);
    return box.checked;
}

bool nnn::nameGiven() {
    const bool given = !Text2.text.isEmpty();
    if (!given)
        tell(u"אחד או יותר מהפרטים חסרים בדוק שוב בבקשה"_qs,
             u"One or more of the details are missing, please check again"_qs);
    return given;
}

void nnn::Command7_Click() {
    Workspace(m_state, m_platform.files).CleanHistory();
    tell(u"ניקיון ההיסטוריה הושלם\nמדובר על קבצים הקשורים לתוכנה זו בלבד"_qs,
         u"The history has been cleaned\nThis concerns files of this program only"_qs);
    Frame1.visible = false;
    showStep();
}

// Which of the page's parts belong to the open step.
void nnn::showStep() {
    const bool menu = step == Step::Menu;
    const bool details = step == Step::Details;
    const bool options = step == Step::Options;
    const bool terms = step == Step::Terms;

    const auto tiles = visibleTiles(m_state.profile.ClientLetter, m_state.TmunatPaar, m_state.MinuyPaar);
    for (std::size_t i = 0; i < Image1.size(); ++i)
        Image1[i].visible = menu && tiles[i];

    for (Caption* part :
         {&LabelText2, &Text2, &LabelText3, &Text3, static_cast<Caption*>(&Check2), &Command10, &Command12})
        part->visible = details;
    LabelText4.visible = details && m_state.MishloachHabaita;
    Text4.visible = LabelText4.visible;

    bool kindChosen = false;
    for (CheckCaption& kind : Option3) {
        kind.visible = options;
        kindChosen = kindChosen || kind.checked;
    }
    for (CheckCaption& size : Option1)
        size.visible = options && !size.text.isEmpty();
    for (Caption* part : {&Frame4, &LabelSizes, &LabelKinds, &Combo1})
        part->visible = options;
    Command8.visible = options && kindChosen;
    Command8.enabled = m_state.shemot.ppr != notChosen;

    Picture4.visible = step == Step::Border;
    for (CheckCaption& border : Image13)
        border.visible = Picture4.visible;
    Command6.visible = Picture4.visible && Picture16 >= 0;

    Picture5.visible = step == Step::Fit;
    for (Caption* part : {static_cast<Caption*>(&Option4), static_cast<Caption*>(&Option5), &Label2, &Label3})
        part->visible = Picture5.visible;

    for (Caption* part : {static_cast<Caption*>(&Check1), &Command29, &Image4, &Label8, &Command3}) {
        part->visible = terms;
        part->enabled = terms;
    }
    LabelTerms.visible = terms && m_termsHint;
    Command30.visible = LabelTerms.visible;

    Command2.visible = !menu;
    Command4.visible = !menu;
    Command14.visible = menu && m_state.MinuyPaar != 2;
    Command15.visible = menu;
    Command7.visible = Frame1.visible;
    Command9.visible = Frame1.visible;
    Label4Tel.text = m_state.profile.LabPhone;
    showProgress();
    Q_EMIT changed();
}

void nnn::showProgress() {
    const SessionState& s = m_state;
    QList<Step> steps = {Step::Details, Step::Options};
    if (asksBorder())
        steps += Step::Border;
    if (asksFit())
        steps += Step::Fit;
    steps += Step::Terms;
    StepLine.visible = step != Step::Menu;
    const bool ofAlbum = step == Step::Album;
    StepLine.text = s.wording(u"שלב %1 מתוך %2"_qs, u"Step %1 of %2"_qs)
                        .arg(1 + (ofAlbum ? static_cast<qsizetype>(album.panel) : steps.indexOf(step)))
                        .arg(ofAlbum ? AlbumPanels::panelCount : steps.size());
    switch (step) {
    case Step::Menu:
        Title.text = s.wording(u"מה תרצו להזמין?"_qs, u"What would you like to order?"_qs);
        break;
    case Step::Details:
        Title.text = s.wording(u"הפרטים שלכם"_qs, u"Your details"_qs);
        break;
    case Step::Options:
        Title.text = s.wording(u"גודל וסוג נייר"_qs, u"Paper size and kind"_qs);
        break;
    case Step::Border:
        Title.text = s.wording(u"בחרו מסגרת"_qs, u"Choose a border"_qs);
        break;
    case Step::Fit:
        Title.text = s.wording(u"התאמה או מילוי"_qs, u"Fit or fill"_qs);
        break;
    case Step::Terms:
        Title.text = s.wording(u"תנאי שימוש"_qs, u"Terms of use"_qs);
        break;
    case Step::Album:
        Title.text = album.Pic4Alboom.text.trimmed();
        break;
    }

    QStringList choice;
    const bool started = step != Step::Menu && step != Step::Details && !ofAlbum;
    if (started && s.shemot.ppr != notChosen)
        choice += s.shemot.ppr;
    if (started && s.shemot.maat != notChosen)
        choice += s.shemot.maat;
    if (started && Picture16 >= 0)
        choice += Image13[static_cast<std::size_t>(Picture16)].text;
    if (step == Step::Terms && (Option4.checked || Option5.checked))
        choice += Option4.checked ? Option4.text : Option5.text;
    Choice.text = ofAlbum ? album.ChoiceSoFar.text : choice.join(u" · "_qs);
    Choice.visible = ofAlbum ? album.ChoiceSoFar.visible : !choice.isEmpty();
}

} // namespace lumora
