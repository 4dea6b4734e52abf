#include "order/OrderJournal.h"

#include "order/BasketLine.h"
#include "order/DoorFolders.h"
#include "order/KeptPictures.h"
#include "order/OrderChoices.h"
#include "order/OrderCompleteness.h"
#include "order/OrderNames.h"
#include "order/OrderSender.h"
#include "order/PictureMark.h"
#include "platform/files/Files.h"

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

using Phase = OrderState::Phase;
using Way = OrderState::Way;

namespace {

Way wayOf(Sender by) {
    return by == Sender::Http ? Way::Http : Way::Ftp;
}

} // namespace

OrderJournal::OrderJournal(const Files& files, OrderFolder folder)
    : m_files(files)
    , m_folder(std::move(folder)) {
    const Result<OrderState> read = ReadOrderState(m_files, m_folder);
    if (read) {
        m_state = *read;
        m_known = m_kept = true;
    } else if (read.failure().kind != Failure::Kind::NotFound) {
        expectTheWorst();
    }
}

// What the state told can't be read: any file may have been cut in a put, and the lab may have been told.
void OrderJournal::expectTheWorst() {
    makeKnown();
    for (const QString& name : m_files.names(m_folder.path(), u"*"_s))
        m_state.filesInHand += m_folder.filePath(name).text();
    m_state.report = OrderState::Report::Begun;
}

void OrderJournal::makeKnown() {
    if (m_known)
        return;
    const QString name = m_folder.name();
    m_state = {};
    m_state.phase = Phase::Prepared;
    m_state.number = OrderNumberOf(name);
    if (TravelsInPieces(m_state.number))
        m_state.number.chop(1);
    m_state.serial = name.left(name.lastIndexOf(u'^')).section(u'_', -1);
    m_state.way = wayOf(SenderMadeFor(m_files, m_folder).value_or(Sender::Ftp));
    m_state.sentBefore = m_sentAgain;
    m_known = true;
}

// The step counts for this run even where it can't be written; the next one tries again.
Result<void> OrderJournal::keep(const OrderState& next) {
    if (m_kept && next == m_state)
        return {};
    m_state = next;
    const Result<void> written = WriteOrderState(m_files, m_folder, m_state);
    m_kept = written.ok();
    return written;
}

// An order that goes on keeps the marks of its first start: another picture may stand at a path by now.
QStringList OrderJournal::marksOf(const QStringList& lines, const SessionState& session) const {
    if (lines == m_state.items && m_state.marks.size() == lines.size())
        return m_state.marks;
    const KeptPictures kept(m_files, session.keptFolder);
    QStringList marks;
    for (const QString& line : lines)
        marks += PictureMark(m_files, kept.fileOf(BasketLine::split(line, lineFormOf(session.Optint)).path));
    return marks;
}

Result<void> OrderJournal::begin(const SessionState& session, Way way, const QStringList& lines,
                                 const DrivePath& replaces) {
    OrderState next;
    next.number = session.MisparHazmana;
    next.serial = session.shemot.ser;
    next.kind = session.Optint;
    next.way = way;
    next.items = lines;
    next.keptIn = session.keptFolder.text();
    next.marks = marksOf(lines, session);
    next.choices = ChoicesOf(session);
    next.replaces = replaces.isEmpty() ? QString() : replaces.leaf();
    m_known = true;
    return keep(next);
}

Result<void> OrderJournal::prepared() {
    makeKnown();
    OrderState next = m_state;
    next.phase = Phase::Prepared;
    next.lengths.clear();
    for (const QString& name : m_files.names(m_folder.path(), printPatterns)) {
        if (const Result<qint64> length = m_files.size(m_folder.filePath(name)))
            next.lengths[name] = *length;
    }
    return keep(next);
}

