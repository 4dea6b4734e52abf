// All texts of the editor, in both languages.
#include "editing/editor/tFrmNew.h"
#include "session/SessionState.h"

namespace lumora {

void tFrmNew::setTexts() {
    const auto set = [this](Caption& caption, const char16_t* hebrew, const char16_t* english) {
        caption.text = m_state.wording(hebrew, english);
    };
    const auto setHint = [this](Caption& caption, const char16_t* hebrew, const char16_t* english) {
        caption.hint = m_state.wording(hebrew, english);
    };
    // A button that goes on as long as it is held says so behind its hint.
    const auto setHoldHint = [this, &setHint](Caption& caption, const char16_t* hebrew, const char16_t* english) {
        setHint(caption, hebrew, english);
        caption.hint += m_state.wording(QStringLiteral("= לחיצה ממושכת על העכבר = "),
                                        QStringLiteral("= long press of the mouse = "));
    };

    set(Image2[0], u"התקרב", u"Closer");
    setHoldHint(Image2[0], u"זום התקרב", u"Zoom closer");
    set(Image2[1], u"התרחק", u"Further");
    setHoldHint(Image2[1], u"זום התרחק", u"Zoom further");
    set(Image2[3], u"כהה יותר", u"Darker");
    setHoldHint(Image2[3], u"הורד בהירות", u"Lower brightness");
    set(Image2[4], u"בהיר יותר", u"Lighter");
    setHoldHint(Image2[4], u"הגבר בהירות", u"Raise brightness");
    set(Image2[5], u"בטל שינויים", u"Undo");
    setHint(Image2[5], u"בטל שינויים", u"Cancel changes");
    set(Image2[6], u"אדום", u"Red");
    setHint(Image2[6], u"הוסף צבע אדום", u"Add red colour");
    set(Image2[7], u"עיניים אדומות", u"Red eyes");
    setHint(Image2[7], u"עבור לדף תיקון עניים אדומות", u"Go to the red-eye page");
    set(Image2[8], u"בטל צבע", u"No tint");
    setHint(Image2[8], u"בטל הוספת צבעים", u"Cancel added colours");
    set(Image2[10], u"כחול", u"Blue");
    setHint(Image2[10], u"הוסף צבע כחול", u"Add blue colour");
    set(Image135, u"ימינה", u"Right");
    setHoldHint(Image135, u"הזז תמונה לימין", u"Move the picture right");
    set(Image115, u"שמאלה", u"Left");
    setHoldHint(Image115, u"הזז תמונה לשמאל", u"Move the picture left");
    set(Image125, u"למעלה", u"Up");
    setHoldHint(Image125, u"הזז תמונה למעלה", u"Move the picture up");
    set(Image145, u"למטה", u"Down");
    setHoldHint(Image145, u"הזז תמונה מטה", u"Move the picture down");
    set(Image15, u"רבע סיבוב", u"Quarter turn");
    set(Image18, u"רבע סיבוב חזרה", u"Quarter turn back");
    setHint(Image18, u"סובב לשמאל", u"Turn left");
    set(Image16, u"סובב לימין", u"Turn right");
    setHoldHint(Image16, u"סובב לימין", u"Turn right");
    set(Image17, u"סובב לשמאל", u"Turn left");
    setHoldHint(Image17, u"סובב לשמאל ", u"Turn left ");
    set(Image27, u"ישר", u"Upright");
    setHint(Image27, u"בטל סיבוב", u"Cancel rotation");
    set(Image13, u"גוונים", u"Tones");
    set(Image4, u"אפור", u"Grey");
    setHint(Image4, u"הופך לגווני אפור", u"Turns to grey tones");
    set(Image11, u"ספייה", u"Sepia");
    setHint(Image11, u"הופך התמונה לגווני ספייה", u"Turns the picture to sepia tones");
    set(Image12, u"כחול", u"Blue");
    setHint(Image12, u"הפוך תמונה לגווני כחול", u"Turns the picture to blue tones");
    set(Image9, u"ירוק", u"Green");
    set(Image5, u"צבע מלא", u"Full colour");
    setHint(Image5, u"השב את הצבע לתמונה", u"Returns the colour to the picture");
    set(Image20, u"המסגרת הבאה", u"Next frame");
    setHint(Image20, u"הוסף לתמונה מסגרת הבאה", u"Adds the next frame to the picture");
    set(Image21, u"המסגרת הקודמת", u"Previous frame");
    setHint(Image21, u"הוסף מסגרת קודמת", u"Adds the previous frame");
    set(Image22, u"הוסף מסגרת", u"Use the frame");
    setHint(Image22, u"לחצן זה יוסיף את המסגרת האחרונה שבחרת", u"This button adds the last frame you chose");
    set(Image28, u"הסר מסגרת", u"Remove the frame");
    setHint(Image28, u"לחצן זה מסיר את המסגרת מהתמונה", u"This button removes the frame from the picture");
    set(Image29, u"עזרה", u"Hints");
    setHint(Image29, u"מציג מה עושה כל לחצן", u"Shows what each button does");
    set(Command2, u"תמונה אחרת", u"Another picture");
    set(Command6, u"תיקון אוטומטי", u"Automatic levels");
    setHint(Command6, u"מודד את בהירות התמונה", u"Measures the levels of the picture");
    set(CommandDone, u"חזרה לתמונות", u"Back to the pictures");
    setHint(CommandDone, u"כל השינויים נשמרו", u"All changes are kept");
    set(Misgerett, u"הצג מסגרת", u"Show the frame");
    set(Command9, u"סגנון הבא", u"Next style");
    set(Command18, u"סגנון קודם", u"Previous style");
    set(Command14, u"סימון חיתוך", u"Crop markers");
    set(Command13, u"סימון מוקטן", u"Inset markers");
    Command8.text = m_state.wording(QStringLiteral("Text כיתוב"), QStringLiteral("Add text"));
    if (Combo5List.currentIndex() < 0)
        set(Combo5, u"מיסגרות", u"Frames");
    Command4.text = QStringLiteral("zoom");
    Command16.text = QStringLiteral("z+");
    Command15.text = QStringLiteral("z-");
    Command24.text = QStringLiteral("10/14");
    Command12.text = QStringLiteral("10/15");
    Command10.text = QStringLiteral("13/18");
    Command23.text = QStringLiteral("15/21");
    set(Frame3, u"גוונים", u"Tones");
    set(Frame4, u"סיבוב", u"Turn");
    words.place = m_state.wording(u"גודל ומקום", u"Size and place");
    words.turn = m_state.wording(u"סיבוב", u"Turn");
    words.light = m_state.wording(u"אור וצבע", u"Light and colour");
    words.frames = m_state.wording(u"מסגרות", u"Frames");
    words.fineTurn = m_state.wording(u"סיבוב עדין", u"Fine turn");
    words.closeHints = m_state.wording(u"סגור", u"Close");
    words.categories = m_state.wording(u"קטגוריית המסגרות", u"Category of frames");
    words.framesOfCategory = m_state.wording(u"המסגרות של הקטגוריה", u"Frames of the category");
    words.operatorPanel = QStringLiteral("Operator");
    words.lineStyles = QStringLiteral("Line style");
    words.emptyCell = m_state.wording(u"תא ריק", u"Empty place");
    words.openCell = m_state.wording(u"%1, פתוחה לעריכה", u"%1, open for editing");
    words.otherCell = m_state.wording(u"%1, לחץ לעריכה", u"%1, press to edit");
    set(Image19, u"בחר תמונה בדף התמונות", u"Choose a picture on the page of pictures");
    Q_EMIT changed();
}

// The long press stands in brackets: two signs of equality are no words.
QString tFrmNew::hintLine(const Caption& button) {
    QString hint = button.hint.simplified();
    if (const qsizetype held = hint.indexOf(u'='); held >= 0) {
        QString press = hint.mid(held);
        press.remove(u'=');
        hint = hint.left(held).trimmed() + QStringLiteral(" (") + press.simplified() + u')';
    }
    const QString name = button.text.simplified();
    return hint.isEmpty() || hint == name ? name : name + QStringLiteral(": ") + hint;
}

} // namespace lumora
