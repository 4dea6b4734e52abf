#include "transfer/ftp/UploadPass.h"

#include "common/DrivePath.h"
#include "common/HostFile.h"
#include "order/BrokenFiles.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "transfer/delivery/UploadProgress.h"
#include "transfer/ftp/UploadLines.h"

#include <algorithm>
#include <chrono>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

const QString sharedPicture = u"000.jpg"_s; // goes behind all other files
constexpr std::chrono::milliseconds betweenPumps{10};
constexpr std::chrono::milliseconds mostOpening{5'000};

} // namespace

void UploadPass::run(int attempt) {
    m_events.reached(SendingMoment::PassBegins);
    m_session.beginPass();
    m_stop.StopFlag = false;
    beginFiles();
    m_lines = m_keeps && attempt == 1 ? m_transfer.ftpLines : 1;
    // The time since the last piece of an earlier pass tells nothing about the pace.
    LastPartTime = {};
    QSet<int> gone; // by several lines
    for (int i = 0; i < m_lists.List3.count() && !ends(); ++i) {
        if (mayGoByLines(i))
            gone = goByLines(i);
        if (ends() || gone.contains(i))
            continue;
        m_events.progressed(i, m_lists.List3.count());
        UploadOneFile(i);
        tellPiece(i);
    }
    if (m_stop.left)
        return;
    if (endEarly())
        return;
    if (m_stop.StopFlag)
        endStopped();
    else
        m_events.reached(SendingMoment::PassEnds);
}

void UploadPass::beginFiles() {
    m_end.reset();
    m_silence.begin();
    m_skipped = 0;
    m_keeps = m_session.isKept();
    m_lines = 1;
    m_running = true;
    m_lengths.clear();
    m_putting.clear();
    m_all = m_before = m_put = 0;
    m_pace.begin();
    const QSet<QString> ofPass(m_lists.List3.items().begin(), m_lists.List3.items().end());
    for (const QString& path : m_lists.List4Makor.items() + m_lists.List3.items()) {
        if (m_lengths.contains(path))
            continue;
        const Result<qint64> length = m_platform.files.size(DrivePath(path));
        m_lengths[path] = length ? *length : 0;
        m_all += lengthOf(path);
        m_before += ofPass.contains(path) ? 0 : lengthOf(path);
    }
}

bool UploadPass::endEarly() {
    m_running = false;
    if (!m_end || m_stop.left)
        return false;
    m_session.closeSession();
    m_stop.StopFlag = false;
    if (m_end != SendingPhase::NumberTaken)
        m_events.failed(m_endStep, m_endFailure);
    return true;
}

void UploadPass::watch() {
    tellBytes();
    if (!m_running || m_end || m_stop.StopFlag || !m_silence.overAfter(m_platform, m_skipped))
        return;
    endSilent();
    m_platform.internet.abort();
}

void UploadPass::endBy(SendingPhase end, LineStep step, const Failure& why) {
    m_end = end;
    m_endStep = step;
    m_endFailure = why;
    m_stop.StopFlag = true;
}

void UploadPass::endSilent() {
    endBy(SendingPhase::NotAll, LineStep::Silence, {Failure::Kind::TimedOut, u"the line was silent or too slow"_s});
}

// The end of a pass that could not keep what it was about to do.
void UploadPass::endUnkept() {
    if (m_session.unkept() && !m_stop.StopFlag)
        endBy(SendingPhase::NotAll, LineStep::KeepState, *m_session.unkept());
}

void UploadPass::endStopped() {
    m_session.closeSession();
    UserStopped = 1;
    m_stop.StopFlag = false;
    m_events.reached(SendingMoment::Stopped);
}

void UploadPass::tellPiece(int index) {
    const auto piece = PieceFromName(m_lists.List3.item(index));
    if (!piece)
        return;
    const QDateTime now = m_platform.clock.now();
    std::optional<int> minutes;
    if (!m_session.isKept() && !piece->last() && LastPartTime.isValid())
        minutes = MinutesLeft(LastPartTime.secsTo(now), m_lists.List3.count() - 1 - index);
    LastPartTime = now;
    m_events.pieceSent(piece->share(), minutes);
}

// What the line has moved since tells of the files that are being put. All of them count as there only once they are
// confirmed.
void UploadPass::tellBytes() {
    if (!m_running || !m_session.isKept())
        return;
    qint64 inHand = 0;
    for (const QString& path : std::as_const(m_putting))
        inHand += lengthOf(path);
    const qint64 moved = m_platform.internet.bytesMoved() - m_counted;
    const qint64 put = m_put + std::clamp<qint64>(moved, 0, std::max<qint64>(inHand - 1, 0));
    m_pace.moved(put, m_platform.clock.running());
    const qint64 there = std::min(m_before + m_skipped + put, m_all);
    m_events.movedBytes(there, m_all, m_pace.minutes(m_all - there));
}

