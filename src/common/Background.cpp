#include "common/Background.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QThreadPool>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <limits>
#include <mutex>
#include <vector>

namespace lumora {

namespace {

constexpr std::chrono::seconds patienceAtTheEnd(1);

struct Pools {
    std::mutex mutex;
    std::vector<QThreadPool*> all;
};

Pools& pools() {
    static Pools& made = *new Pools;
    return made;
}

void leave(int status, void* /*none*/) {
    std::fflush(nullptr);
    std::_Exit(status);
}

void waitAtTheEnd() {
    const QDeadlineTimer patience(patienceAtTheEnd);
    const std::lock_guard lock(pools().mutex);
    for (QThreadPool* pool : pools().all) {
        if (!pool->waitForDone(static_cast<int>(patience.remainingTime()))) {
            // Registered last, so that it comes before the destructor of any static.
            on_exit(leave, nullptr);
            return;
        }
    }
}

} // namespace

QThreadPool& backgroundPool(int threads) {
    static const bool registered = [] {
        qAddPostRoutine(waitAtTheEnd);
        return true;
    }();
    static_cast<void>(registered);
    auto* pool = new QThreadPool;
    pool->setMaxThreadCount(threads);
    const std::lock_guard lock(pools().mutex);
    pools().all.push_back(pool);
    return *pool;
}

void runInBackground(std::function<void()> work) {
    static QThreadPool& pool = backgroundPool(std::numeric_limits<int>::max());
    pool.start(std::move(work));
}

} // namespace lumora
