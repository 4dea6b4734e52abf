// All texts of the editor, in both languages.
#include "editing/editor/tFrmNew.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/CaptionTexts.h"

namespace lumora {

using namespace Qt::StringLiterals;

void tFrmNew::setTexts() {
    setCaptions(
        m_state,
        {
            {Image2[0], u"התקרב", u"Closer", u"זום התקרב", u"Zoom closer"},
            {Image2[1], u"התרחק", u"Further", u"זום התרחק", u"Zoom further"},
            {Image2[3], u"כהה יותר", u"Darker", u"הורד בהירות", u"Lower brightness"},
            {Image2[4], u"בהיר יותר", u"Lighter", u"הגבר בהירות", u"Raise brightness"},
            {Image2[5], u"בטל שינויים", u"Undo", u"בטל שינויים", u"Cancel changes"},
            {Image2[6], u"אדום", u"Red", u"הוסף צבע אדום", u"Add red colour"},
            {Image2[7], u"עיניים אדומות", u"Red eyes", u"עבור לדף תיקון עניים אדומות", u"Go to the red-eye page"},
            {Image2[8], u"בטל צבע", u"No tint", u"בטל הוספת צבעים", u"Cancel added colours"},
            {Image2[10], u"כחול", u"Blue", u"הוסף צבע כחול", u"Add blue colour"},
            {Image135, u"ימינה", u"Right", u"הזז תמונה לימין", u"Move the picture right"},
            {Image115, u"שמאלה", u"Left", u"הזז תמונה לשמאל", u"Move the picture left"},
            {Image125, u"למעלה", u"Up", u"הזז תמונה למעלה", u"Move the picture up"},
            {Image145, u"למטה", u"Down", u"הזז תמונה מטה", u"Move the picture down"},
            {Image15, u"רבע סיבוב", u"Quarter turn"},
            {Image18, u"רבע סיבוב חזרה", u"Quarter turn back", u"סובב לשמאל", u"Turn left"},
            {Image16, u"סובב לימין", u"Turn right", u"סובב לימין", u"Turn right"},
            {Image17, u"סובב לשמאל", u"Turn left", u"סובב לשמאל ", u"Turn left "},
            {Image27, u"ישר", u"Upright", u"בטל סיבוב", u"Cancel rotation"},
            {Image13, u"גוונים", u"Tones"},
            {Image4, u"אפור", u"Grey", u"הופך לגווני אפור", u"Turns to grey tones"},
            {Image11, u"ספייה", u"Sepia", u"הופך התמונה לגווני ספייה", u"Turns the picture to sepia tones"},
            {Image12, u"כחול", u"Blue", u"הפוך תמונה לגווני כחול", u"Turns the picture to blue tones"},
            {Image9, u"ירוק", u"Green"},
            {Image5, u"צבע מלא", u"Full colour", u"השב את הצבע לתמונה", u"Returns the colour to the picture"},
            {Image20, u"המסגרת הבאה", u"Next frame", u"הוסף לתמונה מסגרת הבאה", u"Adds the next frame to the picture"},
            {Image21, u"המסגרת הקודמת", u"Previous frame", u"הוסף מסגרת קודמת", u"Adds the previous frame"},
            {Image22, u"הוסף מסגרת", u"Use the frame", u"לחצן זה יוסיף את המסגרת האחרונה שבחרת",
             u"This button adds the last frame you chose"},
            {Image28, u"הסר מסגרת", u"Remove the frame", u"לחצן זה מסיר את המסגרת מהתמונה",
             u"This button removes the frame from the picture"},
            {Image29, u"עזרה", u"Hints", u"מציג מה עושה כל לחצן", u"Shows what each button does"},
            {Command2, u"תמונה אחרת", u"Another picture"},
            {Command6, u"תיקון אוטומטי", u"Automatic levels", u"מודד את בהירות התמונה",
             u"Measures the levels of the picture"},
            {CommandImprove, u"שפר תמונה", u"Improve", u"מבהיר את התמונה ומאזן את צבעיה",
             u"Brightens the picture and balances its colours"},
            {CommandDone, u"חזרה לתמונות", u"Back to the pictures", u"כל השינויים נשמרו", u"All changes are kept"},
            {Misgerett, u"הצג מסגרת", u"Show the frame"},
            {Command9, u"סגנון הבא", u"Next style"},
            {Command18, u"סגנון קודם", u"Previous style"},
            {Command14, u"סימון חיתוך", u"Crop markers"},
            {Command13, u"סימון מוקטן", u"Inset markers"},
            {Command8, u"Text כיתוב", u"Add text"},
            {Command4, u"zoom"},
            {Command16, u"z+"},
            {Command15, u"z-"},
            {Command24, u"10/14"},
            {Command12, u"10/15"},
            {Command10, u"13/18"},
            {Command23, u"15/21"},
            {Frame3, u"גוונים", u"Tones"},
            {Frame4, u"סיבוב", u"Turn"},
            {Image19, u"יש לבחור תמונה בדף התמונות", u"Choose a picture on the page of pictures"},
            {placeTitle, u"גודל ומקום", u"Size and place"},
            {turnTitle, u"סיבוב", u"Turn"},
            {lightTitle, u"אור וצבע", u"Light and colour"},
            {framesTitle, u"מסגרות", u"Frames"},
            {Frame4Opener, u"סיבוב עדין", u"Fine turn"},
            {hintsClose, u"סגור", u"Close"},
        });
    if (Combo5List.currentIndex() < 0)
        Combo5.text = m_state.wording(u"מיסגרות", u"Frames");
    setWordings(m_state, {
                             {words.categories, u"קטגוריית המסגרות", u"Category of frames"},
                             {words.framesOfCategory, u"המסגרות של הקטגוריה", u"Frames of the category"},
                             {words.operatorPanel, u"כלי המפעיל", u"Operator"},
                             {words.lineStyles, u"סגנון הקו", u"Line style"},
                             {words.emptyCell, u"תא ריק", u"Empty place"},
                             {words.openCell, u"%1, פתוחה לעריכה", u"%1, open for editing"},
                             {words.otherCell, u"%1, לחיצה פותחת לעריכה", u"%1, press to edit"},
                         });
    // The hint of a button that goes on as long as it is held says so.
    for (Caption* held : {&Image2[0], &Image2[1], &Image2[3], &Image2[4], &Image135, &Image115, &Image125, &Image145,
                          &Image16, &Image17})
        held->hint += m_state.wording(u"= לחיצה ממושכת על העכבר = ", u"= long press of the mouse = ");
    showResolution();
    Q_EMIT changed();
}

// Writes the long press in brackets, which the hint sets between signs of equality.
QString tFrmNew::hintLine(const Caption& button) {
    QString hint = button.hint.simplified();
    if (const qsizetype held = hint.indexOf(u'='); held >= 0) {
        QString press = hint.mid(held);
        press.remove(u'=');
        hint = hint.left(held).trimmed() + u" ("_s + press.simplified() + u')';
    }
    const QString name = button.text.simplified();
    return hint.isEmpty() || hint == name ? name : name + u": "_s + hint;
}

void tFrmNew::tellFrameTakenOut() {
    m_platform.dialogs.message(m_state.wording(
        u"המסגרת הוסרה מהתמונה ולא תודפס. כדי להחזיר אותה יש לבחור אותה שוב"_s,
        u"The frame was taken off the picture and will not be printed. Choose it again to bring it back"_s));
}

void tFrmNew::tellNotImproved() {
    m_platform.dialogs.message(
        m_edit.ToneFlag == 1
            ? m_state.wording(u"אפשר לשפר רק תמונה בצבע מלא. יש ללחוץ על גוונים ולבחור צבע מלא"_s,
                              u"Only a picture in full colour can be improved. Press Tones and choose Full colour"_s)
            : m_state.wording(
                  u"האור והצבעים של התמונה כבר טובים, ואין מה לשפר"_s,
                  u"The light and colours of this picture are good already; there is nothing to improve"_s));
}

} // namespace lumora