// Where the pass holds the order's log, it has to be confirmed before the others begin; it is the first of them.
bool UploadPass::mayGoByLines(int index) const {
    return m_lines > 1 && m_keeps && index > 0 && m_session.inOrderFolder() && m_done.contains(m_lists.List3.item(0)) &&
           m_lists.List3.count() - index > 1;
}

// Gives the files that need no other try in this pass.
QSet<int> UploadPass::goByLines(int from) {
    const int count = m_lists.List3.count();
    QSet<int> gone;
    QList<int> waiting;
    for (int i = from; i < count && !ends() && LeafName(m_lists.List3.item(i)) != sharedPicture; ++i) {
        const QString path = m_lists.List3.item(i);
        if (!liesThere(path, LeafName(path))) {
            waiting += i;
            continue;
        }
        begin(i);
        skip(path);
        m_events.reached(SendingMoment::FileDone, i + 1);
        gone += i;
    }
    const int most = std::exchange(m_lines, 1);
    if (waiting.isEmpty() || ends())
        return gone;
    UploadLines lines(m_session.opener(), std::min(most, static_cast<int>(waiting.size())), m_session.lend());
    int endedEarly = 0; // sessions, behind their first file
    const auto settleEnded = [&] {
        if (ends()) {
            lines.close();
            m_platform.internet.abort();
        }
        const auto ended = lines.wait(betweenPumps);
        m_platform.pump.pump();
        if (!ended)
            return;
        const QString path = m_lists.List3.item(ended->number);
        BrokenBefore = m_lists.List4Broken.count();
        if (settle(path, m_session.endPut(path, ended->result)))
            ++m_putsOfSession;
        else if (ended->second && ++endedEarly > 1)
            m_keeps = false;
        m_events.reached(SendingMoment::FileDone, ended->number + 1);
        tellPiece(ended->number);
    };
    while (m_keeps && !waiting.isEmpty() && !ends() && (lines.canTake() || lines.isPutting() || lines.isOpening())) {
        while (!waiting.isEmpty() && !ends() && lines.canTake()) {
            gone += waiting.front();
            handOut(lines, waiting.takeFirst());
            readAheadOf(waiting.value(0, count));
        }
        settleEnded();
    }
    while (lines.isPutting())
        settleEnded();
    lines.close();
    m_session.takeBack(lines.takeOne());
    if (!m_keeps)
        m_session.FtpCloseConnection();
    // A server that lets no more in may keep the others waiting for their greeting. A line that has only begun to open
    // is reached by a later round.
    const auto until = m_platform.clock.running() + mostOpening;
    while (lines.isOpening()) {
        if (!ends() && m_platform.clock.running() >= until) {
            m_session.FtpCloseConnection();
            m_platform.internet.abort();
        }
        settleEnded();
    }
    return gone;
}

void UploadPass::handOut(UploadLines& lines, int index) {
    begin(index);
    const QString path = m_lists.List3.item(index);
    const Result<HostPath> local = m_session.beginPut(path);
    if (m_session.unkept()) {
        endUnkept();
    } else if (local) {
        m_putting += path;
        lines.put(index, *local, LeafName(path));
    } else {
        BrokenBefore = m_lists.List4Broken.count();
        settle(path, m_session.endPut(path, local.failure()));
    }
}

void UploadPass::readAheadOf(int index) const {
    if (const auto next = m_platform.files.host(DrivePath(m_lists.List3.item(index))); next && m_session.isKept())
        readAhead(*next);
}

void UploadPass::begin(int index) {
    m_lists.List3.setCurrentIndex(index);
    CurrentIndex = index;
    m_events.progressed(index, m_lists.List3.count());
    m_events.sending(index, m_lists.List3.count(), LeafName(m_lists.List3.item(index)));
}

void UploadPass::closeWithPauses() {
    m_session.PauseBar();
    m_session.FtpCloseConnection();
    m_session.PauseBar();
}

void UploadPass::UploadOneFile(int index) {
    m_lists.List3.setCurrentIndex(index);
    CurrentIndex = index;
    FaultPressed = false;
    m_stop.StopFlag = false;
    const bool stands = m_keeps && m_session.inOrderFolder();
    if (!stands && !reachOrderFolder())
        return;
    const bool good = m_session.inOrderFolder() && send(m_lists.List3.item(index));
    // With a server that ends each session after its first put, every second file would fail.
    if (!good && m_putsOfSession == 1)
        m_keeps = false;
    // Behind a last file that went well the check goes on where the session stands.
    if (!m_keeps || !good || m_stop.StopFlag)
        closeWithPauses();
}

