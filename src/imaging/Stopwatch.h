#pragma once

#include "imaging/files/PictureFile.h"

#include <chrono>

namespace lumora {

// Adds the milliseconds since the last call to one stage of times; does nothing when times is null.
class Stopwatch {
public:
    explicit Stopwatch(PictureTimes* times)
        : m_times(times)
        , m_since(Clock::now()) {}

    void add(double PictureTimes::*stage) {
        if (m_times == nullptr)
            return;
        const auto now = Clock::now();
        m_times->*stage += std::chrono::duration<double, std::milli>(now - m_since).count();
        m_since = now;
    }

private:
    using Clock = std::chrono::steady_clock;
    PictureTimes* m_times;
    Clock::time_point m_since;
};

} // namespace lumora
