#include "transfer/delivery/SilenceLimit.h"

#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"

namespace lumora {

namespace {

constexpr int mostSilentFiles = 2;
constexpr qint64 window = 300;                // seconds
constexpr qint64 leastOfPass = window * 1000; // bytes in a window
constexpr qint64 leastOfCheck = 1000;
// After a longer gap the machine has slept or its clock was set.
constexpr qint64 longestGap = 60; // seconds

} // namespace

void SilenceLimit::begin(Work work) {
    m_least = work == Work::Pass ? leastOfPass : leastOfCheck;
    m_samples.clear();
    m_silentFiles = 0;
    m_tooSlow = false;
}

void SilenceLimit::connectsTimedOut(bool all) {
    m_silentFiles = all ? m_silentFiles + 1 : 0;
}

void SilenceLimit::moved(qint64 bytes, const QDateTime& now) {
    if (!m_samples.empty()) {
        const qint64 gap = m_samples.back().time.secsTo(now);
        if (gap < 0 || gap > longestGap)
            m_samples.clear();
    }
    m_samples.push_back({now, bytes});
    while (m_samples.size() > 1 && m_samples[1].time.secsTo(now) >= window)
        m_samples.pop_front();
    const Sample& then = m_samples.front();
    m_tooSlow = m_tooSlow || (then.time.secsTo(now) >= window && bytes - then.bytes < m_least);
}

bool SilenceLimit::over() const {
    return m_state.Careful && (m_silentFiles >= mostSilentFiles || m_tooSlow);
}

bool SilenceLimit::overAfter(const Platform& platform, qint64 skipped) {
    moved(platform.internet.bytesMoved() + skipped, platform.clock.now());
    return over();
}

} // namespace lumora
