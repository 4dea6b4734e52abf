#include "assembly/WorkAhead.h"

#include "assembly/MemoryShare.h"

#include <gtest/gtest.h>

#include <atomic>
#include <latch>

namespace lumora {
namespace {

TEST(WorkAheadTest, ASlowPieceHoldsUpNoOtherAndIsTakenInItsPlace) {
    if (WorkAhead<int>::cores() < 2)
        GTEST_SKIP() << "one core";
    std::latch others(2);
    WorkAhead<int> work(3, [&](int i) {
        return [&others, i] {
            i == 0 ? others.wait() : others.count_down();
            return i;
        };
    });
    for (int i = 0; i < 3; ++i)
        EXPECT_EQ(work.take([] {}), i);
}

TEST(MemoryShareTest, LetsInWhatFitsAndTheLargestAlone) {
    MemoryShare share(10);
    std::atomic<int> held{0};
    std::vector<std::jthread> workers;
    for (const int bytes : {4, 5, 6, 7, 30, 3, 10, 4}) {
        workers.emplace_back([&share, &held, bytes] {
            const MemoryShare::Hold hold = share.hold(bytes);
            EXPECT_TRUE((held += bytes) <= 10 || held == bytes) << bytes;
            std::this_thread::sleep_for(std::chrono::milliseconds(2)); // so that they meet
            held -= bytes;
        });
    }
}

} // namespace
} // namespace lumora
