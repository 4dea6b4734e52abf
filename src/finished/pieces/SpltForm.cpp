#include "finished/pieces/SpltForm.h"

#include "finished/orders/UnreadableFolders.h"
#include "platform/Dialogs.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"
#include "session/Workspace.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

SpltForm::SpltForm(const SessionState& state, const Platform& platform, PageChain& chain)
    : Page(PageId::SpltForm)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain)
    , m_pieces(platform.files, [this](int done, int total) { return step(done, total); }) {
    Text2.text = u"400000"_s;
    enter(Phase::Idle);
}

void SpltForm::enter(Phase phase) {
    m_phase = phase;
    const bool working = phase == Phase::Working;
    Text2.enabled = Command2.enabled = Command8.enabled = Command9.enabled = !working;
    Command3.enabled = !working && !List4files.isEmpty();
    Command1.enabled = !working && !List4Bodedim.isEmpty();
    Command4.enabled = !working && List4Bodedim.currentIndex() >= 0;
    Command6.enabled = !working && ListChalakim.currentIndex() >= 0;
    Command15.visible = working;
    Label4Idle.visible = phase == Phase::Idle;
    if (working || phase == Phase::Idle) {
        Label4Total.text.clear();
        Label4Where.text.clear();
    }
    if (!working)
        Label4Work.text.clear();
    Q_EMIT changed();
}

// --- what is cut and joined ---

DrivePath SpltForm::pickFile() {
    if (m_folder.isEmpty())
        m_folder = WorkspacePaths::orders(m_state);
    const QString prompt = wording(u"בחר תמונה אחת בלבד "_s, u"Choose one picture only "_s);
    const DrivePath path = m_platform.dialogs.pickFile(prompt, m_folder, prompt, Dialogs::Offer::EveryFile);
    if (!path.isEmpty())
        m_folder = path.folder();
    return path;
}

// A folder that can't be read is named in a box; the others are listed.
QStringList SpltForm::collect(const DrivePath& folder, Files::Depth depth) {
    QStringList unreadable;
    const QStringList files = m_platform.files.collect(folder, depth, &unreadable);
    TellUnreadableFolders(m_state, m_platform.dialogs, unreadable);
    return files;
}

void SpltForm::chooseFilesToCut() {
    if (m_phase == Phase::Working || pickFile().isEmpty())
        return;
    List4files.clear();
    List4files.append(collect(m_folder, Files::Depth::ThisFolder));
    enter(Phase::Idle);
}

void SpltForm::addPieces() {
    if (m_phase == Phase::Working || pickFile().isEmpty())
        return;
    List4files.clear();
    ListChalakim.append(collect(m_folder, Files::Depth::WithSubfolders));
    ListSingles(ListChalakim, List4Bodedim);
    List4Famely.clear();
    m_families = JudgeFamilies(List4Bodedim, ListChalakim);
    m_fates.assign(m_families.size(), Fate::Listed);
    m_piecesRead = true;
    showCounts();
    enter(Phase::Idle);
}

void SpltForm::chooseFamily(int index) {
    if (m_phase == Phase::Working)
        return;
    List4Bodedim.setCurrentIndex(index);
    CollectFamily(List4Bodedim, ListChalakim, List4Famely);
    enter(m_phase);
}

void SpltForm::choosePiece(int index) {
    if (m_phase == Phase::Working)
        return;
    ListChalakim.setCurrentIndex(index);
    m_length.reset();
    m_lengthOf = {};
    showCounts();
    enter(m_phase);
}

void SpltForm::showLengthOfChosen() {
    const DrivePath path(ListChalakim.currentItem());
    if (m_phase == Phase::Working || path.isEmpty())
        return;
    const auto size = m_platform.files.size(path);
    m_length = size ? std::optional(*size) : std::nullopt;
    m_lengthOf = path;
    showCounts();
    if (!size)
        m_platform.dialogs.message(reason(size.failure()));
    Q_EMIT changed();
}

// --- the work ---

void SpltForm::cutAll() {
    if (m_phase == Phase::Working || !segmentIsRight())
        return;
    begin();
    Tally tally;
    DrivePath where;
    for (int i = 0; i < List4files.count() && !m_stop; ++i) {
        const DrivePath path(List4files.item(i));
        if (path.isEmpty())
            break;
        workOn(path, i, List4files.count());
        const Cut result = cut(path, u"jpp"_s);
        tally.pieces += result.pieces;
        if (result.passedOver)
            ++tally.passedOver;
        else if (result.failure)
            ++tally.failed;
        else if (!result.stopped)
            ++tally.done;
        if (result.pieces > 0)
            where = result.folder;
        // The disk is full: every further file would fail too.
        if (result.failure && result.failure->kind == Failure::Kind::NoSpace)
            break;
    }
    end(tally.failed > 0            ? Phase::Failed
        : tally.done > 0 && !m_stop ? Phase::Good
                                    : Phase::Partly,
        cutTotal(tally), where);
}

void SpltForm::cutOne() {
    if (m_phase == Phase::Working || !segmentIsRight())
        return;
    const DrivePath path = pickFile();
    if (path.isEmpty())
        return;
    begin();
    workOn(path, 0, 1);
    const Cut result = cut(path, u"prk"_s);
    const QString total =
        result.passedOver
            ? wording(u"%1 אינו מסתיים ב-prk ולכן לא נחתך."_s, u"%1 does not end in prk and was not cut."_s)
                  .arg(path.leaf())
            : (result.failure || result.stopped
                   ? wording(u"%1 לא נחתך עד הסוף. חלקים: %2."_s, u"%1 was not cut to its end. Pieces: %2."_s)
                   : wording(u"%1 נחתך. חלקים: %2."_s, u"%1 was cut. Pieces: %2."_s))
                  .arg(path.leaf(), QString::number(result.pieces));
    end(result.failure                        ? Phase::Failed
        : result.passedOver || result.stopped ? Phase::Partly
                                              : Phase::Good,
        total, result.pieces > 0 ? result.folder : DrivePath());
}

