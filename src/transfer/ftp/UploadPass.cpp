#include "transfer/ftp/UploadPass.h"

#include "common/DrivePath.h"
#include "order/BrokenFiles.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "transfer/delivery/UploadProgress.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

void UploadPass::run() {
    m_events.reached(SendingMoment::PassBegins);
    m_session.beginPass();
    m_stop.StopFlag = false;
    beginFiles();
    // The time since the last piece of an earlier pass tells nothing about the pace.
    LastPartTime = {};
    for (int i = 0; i < m_lists.List3.count() && !m_stop.StopFlag && !m_stop.left; ++i) {
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
    m_keeps = m_transfer.keptFtpSession;
    m_running = true;
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
    if (!piece->last() && LastPartTime.isValid())
        minutes = MinutesLeft(LastPartTime.secsTo(now), m_lists.List3.count() - 1 - index);
    LastPartTime = now;
    m_events.pieceSent(piece->share(), minutes);
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
    if (!m_keeps || !good || m_stop.StopFlag || index == m_lists.List3.lastIndex())
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
    if (liesThere(path, name)) {
        if (const Result<qint64> length = m_platform.files.size(DrivePath(path)))
            m_skipped += *length;
        countDone(path);
        m_events.reached(SendingMoment::Skipped);
    } else {
        good = put(path, name);
    }
    m_events.reached(SendingMoment::FileDone, CurrentIndex + 1);
    return good;
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

bool UploadPass::put(const QString& path, const QString& name) {
    TextList& broken = m_lists.List4Broken;
    BrokenBefore = broken.count();
    if (!m_session.FtpSendFile(path)) {
        endUnkept();
        m_inHand.removeAll(path);
        if (broken.count() > BrokenBefore)
            m_session.keepBrokenFiles();
        return false;
    }
    ++m_putsOfSession;
    if (IsBroken(broken, name))
        confirm(path);
    countDone(path);
    if (!m_session.lineEndsChanged(path))
        return true;
    broken.append(path);
    m_session.keepBrokenFiles();
    endBy(SendingPhase::CallLab, LineStep::ServerChanges, changed());
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
