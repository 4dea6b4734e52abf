// The wording of the page of pieces.
#include "common/DrivePath.h"
#include "finished/pieces/SpltForm.h"
#include "order/PieceName.h"
#include "session/CaptionTexts.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

QString SpltForm::wording(const QString& hebrew, const QString& english) const {
    return m_state.wording(hebrew, english);
}

void SpltForm::setTexts() {
    setCaptions(
        m_state,
        {
            {Title, u"חיתוך קבצים לחלקים וצירופם", u"Cutting files into pieces and joining them"},
            {Label4Cut, u"לחתוך", u"Cut"},
            {Label4Join, u"לצרף", u"Join"},
            {Label4files, u"הקבצים לחיתוך", u"Files to cut"},
            {Label4Bodedim, u"משפחות", u"Families"},
            {Label4Famely, u"חלקי המשפחה שנבחרה", u"Pieces of the chosen family"},
            {Label4Chalakim, u"כל הקבצים שנקראו", u"All the files read"},
            {Label4Text2, u"גודל חלק, בבתים", u"Size of a piece, in bytes"},
            {Label4Idle, u"יש לבחור תיקייה לחיתוך, או תיקייה של חלקים לצירוף. הקבצים עצמם אינם משתנים.",
             u"Choose a folder to cut, or a folder of pieces to join. The files themselves never change."},
            {Command1, u"MergeAll", u"MergeAll", u"מצרף את כל המשפחות השלמות", u"Joins all the complete families"},
            {Command2, u"בחר תיקייה לחיתוך", u"Choose a folder to cut"},
            {Command3, u"Split All", u"Split All", u"חותך את כל קובצי jpp שברשימה",
             u"Cuts all the jpp files of the list"},
            {Command4, u"Merge", u"Merge", u"מצרף את המשפחה שנבחרה, גם אם אינה שלמה",
             u"Joins the chosen family, even if it is not complete"},
            {Command5, u"Find Famely"},
            {Command6, u"Filelen", u"Filelen", u"אורך הקובץ שנבחר", u"Length of the chosen file"},
            {Command8, u"קרא תיקיית חלקים", u"Read a folder of pieces"},
            {Command9, u"splitOne", u"splitOne", u"חותך קובץ prk אחד", u"Cuts one prk file"},
            {Command15, u"עצור", u"Stop"},
            {Image3, u"חזרה להזמנות המוגמרות", u"Back to the finished orders"},
        });
    showCounts();
    Q_EMIT changed();
}

void SpltForm::showCounts() {
    if (m_piecesRead) {
        const QString files = QString::number(ListChalakim.count());
        const QString families = QString::number(List4Bodedim.count());
        Label1.text = files;
        Label5.text = families;
        Label4Counts.text = wording(u"קבצים: %1 · משפחות: %2"_s, u"Files: %1 · families: %2"_s).arg(files, families);
    }
    const QString length = m_length ? QString::number(*m_length) : QString();
    const QString drive = m_lengthOf.text().left(2);
    Label8.text = length;
    Label9.text = drive;
    // The isolating marks keep the drive's colon behind its letter in Hebrew text.
    Label4Length.text =
        m_length ? wording(u"%1 בתים, כונן \u2066%2\u2069"_s, u"%1 bytes, drive \u2066%2\u2069"_s).arg(length, drive)
                 : QString();
}

SpltForm::FamilyRow SpltForm::familyRow(int index) const {
    const PieceFamily& family = m_families.at(static_cast<std::size_t>(index));
    const Fate fate = m_fates.at(static_cast<std::size_t>(index));
    const QString leaf = LeafName(family.first);
    FamilyRow row{JoinedName(leaf).value_or(leaf), {}, false};
    if (fate == Fate::Joined) {
        row.words = wording(u"צורפה"_s, u"Joined"_s);
        row.good = true;
    } else if (fate == Fate::JoinedShort) {
        row.words = wording(u"צורפה, לא שלמה"_s, u"Joined, not complete"_s);
    } else if (fate == Fate::Failed) {
        row.words = wording(u"לא צורפה"_s, u"Not joined"_s);
    } else if (family.verdict > familyComplete && family.listedTwice) {
        row.words = wording(u"עודף: התיקייה נקראה יותר מפעם אחת"_s, u"Surplus: the folder was read more than once"_s);
    } else {
        row.good = family.verdict == familyComplete;
        row.words =
            (row.good                          ? wording(u"שלמה: %1 מתוך %2"_s, u"Complete: %1 of %2"_s)
             : family.verdict < familyComplete ? wording(u"חסרה: %1 מתוך %2"_s, u"Short: %1 of %2"_s)
                                               : wording(u"עודף: %1 במקום %2"_s, u"Surplus: %1 in place of %2"_s))
                .arg(family.count)
                .arg(family.declared);
    }
    return row;
}