Cut SpltForm::cut(const DrivePath& path, const QString& extension) {
    const Cut result = m_pieces.SplitFile(path, Text2.text, Mod4split::Target::Meforakim, extension);
    if (result.failure)
        m_troubles += notCut(path, result);
    return result;
}

bool SpltForm::segmentIsRight() {
    if (SegmentSize(Text2.text))
        return true;
    m_platform.dialogs.message(
        wording(u"גודל החלק \"%1\" אינו תקין.\nיש לרשום מספר שלם של בתים, מ-1 עד 2147483647."_s,
                u"\"%1\" is no size of a piece.\nWrite a whole number of bytes, from 1 to 2147483647."_s)
            .arg(Text2.text));
    return false;
}

void SpltForm::joinAll() {
    if (m_phase == Phase::Working)
        return;
    begin();
    Tally tally;
    DrivePath where;
    for (int i = 0; i < List4Bodedim.count() && !m_stop; ++i) {
        List4Bodedim.setCurrentIndex(i);
        workOn(DrivePath(List4Bodedim.item(i)), i, List4Bodedim.count());
        if (CollectFamily(List4Bodedim, ListChalakim, List4Famely) != familyComplete) {
            ++tally.passedOver;
            continue;
        }
        const Joined result = join(i);
        if (result.failure)
            ++tally.failed;
        else if (!result.stopped)
            ++tally.done;
        if (!result.file.isEmpty())
            where = result.file.folder();
        if (result.failure && result.failure->kind == Failure::Kind::NoSpace)
            break;
    }
    end(tally.failed > 0                   ? Phase::Failed
        : tally.passedOver == 0 && !m_stop ? Phase::Good
                                           : Phase::Partly,
        joinTotal(tally), where);
}

// Joins the chosen family, complete or not.
void SpltForm::joinChosen() {
    const int index = List4Bodedim.currentIndex();
    if (m_phase == Phase::Working || index < 0)
        return;
    begin();
    workOn(DrivePath(List4Bodedim.currentItem()), 0, 1);
    const Joined result = join(index);
    if (result.failure || result.stopped) {
        end(result.failure ? Phase::Failed : Phase::Partly, wording(u"לא צורף קובץ."_s, u"No file was joined."_s), {});
        return;
    }
    QString total = wording(u"%1 צורף. חלקים: %2, בתים: %3."_s, u"%1 was joined. Pieces: %2, bytes: %3."_s)
                        .arg(result.file.leaf(), QString::number(result.pieces), QString::number(result.bytes));
    // When a file's size is an exact multiple of the piece size, its pieces declare one piece too many. So the names do
    // not tell whether this file is whole.
    if (result.pieces != result.declared)
        total += wording(u" בשם רשומים %1 חלקים: יש לבדוק שהקובץ שלם."_s,
                         u" The name declares %1: check that the file is whole."_s)
                     .arg(result.declared);
    end(result.pieces == result.declared ? Phase::Good : Phase::Partly, total, result.file.folder());
}

Joined SpltForm::join(int index) {
    const DrivePath path(List4Bodedim.item(index));
    const Joined result = m_pieces.MergeFamily(path);
    Fate& fate = m_fates.at(static_cast<std::size_t>(index));
    if (result.failure) {
        fate = Fate::Failed;
        m_troubles += notJoined(path, *result.failure);
    } else if (!result.stopped) {
        fate = result.pieces == result.declared ? Fate::Joined : Fate::JoinedShort;
    }
    return result;
}

// --- its course ---

void SpltForm::begin() {
    m_stop = false;
    m_percent = 0;
    m_troubles.clear();
    enter(Phase::Working);
}

void SpltForm::workOn(const DrivePath& path, int index, int count) {
    m_index = index;
    m_count = count;
    Label4Work.text = wording(u"%1 מתוך %2: %3"_s, u"%1 of %2: %3"_s).arg(index + 1).arg(count).arg(path.leaf());
    Q_EMIT changed();
}

bool SpltForm::step(int done, int total) {
    m_percent =
        static_cast<int>(100.0 * (m_index + static_cast<double>(done) / std::max(total, 1)) / std::max(m_count, 1));
    Q_EMIT changed();
    m_platform.pump.pump();
    m_stop = m_stop || m_chain.hasEnded();
    return !m_stop;
}

void SpltForm::end(Phase result, const QString& total, const DrivePath& where) {
    enter(result);
    Label4Total.text = (m_stop ? wording(u"העבודה נעצרה. "_s, u"The work was stopped. "_s) : QString()) + total;
    Label4Where.text = where.text();
    tellTroubles();
    if (m_leaving && !m_chain.hasEnded())
        leave();
}

// Shows the failures in one box, however many files failed.
void SpltForm::tellTroubles() {
    constexpr int told = 2;
    if (m_troubles.isEmpty())
        return;
    m_platform.dialogs.message(shortList(m_state, m_troubles, told, u"\n\n"_s));
}

void SpltForm::goBack() {
    m_stop = true;
    m_leaving = true;
    if (m_phase != Phase::Working)
        leave();
}

void SpltForm::leave() {
    m_chain.follow(PageId::SpltForm, Outcome::PiecesDone);
}

} // namespace lumora
