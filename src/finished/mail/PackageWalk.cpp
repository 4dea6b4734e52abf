#include "finished/mail/PackageWalk.h"

#include <algorithm>
#include <cmath>

namespace lumora {

namespace {

// A package is over when more minutes than this have passed.
constexpr double minutesOfPackage = 2;

qint64 wholeMinutes(const QDateTime& time) {
    return static_cast<qint64>(std::floor(static_cast<double>(time.toSecsSinceEpoch()) / 60));
}

} // namespace

qint64 MinuteBorders(const QDateTime& from, const QDateTime& to) {
    return wholeMinutes(to) - wholeMinutes(from);
}

void PackageWalk::begin(int packages, const QDateTime& now) {
    m_fates.assign(static_cast<std::size_t>(packages), Fate::Waiting);
    take(now);
}

void PackageWalk::take(const QDateTime& now) {
    m_start = now;
    m_minutes = 0;
}

PackageWalk::Step PackageWalk::step(int inHand, const QDateTime& now) {
    if (m_minutes <= minutesOfPackage)
        return Step::Wait;
    if (nextUnsent(inHand) < 0)
        return Step::Over;
    take(now);
    return Step::Next;
}

void PackageWalk::measure(const QDateTime& now) {
    // If the clock was set back, the minutes begin again; otherwise the package would wait until the clock has caught
    // up.
    if (now < m_start)
        m_start = now;
    m_minutes = static_cast<double>(MinuteBorders(m_start, now));
}

double PackageWalk::share(int inHand) const {
    constexpr double wholeMinutesOfPackage = minutesOfPackage + 1;
    return count() == 0 ? 0 : (inHand + std::min(m_minutes / wholeMinutesOfPackage, 1.0)) / count();
}

PackageWalk::Fate PackageWalk::fate(int package) const {
    return package >= 0 && package < count() ? m_fates[static_cast<std::size_t>(package)] : Fate::Waiting;
}

int PackageWalk::nextUnsent(int after) const {
    const auto from = m_fates.begin() + std::min(after + 1, count());
    const auto next = std::find_if(from, m_fates.end(), [](Fate fate) { return fate != Fate::Sent; });
    return next == m_fates.end() ? -1 : static_cast<int>(next - m_fates.begin());
}

int PackageWalk::count(Fate fate) const {
    return static_cast<int>(std::count(m_fates.begin(), m_fates.end(), fate));
}

} // namespace lumora