QString SpltForm::cutTotal(const Tally& tally) const {
    QString total =
        wording(u"קבצים שנחתכו: %1, חלקים: %2."_s, u"Files cut: %1, pieces: %2."_s).arg(tally.done).arg(tally.pieces);
    if (tally.passedOver > 0)
        total +=
            wording(u" קבצים שאינם jpp ולכן נותרו: %1."_s, u" Not jpp and left alone: %1."_s).arg(tally.passedOver);
    if (tally.failed > 0)
        total += wording(u" לא נחתכו עד הסוף: %1."_s, u" Not cut to the end: %1."_s).arg(tally.failed);
    return total;
}

QString SpltForm::joinTotal(const Tally& tally) const {
    QString total = wording(u"קבצים שצורפו: %1."_s, u"Files joined: %1."_s).arg(tally.done);
    if (tally.passedOver > 0)
        total += wording(u" משפחות שאינן שלמות ולא צורפו: %1."_s, u" Families not complete and passed over: %1."_s)
                     .arg(tally.passedOver);
    if (tally.failed > 0)
        total += wording(u" לא ניתן היה לצרף: %1."_s, u" Could not be joined: %1."_s).arg(tally.failed);
    return total;
}

QString SpltForm::notCut(const DrivePath& path, const Cut& result) const {
    const QString written = result.pieces == 0 ? wording(u"לא נכתב אף חלק"_s, u"No piece was written"_s)
                                               : wording(u"חלקים שנכתבו: %1 מתוך %2"_s, u"Pieces written: %1 of %2"_s)
                                                     .arg(result.pieces)
                                                     .arg(result.declared);
    return wording(u"%1 לא נחתך עד הסוף. %2; הקובץ עצמו לא השתנה."_s,
                   u"%1 was not cut to its end. %2; the file itself is as it was."_s)
               .arg(path.leaf(), written) +
           u'\n' + reason(*result.failure);
}

QString SpltForm::notJoined(const DrivePath& path, const Failure& failure) const {
    return wording(u"%1 לא צורף. החלקים לא השתנו, ולא נותר קובץ חלקי."_s,
                   u"%1 was not joined. The pieces are as they were, and no half file is left."_s)
               .arg(path.leaf()) +
           u'\n' + reason(failure);
}

QString SpltForm::reason(const Failure& failure) const {
    using enum Failure::Kind;
    static constexpr struct {
        Failure::Kind kind;
        QStringView hebrew;
        QStringView english;
    } kinds[] = {
        {NotFound, u"הקובץ או התיקייה אינם נמצאים:", u"The file or folder is not there:"},
        {AccessDenied, u"אין הרשאה לקובץ או לתיקייה:", u"There is no right to the file or folder:"},
        {NoSpace, u"אין די מקום בדיסק:", u"There is not enough room on the disk:"},
        {TooLarge, u"גדול מדי; קובץ נחתך ל-999 חלקים לכל היותר:", u"Too large; a file is cut into 999 pieces at most:"},
        {Unsupported, u"שם הקובץ אינו מתאים:", u"The name of the file does not fit:"},
        {Damaged, u"הקובץ השתנה בזמן העבודה:", u"The file changed meanwhile:"},
    };
    QString words = wording(u"תקלה:"_s, u"A fault:"_s);
    for (const auto& row : kinds) {
        if (row.kind == failure.kind)
            words = wording(row.hebrew.toString(), row.english.toString());
    }
    return words + u'\n' + failure.message;
}

} // namespace lumora
