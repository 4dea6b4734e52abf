#pragma once

#include <algorithm>
#include <chrono>
#include <ctime>
#include <vector>

// How the benchmarks measure: all times in milliseconds.
namespace lumora {

struct Times {
    double wall = 0;
    double processor = 0; // of all threads
    double thread = 0;    // processor time of the calling thread alone
};

// Since unknown moments.
inline Times timeNow() {
    const auto wall = std::chrono::steady_clock::now().time_since_epoch();
    timespec thread{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &thread);
    return {std::chrono::duration<double, std::milli>(wall).count(),
            1000.0 * static_cast<double>(std::clock()) / CLOCKS_PER_SEC,
            static_cast<double>(thread.tv_sec) * 1e3 + static_cast<double>(thread.tv_nsec) / 1e6};
}

template <class Work>
Times timed(Work work) {
    const Times before = timeNow();
    work();
    const Times after = timeNow();
    return {after.wall - before.wall, after.processor - before.processor, after.thread - before.thread};
}

struct Spread {
    double median = 0;
    double lowest = 0;
    double highest = 0;
};

// At least one value.
inline Spread spreadOf(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    return {values[values.size() / 2], values.front(), values.back()};
}

} // namespace lumora
