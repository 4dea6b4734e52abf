#include "transfer/delivery/UploadPace.h"

#include <algorithm>
#include <cmath>

namespace lumora {

namespace {

using std::chrono::milliseconds;

constexpr milliseconds memory{20'000};
constexpr milliseconds leastStep{500};
constexpr milliseconds leastWatched{4'000};
constexpr double millisecondsOfMinute = 60'000;
constexpr double slack = 0.1; // of a minute

} // namespace

void UploadPace::moved(qint64 put, milliseconds running) {
    if (!m_begun) {
        m_begun = m_last = running;
        m_put = put;
        return;
    }
    const milliseconds step = running - m_last;
    if (step < leastStep)
        return;
    const auto passed = static_cast<double>(step.count());
    // At first the plain mean.
    const double weight = std::max(1 - std::exp(-passed / static_cast<double>(memory.count())),
                                   passed / static_cast<double>((running - *m_begun).count()));
    m_rate += weight * (static_cast<double>(put - m_put) / passed - m_rate);
    m_last = running;
    m_put = put;
}

std::optional<int> UploadPace::minutes(qint64 left) {
    if (!m_begun || m_last - *m_begun < leastWatched || m_rate <= 0)
        return std::nullopt;
    const double exact = static_cast<double>(left) / m_rate / millisecondsOfMinute;
    const bool stays = m_told && exact <= *m_told + slack && exact > *m_told - 1 - slack;
    if (!stays)
        m_told = std::max(1, static_cast<int>(std::ceil(std::min(exact, 9999.0))));
    return m_told;
}

} // namespace lumora