Result<void> OrderJournal::sendingBegins(Sender by, bool ours) {
    makeKnown();
    OrderState next = m_state;
    next.folderAsked.reset();
    next.phase = std::max(next.phase, Phase::Sending);
    if (next.way == Way::Station || next.way == Way::Mail)
        next.way = wayOf(by);
    next.folderMadeByUs = next.folderMadeByUs || (ours && next.way == wayOf(by));
    const bool isFirst = m_state.phase < Phase::Sending;
    const Result<void> kept = keep(next);
    if (kept) {
        const DrivePath aside = m_folder.keptWorkPath();
        if (m_files.folderExists(aside))
            static_cast<void>(m_files.removeTree(aside)); // hidden, and never sent
    }
    if (kept && isFirst)
        removeDoorFolders(m_files, m_state);
    return kept;
}

bool OrderJournal::ownsFolder(Sender by) const {
    return m_state.folderMadeByUs && m_state.way == wayOf(by);
}

Result<void> OrderJournal::folderIsAsked(Sender by) {
    makeKnown();
    OrderState next = m_state;
    next.folderAsked = ownsFolder(by) ? std::nullopt : std::optional(by);
    return keep(next);
}

Result<void> OrderJournal::folderIsRefused() {
    makeKnown();
    OrderState next = m_state;
    next.folderAsked.reset();
    return keep(next);
}

Result<void> OrderJournal::folderIsLost(Sender by) {
    if (!ownsFolder(by))
        return {};
    OrderState next = m_state;
    next.folderMadeByUs = false;
    return keep(next);
}

Result<void> OrderJournal::take(const QString& path) {
    makeKnown();
    OrderState next = m_state;
    if (!next.filesInHand.contains(path))
        next.filesInHand += path;
    return keep(next);
}

Result<void> OrderJournal::release(const QString& path) {
    makeKnown();
    OrderState next = m_state;
    next.filesInHand.removeAll(path);
    return keep(next);
}

void OrderJournal::countFiles(int sent, int inAll) {
    m_state.filesSent = sent;
    m_state.filesInAll = inAll;
}

void OrderJournal::markProven() {
    m_kept = m_kept && m_state.proven;
    m_state.proven = true;
}

Result<void> OrderJournal::arrived(bool byNameOnly) {
    makeKnown();
    OrderState next = m_state;
    next.phase = std::max(next.phase, Phase::Arrived);
    next.provenByNameOnly = byNameOnly;
    next.filesInHand.clear();
    next.fewerAgreed = false;
    return keep(next);
}

Result<void> OrderJournal::arrivedAsAgreed() {
    makeKnown();
    OrderState next = m_state;
    next.filesInHand.clear();
    next.fewerAgreed = next.phase < Phase::Arrived;
    return keep(next);
}

Result<void> OrderJournal::reportBegun() {
    makeKnown();
    const OrderState before = m_state;
    OrderState next = m_state;
    next.report = OrderState::Report::Begun;
    const Result<void> kept = keep(next);
    if (!kept)
        m_state = before;
    return kept;
}

Result<void> OrderJournal::reportDone() {
    makeKnown();
    OrderState next = m_state;
    next.report = OrderState::Report::Done;
    next.phase = Phase::Reported;
    return keep(next);
}

Result<void> OrderJournal::needsNoReport() {
    makeKnown();
    OrderState next = m_state;
    next.phase = Phase::Reported;
    return keep(next);
}

Result<void> OrderJournal::replacesNone() {
    OrderState next = m_state;
    next.replaces.clear();
    return keep(next);
}

Result<void> OrderJournal::wentByMail() {
    makeKnown();
    OrderState next = m_state;
    next.way = Way::Mail;
    return keep(next);
}

Result<void> OrderJournal::tried(const BothLanguages& why) {
    OrderState next = m_state;
    ++next.tries;
    next.why = why;
    return keep(next);
}

Result<void> OrderJournal::held(bool isHeld) {
    OrderState next = m_state;
    next.held = isHeld;
    return keep(next);
}

Result<void> OrderJournal::lapsed() {
    OrderState next = m_state;
    next.lapsed = true;
    return keep(next);
}

Result<void> OrderJournal::givenUp() {
    OrderState next = m_state;
    next.givenUp = true;
    return keep(next);
}

} // namespace lumora
