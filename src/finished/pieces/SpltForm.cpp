#include "finished/pieces/SpltForm.h"

#include "common/DrivePathText.h"
#include "finished/orders/UnreadableFolders.h"
#include "order/PieceName.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <QHash>
#include <QSet>

#include <algorithm>

namespace lumora {

namespace {

constexpr int troublesTold = 2;

} // namespace

SpltForm::SpltForm(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::SpltForm)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_pieces(platform.files, [this](int done, int total) { return step(done, total); }) {
    Text2.text = QStringLiteral("400000");
    Command5.visible = false; // nothing would come of a press
    showWhatCanBeDone();
}

QString SpltForm::wording(const QString& hebrew, const QString& english) const {
    return m_state.wording(hebrew, english);
}

void SpltForm::setTexts() {
    Command1.text = QStringLiteral("MergeAll");
    Command2.text = wording(QStringLiteral("בחר תיקייה לחיתוך"), QStringLiteral("Choose a folder to cut"));
    Command3.text = QStringLiteral("Split All");
    Command4.text = QStringLiteral("Merge");
    Command5.text = QStringLiteral("Find Famely");
    Command6.text = QStringLiteral("Filelen");
    Command8.text = wording(QStringLiteral("קרא תיקיית חלקים"), QStringLiteral("Read a folder of pieces"));
    Command9.text = QStringLiteral("splitOne");
    Command15.text = wording(QStringLiteral("עצור"), QStringLiteral("Stop"));
    Image3.text = wording(QStringLiteral("חזרה להזמנות המוגמרות"), QStringLiteral("Back to the finished orders"));
    Label4Text2.text = wording(QStringLiteral("גודל חלק, בבתים"), QStringLiteral("Size of a piece, in bytes"));
    Command3.hint =
        wording(QStringLiteral("חותך את כל קובצי jpp שברשימה"), QStringLiteral("Cuts all the jpp files of the list"));
    Command9.hint = wording(QStringLiteral("חותך קובץ prk אחד"), QStringLiteral("Cuts one prk file"));
    Command1.hint =
        wording(QStringLiteral("מצרף את כל המשפחות השלמות"), QStringLiteral("Joins all the complete families"));
    Command4.hint = wording(QStringLiteral("מצרף את המשפחה שנבחרה, גם אם אינה שלמה"),
                            QStringLiteral("Joins the chosen family, even if it is not complete"));
    Command6.hint = wording(QStringLiteral("אורך הקובץ שנבחר"), QStringLiteral("Length of the chosen file"));
    Q_EMIT changed();
}

void SpltForm::showWhatCanBeDone() {
    Text2.enabled = Command2.enabled = Command8.enabled = Command9.enabled = !busy;
    Command3.enabled = !busy && !List4files.isEmpty();
    Command1.enabled = !busy && !List4Bodedim.isEmpty();
    Command4.enabled = !busy && List4Bodedim.currentIndex() >= 0;
    Command6.enabled = !busy && ListChalakim.currentIndex() >= 0;
    Command15.visible = busy;
    Q_EMIT changed();
}

void SpltForm::Text2_Change(const QString& text) {
    Text2.text = text;
}

QString SpltForm::pickFile() {
    if (m_folder.isEmpty())
        m_folder = WorkspacePaths::orders(m_state);
    const QString prompt = wording(QStringLiteral("בחר תמונה אחת בלבד "), QStringLiteral("Choose one picture only "));
    const QString path = m_platform.dialogs.pickFile(prompt, m_folder, prompt, Dialogs::Offer::EveryFile);
    if (!path.isEmpty())
        m_folder = ParentFolder(path);
    return path;
}

// A folder that may not be read is told, the others are listed.
QStringList SpltForm::collect(const QString& folder, Files::Depth depth) {
    QStringList unreadable;
    const QStringList files = m_platform.files.collect(folder, depth, &unreadable);
    TellUnreadableFolders(m_state, m_platform.dialogs, unreadable);
    return files;
}

void SpltForm::Command2_Click() {
    if (busy)
        return;
    const QString path = pickFile();
    if (path.isEmpty())
        return;
    forgetOutcome();
    List4files.clear();
    List4files.append(collect(m_folder, Files::Depth::ThisFolder));
    showWhatCanBeDone();
}

void SpltForm::Command3_Click() {
    if (busy || !segmentIsRight())
        return;
    begin();
    int files = 0;
    int pieces = 0;
    int others = 0;
    int failed = 0;
    QString where;
    for (int i = 0; i < List4files.count() && !m_stop; ++i) {
        const QString path = List4files.item(i);
        if (path.isEmpty())
            break;
        workOn(path, i, List4files.count());
        const Cut result = cut(path, QStringLiteral("jpp"));
        pieces += result.pieces;
        if (result.passedOver)
            ++others;
        else if (result.failure)
            ++failed;
        else if (!result.stopped)
            ++files;
        if (result.pieces > 0)
            where = result.folder;
        // Every further file would meet the same.
        if (result.failure && result.failure->kind == Failure::Kind::NoSpace)
            break;
    }
    QString total =
        wording(QStringLiteral("קבצים שנחתכו: %1, חלקים: %2."), QStringLiteral("Files cut: %1, pieces: %2."))
            .arg(files)
            .arg(pieces);
    if (others > 0)
        total +=
            wording(QStringLiteral(" קבצים שאינם jpp ולכן נותרו: %1."), QStringLiteral(" Not jpp and left alone: %1."))
                .arg(others);
    if (failed > 0)
        total +=
            wording(QStringLiteral(" לא נחתכו עד הסוף: %1."), QStringLiteral(" Not cut to the end: %1.")).arg(failed);
    end(failed > 0 ? Outcome::Failed : files > 0 && !m_stop ? Outcome::Good : Outcome::Partly, total, where);
}

void SpltForm::Command9_Click() {
    if (busy || !segmentIsRight())
        return;
    const QString path = pickFile();
    if (path.isEmpty())
        return;
    begin();
    workOn(path, 0, 1);
    const Cut result = cut(path, QStringLiteral("prk"));
    if (result.passedOver)
        end(Outcome::Partly,
            wording(QStringLiteral("%1 אינו מסתיים ב-prk ולכן לא נחתך."),
                    QStringLiteral("%1 does not end in prk and was not cut."))
                .arg(LeafName(path)),
            {});
    else
        end(result.failure   ? Outcome::Failed
            : result.stopped ? Outcome::Partly
                             : Outcome::Good,
            (result.failure || result.stopped
                 ? wording(QStringLiteral("%1 לא נחתך עד הסוף. חלקים: %2."),
                           QStringLiteral("%1 was not cut to its end. Pieces: %2."))
                 : wording(QStringLiteral("%1 נחתך. חלקים: %2."), QStringLiteral("%1 was cut. Pieces: %2.")))
                .arg(LeafName(path), QString::number(result.pieces)),
            result.pieces > 0 ? result.folder : QString());
}

void SpltForm::Command8_Click() {
    if (busy)
        return;
    const QString path = pickFile();
    if (path.isEmpty())
        return;
    forgetOutcome();
    List4files.clear();
    ListChalakim.append(collect(m_folder, Files::Depth::WithSubfolders));
    ListSingles(ListChalakim, List4Bodedim);
    List4Famely.clear();
    Label1.text = QString::number(ListChalakim.count());
    Label5.text = QString::number(List4Bodedim.count());
    judgeFamilies();
    showWhatCanBeDone();
}

void SpltForm::judgeFamilies() {
    QHash<QString, int> counts;
    QSet<QString> paths;
    QSet<QString> twice;
    for (const QString& path : ListChalakim.items()) {
        const QString key = FamilyKey(path);
        ++counts[key];
        if (paths.contains(path))
            twice.insert(key);
        paths.insert(path);
    }
    families.clear();
    for (const QString& single : List4Bodedim.items()) {
        Family family;
        family.declared = DeclaredTotal(single);
        family.count = counts.value(FamilyKey(single));
        family.verdict = FamilyVerdict(family.declared, family.count);
        family.listedTwice = twice.contains(FamilyKey(single));
        families.push_back(family);
    }
}

QString SpltForm::familyWords(int index) const {
    const Family& family = families.at(static_cast<std::size_t>(index));
    if (family.fate == Family::Fate::Joined)
        return wording(QStringLiteral("צורפה"), QStringLiteral("Joined"));
    if (family.fate == Family::Fate::JoinedShort)
        return wording(QStringLiteral("צורפה, לא שלמה"), QStringLiteral("Joined, not complete"));
    if (family.fate == Family::Fate::Failed)
        return wording(QStringLiteral("לא צורפה"), QStringLiteral("Not joined"));
    if (family.verdict == familyComplete)
        return wording(QStringLiteral("שלמה: %1 מתוך %2"), QStringLiteral("Complete: %1 of %2"))
            .arg(family.count)
            .arg(family.declared);
    if (family.verdict < familyComplete)
        return wording(QStringLiteral("חסרה: %1 מתוך %2"), QStringLiteral("Short: %1 of %2"))
            .arg(family.count)
            .arg(family.declared);
    if (family.listedTwice)
        return wording(QStringLiteral("עודף: התיקייה נקראה יותר מפעם אחת"),
                       QStringLiteral("Surplus: the folder was read more than once"));
    return wording(QStringLiteral("עודף: %1 במקום %2"), QStringLiteral("Surplus: %1 in place of %2"))
        .arg(family.count)
        .arg(family.declared);
}

void SpltForm::Command1_Click() {
    if (busy)
        return;
    begin();
    int joined = 0;
    int others = 0;
    int failed = 0;
    QString where;
    for (int i = 0; i < List4Bodedim.count() && !m_stop; ++i) {
        List4Bodedim.setCurrentIndex(i);
        const QString path = List4Bodedim.item(i);
        workOn(path, i, List4Bodedim.count());
        if (CollectFamily(List4Bodedim, ListChalakim, List4Famely) != familyComplete) {
            ++others;
            continue;
        }
        const Joined result = join(i);
        if (result.failure)
            ++failed;
        else if (!result.stopped)
            ++joined;
        if (!result.file.isEmpty())
            where = ParentFolder(result.file);
        if (result.failure && result.failure->kind == Failure::Kind::NoSpace)
            break;
    }
    QString total = wording(QStringLiteral("קבצים שצורפו: %1."), QStringLiteral("Files joined: %1.")).arg(joined);
    if (others > 0)
        total += wording(QStringLiteral(" משפחות שאינן שלמות ולא צורפו: %1."),
                         QStringLiteral(" Families not complete and passed over: %1."))
                     .arg(others);
    if (failed > 0)
        total +=
            wording(QStringLiteral(" לא ניתן היה לצרף: %1."), QStringLiteral(" Could not be joined: %1.")).arg(failed);
    end(failed > 0 ? Outcome::Failed : others == 0 && !m_stop ? Outcome::Good : Outcome::Partly, total, where);
}

void SpltForm::Command4_Click() {
    const int index = List4Bodedim.currentIndex();
    if (busy || index < 0)
        return;
    begin();
    workOn(List4Bodedim.currentItem(), 0, 1);
    const Joined result = join(index);
    if (result.failure || result.stopped) {
        end(result.failure ? Outcome::Failed : Outcome::Partly,
            wording(QStringLiteral("לא צורף קובץ."), QStringLiteral("No file was joined.")), {});
        return;
    }
    QString total = wording(QStringLiteral("%1 צורף. חלקים: %2, בתים: %3."),
                            QStringLiteral("%1 was joined. Pieces: %2, bytes: %3."))
                        .arg(LeafName(result.file), QString::number(result.pieces), QString::number(result.bytes));
    // The declared total of an exact multiple is one too many; whether this file is whole no name can tell.
    if (result.pieces != result.declared)
        total += wording(QStringLiteral(" בשם רשומים %1 חלקים: יש לבדוק שהקובץ שלם."),
                         QStringLiteral(" The name declares %1: check that the file is whole."))
                     .arg(result.declared);
    end(result.pieces == result.declared ? Outcome::Good : Outcome::Partly, total, ParentFolder(result.file));
}

void SpltForm::Command6_Click() {
    const QString path = ListChalakim.currentItem();
    if (busy || path.isEmpty())
        return;
    const auto size = m_platform.files.size(path);
    Label8.text = size ? QString::number(*size) : QString();
    Label9.text = path.left(2);
    if (!size)
        m_platform.dialogs.message(reason(size.failure()));
    Q_EMIT changed();
}

void SpltForm::List4Bodedim_Click(int index) {
    if (busy)
        return;
    List4Bodedim.setCurrentIndex(index);
    CollectFamily(List4Bodedim, ListChalakim, List4Famely);
    showWhatCanBeDone();
}

void SpltForm::ListChalakim_Click(int index) {
    if (busy)
        return;
    ListChalakim.setCurrentIndex(index);
    Label8.text.clear();
    Label9.text.clear();
    showWhatCanBeDone();
}

void SpltForm::Command15_Click() {
    m_stop = true;
}

void SpltForm::Image3_Click() {
    m_stop = true;
    m_leaving = true;
    if (!busy)
        leave();
}

void SpltForm::leave() {
    m_chain.follow(PageId::SpltForm, lumora::Outcome::PiecesDone);
}

bool SpltForm::segmentIsRight() {
    if (SegmentSize(Text2.text))
        return true;
    m_platform.dialogs.message(
        wording(QStringLiteral("גודל החלק \"%1\" אינו תקין.\nיש לרשום מספר שלם של בתים, מ-1 עד 2147483647."),
                QStringLiteral("\"%1\" is no size of a piece.\nWrite a whole number of bytes, from 1 to 2147483647."))
            .arg(Text2.text));
    return false;
}

void SpltForm::begin() {
    busy = true;
    m_stop = false;
    percent = 0;
    m_troubles.clear();
    forgetOutcome();
    showWhatCanBeDone();
}

void SpltForm::forgetOutcome() {
    outcome = Outcome::None;
    Label4Total.text.clear();
    Label4Where.text.clear();
}

void SpltForm::workOn(const QString& path, int index, int count) {
    m_index = index;
    m_count = count;
    Label4Work.text = wording(QStringLiteral("%1 מתוך %2: %3"), QStringLiteral("%1 of %2: %3"))
                          .arg(index + 1)
                          .arg(count)
                          .arg(LeafName(path));
    Q_EMIT changed();
}

bool SpltForm::step(int done, int total) {
    percent =
        static_cast<int>(100.0 * (m_index + static_cast<double>(done) / std::max(total, 1)) / std::max(m_count, 1));
    Q_EMIT changed();
    m_platform.pump.pump();
    m_stop = m_stop || m_chain.hasEnded();
    return !m_stop;
}

void SpltForm::end(Outcome result, const QString& total, const QString& where) {
    busy = false;
    outcome = result;
    Label4Work.text.clear();
    Label4Total.text = total;
    if (m_stop)
        Label4Total.text = wording(QStringLiteral("העבודה נעצרה. "), QStringLiteral("The work was stopped. ")) + total;
    Label4Where.text = where;
    showWhatCanBeDone();
    tellTroubles();
    if (m_leaving && !m_chain.hasEnded())
        leave();
}

// In one box, however many files met the same fault.
void SpltForm::tellTroubles() {
    if (m_troubles.isEmpty())
        return;
    QString text = m_troubles.mid(0, troublesTold).join(QStringLiteral("\n\n"));
    if (m_troubles.size() > troublesTold)
        text += QStringLiteral("\n\n") + wording(QStringLiteral("ועוד %1 כאלה."), QStringLiteral("And %1 more."))
                                             .arg(m_troubles.size() - troublesTold);
    m_platform.dialogs.message(text);
}

Cut SpltForm::cut(const QString& path, const QString& extension) {
    const Cut result = m_pieces.SplitFile(path, Text2.text, Mod4split::Target::Meforakim, extension);
    if (!result.failure)
        return result;
    const QString written =
        result.pieces == 0
            ? wording(QStringLiteral("לא נכתב אף חלק"), QStringLiteral("No piece was written"))
            : wording(QStringLiteral("חלקים שנכתבו: %1 מתוך %2"), QStringLiteral("Pieces written: %1 of %2"))
                  .arg(result.pieces)
                  .arg(result.declared);
    m_troubles += wording(QStringLiteral("%1 לא נחתך עד הסוף. %2; הקובץ עצמו לא השתנה."),
                          QStringLiteral("%1 was not cut to its end. %2; the file itself is as it was."))
                      .arg(LeafName(path), written) +
                  u'\n' + reason(*result.failure);
    return result;
}

Joined SpltForm::join(int index) {
    const QString path = List4Bodedim.item(index);
    const Joined result = m_pieces.MergeFamily(path);
    Family& family = families.at(static_cast<std::size_t>(index));
    if (result.failure) {
        family.fate = Family::Fate::Failed;
        m_troubles +=
            wording(QStringLiteral("%1 לא צורף. החלקים לא השתנו, ולא נותר קובץ חלקי."),
                    QStringLiteral("%1 was not joined. The pieces are as they were, and no half file is left."))
                .arg(LeafName(path)) +
            u'\n' + reason(*result.failure);
    } else if (!result.stopped) {
        family.fate = result.pieces == result.declared ? Family::Fate::Joined : Family::Fate::JoinedShort;
    }
    return result;
}

QString SpltForm::reason(const Failure& failure) const {
    const auto words = [&]() -> QString {
        switch (failure.kind) {
        case Failure::Kind::NotFound:
            return wording(QStringLiteral("הקובץ או התיקייה אינם נמצאים:"),
                           QStringLiteral("The file or folder is not there:"));
        case Failure::Kind::AccessDenied:
            return wording(QStringLiteral("אין הרשאה לקובץ או לתיקייה:"),
                           QStringLiteral("There is no right to the file or folder:"));
        case Failure::Kind::NoSpace:
            return wording(QStringLiteral("אין די מקום בדיסק:"),
                           QStringLiteral("There is not enough room on the disk:"));
        case Failure::Kind::TooLarge:
            return wording(QStringLiteral("גדול מדי; קובץ נחתך ל-999 חלקים לכל היותר:"),
                           QStringLiteral("Too large; a file is cut into 999 pieces at most:"));
        case Failure::Kind::Unsupported:
            return wording(QStringLiteral("שם הקובץ אינו מתאים:"),
                           QStringLiteral("The name of the file does not fit:"));
        case Failure::Kind::Damaged:
            return wording(QStringLiteral("הקובץ השתנה בזמן העבודה:"), QStringLiteral("The file changed meanwhile:"));
        default:
            return wording(QStringLiteral("תקלה:"), QStringLiteral("A fault:"));
        }
    }();
    return words + u'\n' + failure.message;
}

} // namespace lumora
