#include "finished/mail/PackageWalk.h"

#include <cmath>

namespace lumora {

namespace {

// A package is done once it has more.
constexpr double minutesOfPackage = 2;

qint64 wholeMinutes(const QDateTime& time) {
    return static_cast<qint64>(std::floor(static_cast<double>(time.toSecsSinceEpoch()) / 60));
}

} // namespace

qint64 MinuteBorders(const QDateTime& from, const QDateTime& to) {
    return wholeMinutes(to) - wholeMinutes(from);
}

void PackageWalk::begin(const QDateTime& now) {
    m_start = now;
    m_elapsed = 0;
}

PackageWalk::Step PackageWalk::step(int selected, int count, const QDateTime& now) {
    if (m_elapsed <= minutesOfPackage)
        return Step::Wait;
    if (selected > count - 2)
        return Step::Over;
    begin(now);
    return Step::Next;
}

void PackageWalk::measure(const QDateTime& now) {
    // A clock that was set back would hold the package until it has caught up.
    if (now < m_start)
        m_start = now;
    m_elapsed = static_cast<double>(MinuteBorders(m_start, now));
}

} // namespace lumora
