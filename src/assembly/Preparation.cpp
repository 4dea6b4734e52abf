#include "assembly/Preparation.h"

#include "common/FixedText.h"
#include "order/BasketLine.h"
#include "order/KeptPictures.h"
#include "order/KeptWork.h"
#include "order/PrintCode.h"
#include "order/PrintFileName.h"
#include "order/UnfinishedOrders.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

void Preparation::count(const QStringList& lines) {
    m_state.shemot.TotalPics = sumOfCopies(lines, CopiesIn::BasketLines);
    m_events.counted();
}

void Preparation::begin(const QStringList& lines) {
    m_lines = lines;
    m_failed.clear();
    m_prints = 0;
    m_withoutPrints = false;
    m_failedPrintStays = false;
    m_writeFailures = 0;
    m_state.transfer.leftOut = m_noJpeg;
    m_state.transfer.leftOutAsked = false;
    m_state.transfer.MailFlag = 0;
    count(m_lines);
}

void Preparation::takeHandOver() {
    m_replaced = std::exchange(m_state.handOver.replaced, {});
    const DrivePath goesOn = std::exchange(m_state.handOver.takenUp, {});
    const DrivePath& before = goesOn.isEmpty() ? m_replaced : goesOn;
    if (before.isEmpty())
        return;
    m_noJpeg = m_state.transfer.leftOut;
    m_noJpeg.removeIf([](const LeftOut& picture) { return picture.why != LeftOut::Why::NoJpeg; });
    KeptWork(m_state, m_platform.files, OrderFolder(before)).bringBack();
    if (goesOn.isEmpty())
        return;
    m_goesOn = true;
    m_folder = OrderFolder(goesOn);
    m_state.transfer.OrderFolder = goesOn;
}

bool Preparation::claimFolder(OrderFolder::Ending ending, Sender by) {
    if (const Result<void> ready = readyFolder(ending); !ready) {
        m_events.notWritten(PreparationEvents::NotWritten::Folder, ready.failure());
        return false;
    }
    const OrderState::Way way = m_state.TachanaMekomit ? OrderState::Way::Station
                                : by == Sender::Http   ? OrderState::Way::Http
                                                       : OrderState::Way::Ftp;
    keep(m_journal->begin(m_state, way, m_lines, m_replaced));
    for (int i = 0; m_goesOn && i < m_lines.size(); ++i) {
        if (!isThere(i) && IsOtherPicture(m_state, m_platform.files, m_journal->state(), i))
            m_others += i;
    }
    return true;
}

Result<void> Preparation::readyFolder(OrderFolder::Ending ending) {
    const Files& files = m_platform.files;
    m_there.clear();
    m_others.clear();
    if (m_folder && m_folder->path() == OrderFolder::inPreparation(m_state, ending).path()) {
        m_journal.emplace(files, *m_folder);
        const bool sameLines = m_goesOn && m_journal->state().items == m_lines;
        if (const Result<void> kept = sameLines ? findPrints() : removePrints(); !kept)
            return kept;
        if (const QString replaces = m_journal->state().replaces; !replaces.isEmpty())
            m_replaced = m_folder->path().folder() / replaces;
        return makeOrderFolder(files, *m_folder); // it may have been removed meanwhile
    }
    const Result<OrderFolder> claimed = claimOrderFolder(m_state, files, ending);
    if (!claimed)
        return claimed.failure();
    m_folder = *claimed;
    m_journal.emplace(files, *m_folder);
    m_state.transfer.OrderFolder = claimed->path();
    return {};
}

// All prints of an order have one shape, and the lab's settings may have changed meanwhile.
Result<void> Preparation::findPrints() {
    const LineForm form = lineFormOf(m_state.Optint);
    for (int i = 0; i < m_lines.size(); ++i) {
        const BasketLine line = BasketLine::split(m_lines[i], form);
        const DrivePath print = m_folder->filePath(PrintNameOf(line, i, m_state.Optint));
        if (!line.hasUsableName() || !m_platform.files.fileExists(print))
            continue;
        if (m_there.isEmpty() && !PrintFits(m_state, m_platform.files, print)) {
            return removePrints();
        }
        m_there += i;
    }
    return {};
}

// A print that stayed would be sent with the order and printed.
Result<void> Preparation::removePrints() const {
    for (const QString& name : m_platform.files.names(m_folder->path(), u"*.jpp"_s)) {
        if (const Result<void> removed = m_platform.files.removeFile(m_folder->filePath(name)); !removed)
            return removed;
    }
    return {};
}

// An order without its state can be sent all the same, it only can't be taken up again; without a thumbnail a cell of
// its sheet stays empty.
void Preparation::keep(const Result<void>& written) {
    if (!written)
        notWritten(written.failure());
}

