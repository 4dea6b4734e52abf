#include "transfer/delivery/SilenceLimit.h"

#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

namespace {

constexpr int mostSilentFiles = 2;
constexpr std::chrono::seconds window(300);
constexpr qint64 leastOfPass = window.count() * 1000; // bytes in a window
constexpr qint64 leastOfCheck = 1000;
constexpr std::chrono::seconds longestGap(60);

} // namespace

void SilenceLimit::begin(Work work) {
    m_least = work == Work::Pass ? leastOfPass : leastOfCheck;
    m_samples.clear();
    m_told.reset();
    m_passed = {};
    m_silentFiles = 0;
    m_tooSlow = false;
}

void SilenceLimit::connectsTimedOut(bool all) {
    m_silentFiles = all ? m_silentFiles + 1 : 0;
}

void SilenceLimit::moved(qint64 bytes, std::chrono::milliseconds running) {
    if (m_told)
        m_passed += std::min<std::chrono::milliseconds>(running - *m_told, longestGap);
    m_told = running;
    m_samples.push_back({m_passed, bytes});
    while (m_samples.size() > 1 && m_passed - m_samples[1].at >= window)
        m_samples.pop_front();
    const Sample& then = m_samples.front();
    m_tooSlow = m_tooSlow || (m_passed - then.at >= window && bytes - then.bytes < m_least);
}

bool SilenceLimit::over() const {
    return m_state.Careful && (m_silentFiles >= mostSilentFiles || m_tooSlow);
}

bool SilenceLimit::overAfter(const Platform& platform, qint64 skipped) {
    moved(platform.internet.bytesMoved() + skipped, platform.clock.running());
    return over();
}

} // namespace lumora