// False: nothing can be put, and the connection is closed.
bool UploadPass::reachOrderFolder() {
    m_putsOfSession = 0;
    m_events.reached(SendingMoment::Reaching);
    m_session.PauseBar(2);
    m_session.walkToLabFolder();
    m_silence.connectsTimedOut(m_session.connectTimedOut);
    if (m_silence.over() && !m_stop.StopFlag)
        endSilent();
    if (!m_session.FolderOk) {
        closeWithPauses();
        m_events.reached(SendingMoment::Unreached);
        return false;
    }
    m_session.PauseBar();
    m_session.EnterOrderFolder();
    m_session.PauseBar();
    m_events.reached(SendingMoment::WalkDone);
    if (m_stop.left)
        return false;
    endUnkept();
    if (m_session.folderIsForeign() && !m_stop.StopFlag) {
        const bool basketKept = !m_session.journal()->state().items.isEmpty();
        const Failure why{Failure::Kind::InUse, u"the folder on the server holds another order"_s};
        m_session.log(u' ' + why.message);
        if (basketKept)
            m_session.listOrderFolders(); // for the number under which it is prepared again
        endBy(basketKept ? SendingPhase::NumberTaken : SendingPhase::CallLab, LineStep::ForeignFolder, why);
    }
    if (m_stop.StopFlag)
        m_session.FtpCloseConnection();
    return !m_stop.StopFlag;
}

void UploadPass::beginOrder(const QStringList& inHand) {
    m_inHand = inHand;
    m_done.clear();
}

bool UploadPass::triedAll() const {
    const QStringList& order = m_lists.List4Makor.items();
    return std::all_of(order.begin(), order.end(), [&](const QString& path) { return m_done.contains(path); });
}

// As built in the name alone tells it. A put that was not confirmed may have left a part of its file.
bool UploadPass::liesThere(const QString& path, const QString& name) {
    if (!m_lists.List6.contains(name))
        return false;
    if (!IsBroken(m_lists.List4Broken, name)) {
        if (!m_session.isOther(path))
            return true;
    } else if (m_inHand.contains(path) && m_session.isWhole(path)) {
        confirm(path);
        return true;
    }
    // A server may still hold open the file of a broken connection; it accepts the name again once the file is deleted.
    m_session.remove(name);
    return false;
}

// True: the file has been put well, or the server has it.
bool UploadPass::send(const QString& path) {
    const QString name = LeafName(path);
    bool good = true;
    m_events.sending(CurrentIndex, m_lists.List3.count(), name);
    if (liesThere(path, name))
        skip(path);
    else
        good = put(CurrentIndex);
    m_events.reached(SendingMoment::FileDone, CurrentIndex + 1);
    return good;
}

void UploadPass::skip(const QString& path) {
    m_skipped += lengthOf(path);
    countDone(path);
    m_events.reached(SendingMoment::Skipped);
}

void UploadPass::countDone(const QString& path) {
    m_done += path;
    m_session.countFiles(static_cast<int>(m_done.size()));
}

// Takes the path out of List4Broken.
void UploadPass::confirm(const QString& path) {
    TextList& broken = m_lists.List4Broken;
    for (int i = broken.lastIndex(); i >= 0; --i) {
        if (broken.item(i) == path)
            broken.removeAt(i);
    }
    m_inHand.removeAll(path);
    m_session.keepBrokenFiles();
    m_session.release(path);
}

bool UploadPass::put(int index) {
    const QString path = m_lists.List3.item(index);
    TextList& broken = m_lists.List4Broken;
    BrokenBefore = broken.count();
    m_putting = {path};
    m_counted = m_platform.internet.bytesMoved();
    readAheadOf(index + 1);
    if (!settle(path, m_session.FtpSendFile(path)))
        return false;
    ++m_putsOfSession;
    if (!m_session.lineEndsChanged(path))
        return true;
    broken.append(path);
    m_session.keepBrokenFiles();
    endBy(SendingPhase::CallLab, LineStep::ServerChanges, changed());
    return true;
}

// What follows a put, which was confirmed or not.
bool UploadPass::settle(const QString& path, bool sent) {
    m_putting.remove(path);
    if (m_putting.isEmpty())
        m_counted = m_platform.internet.bytesMoved();
    if (!sent) {
        endUnkept();
        m_inHand.removeAll(path);
        if (m_lists.List4Broken.count() > BrokenBefore)
            m_session.keepBrokenFiles();
        return false;
    }
    if (!m_putting.isEmpty())
        m_counted += lengthOf(path);
    m_put += lengthOf(path);
    if (IsBroken(m_lists.List4Broken, LeafName(path)))
        confirm(path);
    countDone(path);
    tellBytes();
    return true;
}

Failure UploadPass::changed() {
    const Failure why{Failure::Kind::Damaged, u"this server changes files on the way: set Type = I"_s};
    m_session.log(u' ' + why.message);
    return why;
}

void UploadPass::tellChanged() {
    m_events.failed(LineStep::ServerChanges, changed());
}

} // namespace lumora