bool Preparation::forEachPicture(const std::function<void(int)>& step) {
    for (int i = 0; i < m_lines.size(); ++i) {
        m_events.packing(i + 1);
        step(i);
        if (!m_events.yield())
            return false;
    }
    if (m_writeFailures > 1)
        m_events.filesNotWritten(m_writeFailures);
    return true;
}

bool Preparation::pack(PrintPacker& packer, const PrintPacker::Line& line,
                       const std::function<Result<QByteArray>()>& picture) {
    const KeptPictures kept(m_platform.files, m_state.keptFolder);
    const int failuresBefore = m_writeFailures;
    const PrintPacker::Outcome outcome = packer.pack(line, picture);
    if (outcome.packed)
        ++m_prints;
    else if (outcome.writeFailure || m_writeFailures > failuresBefore)
        notPrepared(line.path, LeftOut::Why::NotWritten);
    else
        notPrepared(line.path, HasQuestionMark(line.path.text())                     ? LeftOut::Why::Name
                               : m_platform.files.fileExists(kept.fileOf(line.path)) ? LeftOut::Why::Damaged
                                                                                     : LeftOut::Why::Gone);
    if (outcome.writeFailure)
        notWritten(*outcome.writeFailure);
    if (outcome.removeFailure) {
        m_failedPrintStays = true;
        m_events.notWritten(PreparationEvents::NotWritten::Print, *outcome.removeFailure);
    }
    return outcome.packed;
}

bool Preparation::isGivenUp(int index, const DrivePath& picture) {
    if (m_others.contains(index))
        notPrepared(picture, LeftOut::Why::Gone);
    return m_others.contains(index);
}

void Preparation::notPrepared(const DrivePath& picture, LeftOut::Why why) {
    m_failed += picture.text();
    m_state.transfer.leftOut += LeftOut{picture, why};
    m_events.notPrepared(picture);
}

bool Preparation::isHeldBackForPrints() {
    m_withoutPrints = !m_failedPrintStays && m_state.Careful && m_prints == 0 && m_there.isEmpty();
    return m_failedPrintStays || m_withoutPrints;
}

bool Preparation::isHeldBackForSheet(const Failure& failure) {
    if (m_state.Careful)
        m_events.notWritten(PreparationEvents::NotWritten::Sheet, failure);
    return m_state.Careful;
}

// On a full disk every picture fails in the same way.
void Preparation::notWritten(const Failure& failure) {
    if (m_writeFailures++ == 0)
        m_events.notWritten(PreparationEvents::NotWritten::File, failure);
}

std::optional<Bitmap> Preparation::drawSheet(SheetKind kind, const QStringList& lines, const QList<SheetLine>& texts,
                                             const std::vector<SheetCell>& cells,
                                             const OrderSheet::NextPicture& pictures) {
    OrderSheet sheet(kind, orderSheetSize(kind, static_cast<int>(lines.size())), orderSheetBackground(kind, m_state));
    sheet.drawLines(texts);
    m_events.drawingSheet(0);
    bool goOn = true;
    const auto after = [&](int i) {
        m_events.drawingSheet(i + 1);
        return goOn = m_events.yield();
    };
    if (pictures)
        sheet.drawContactSheet(cells, pictures, after);
    else
        sheet.drawContactSheet(cells, after);
    if (!goOn)
        return std::nullopt;
    m_sheetSaved = m_events.sheetDrawn(sheet.bitmap());
    return sheet.bitmap();
}

void Preparation::countOrder() {
    m_events.closing();
    if (const Result<void> counted = Workspace(m_state, m_platform.files).writeCounter(); !counted)
        m_events.notWritten(PreparationEvents::NotWritten::Counter, counted.failure());
}

bool Preparation::writeLog(OrderLog::Layout layout) {
    const QByteArray log = OrderLog::of(m_state, layout, m_lines, m_failed, m_platform.clock.now()).write();
    if (const Result<void> logged = m_platform.files.writeWhole(m_folder->logPath(), log); !logged) {
        m_events.notWritten(PreparationEvents::NotWritten::Log, logged.failure());
        return false;
    }
    m_state.transfer.OrderLogBase = m_folder->logBase();
    keep(m_journal->prepared());
    removeWhatIsNotNeeded();
    return true;
}

// A station's order is never made again.
void Preparation::removeWhatIsNotNeeded() {
    const Files& files = m_platform.files;
    static_cast<void>(RemoveReplacedOrder(files, *m_journal)); // the next start tries again
    const DrivePath kept = m_folder->keptWorkPath();
    if (m_journal->state().way == OrderState::Way::Station && files.folderExists(kept))
        static_cast<void>(files.removeTree(kept)); // hidden, and never sent
}

} // namespace lumora
