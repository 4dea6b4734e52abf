#include "selection/CardCopies.h"

#include "common/Background.h"
#include "common/HostFile.h"

#include <algorithm>

namespace lumora {

namespace {

constexpr qint64 atOnce = qint64(4) << 20;
// What must stay free for the prints of the order.
constexpr std::uintmax_t spared = std::uintmax_t(256) << 20;

bool hasRoom(const HostPath& target, std::uintmax_t bytes) {
    std::error_code untold;
    const std::filesystem::space_info disk = std::filesystem::space(target.parent_path(), untold);
    return untold || disk.available > bytes + spared;
}

} // namespace

CardCopies::CardCopies(const Files& files, const DrivePath& orderFolder)
    : m_kept(files, orderFolder) {}

CardCopies::~CardCopies() {
    m_stop.request_stop();
}

void CardCopies::want(const std::vector<Picture>& chosen, bool again) {
    m_queue.clear();
    for (const Picture& picture : chosen) {
        Copy& copy = m_copies[picture.path];
        if (copy.stamp != picture.source.stamp)
            copy = {State::Unknown, {}, false, picture.source.stamp}; // of another card, also where that one is in hand
        if (copy.state == State::Unknown && isKept(picture))
            copy.state = State::Kept; // an order that came back
        const bool failed = copy.state == State::Missing || copy.state == State::NotKept;
        if (copy.inHand || copy.state == State::Kept || (failed && !again))
            continue;
        copy.state = State::Waiting;
        m_queue.push_back(picture);
    }
    startNext();
}

// A card that has gone can tell of no other picture.
bool CardCopies::isKept(const Picture& picture) const {
    const PictureStamp kept = m_kept.copiedStamp(DrivePath(picture.path));
    return kept.isThere && (!picture.source.stamp.isThere || kept == picture.source.stamp);
}

// A thread of its own, since a card that hangs may hold it for good.
void CardCopies::startNext() {
    if (m_running || m_queue.empty())
        return;
    const Picture picture = m_queue.front();
    m_queue.pop_front();
    m_running = m_copies[picture.path].inHand = true;
    const Result<HostPath> target = m_kept.targetOf(DrivePath(picture.path));
    runInBackground([ticket = m_desk.ticket(), picture, target, stop = m_stop.get_token()] {
        const Copy copy = target ? copyWhole(picture, *target, stop)
                                 : Copy{State::NotKept, targetFailure(target.failure()), false, picture.source.stamp};
        ticket.handIn([path = picture.path, copy](CardCopies& copies) { copies.settle(path, copy); });
    });
}

void CardCopies::settle(const QString& path, const Copy& copy) {
    m_running = false;
    if (m_copies[path].stamp == copy.stamp)
        m_copies[path] = copy;
    startNext();
    Q_EMIT settled(path);
}

// What was read counts only where the same file lies there before and after.
CardCopies::Copy CardCopies::copyWhole(const Picture& picture, const HostPath& target, const std::stop_token& stop) {
    const auto missing = [&](const Failure& why) { return Copy{State::Missing, why, false, picture.source.stamp}; };
    const QString shown = shownPath(picture.source.file);
    const Failure other{Failure::Kind::NotFound, shown};
    std::error_code untold;
    std::filesystem::remove(target, untold); // of another card
    if (!picture.source.stamp.isThere || stampOf(picture.source.file) != picture.source.stamp)
        return missing(other);
    if (!hasRoom(target, picture.source.stamp.length))
        return {State::NotKept, {Failure::Kind::NoSpace, shownPath(target)}, false, picture.source.stamp};
    const Result<Descriptor> source = openSource(picture.source.file, shown);
    if (!source)
        return missing(source.failure());
    NewContent content(target, shownPath(target));
    std::uintmax_t copied = 0;
    for (;;) {
        const Result<qint64> part = appendFrom(*source, atOnce, content, shown);
        if (!part)
            return missing(part.failure());
        copied += static_cast<std::uintmax_t>(*part);
        if (stop.stop_requested())
            return missing(other);
        if (*part < atOnce)
            break;
    }
    if (!content.failed() &&
        (copied != picture.source.stamp.length || stampOf(picture.source.file) != picture.source.stamp))
        return missing(other);
    content.setTime(picture.source.stamp.time);
    if (const Result<void> whole = content.commit(); !whole)
        return {State::NotKept, targetFailure(whole.failure()), false, picture.source.stamp};
    return {State::Kept, {}, false, picture.source.stamp};
}

} // namespace lumora
