#pragma once

#include "platform/Machine.h"

#include <QCoreApplication>
#include <QEventLoop>
#include <QThread>

#include <chrono>
#include <condition_variable>
#include <csignal>
#include <ctime>
#include <mutex>
#include <optional>
#include <thread>

namespace lumora {

// While this lives, a write to a connection that the other side has closed fails with an error and raises no signal in
// this thread.
class WithoutBrokenPipeSignal {
public:
    WithoutBrokenPipeSignal() {
        sigemptyset(&m_pipe);
        sigaddset(&m_pipe, SIGPIPE);
        pthread_sigmask(SIG_BLOCK, &m_pipe, &m_before);
    }
    ~WithoutBrokenPipeSignal() {
        if (sigismember(&m_before, SIGPIPE) == 1)
            return;
        // One that came meanwhile waits; it is taken away, or it would come through now.
        const timespec atOnce{};
        while (sigtimedwait(&m_pipe, nullptr, &atOnce) == SIGPIPE) {
        }
        pthread_sigmask(SIG_SETMASK, &m_before, nullptr);
    }
    WithoutBrokenPipeSignal(const WithoutBrokenPipeSignal&) = delete;
    WithoutBrokenPipeSignal& operator=(const WithoutBrokenPipeSignal&) = delete;

private:
    sigset_t m_pipe;
    sigset_t m_before;
};

// Runs a call that may wait for the line and gives its result. On the user-interface thread the call is made on a
// thread of its own, and the page is painted meanwhile. Clicks and timers wait, since they could start the next step
// inside this one, unless a pump is given: then they run inside it, as between two steps of a long loop. The caller
// returns only when the call has, so nothing is used by two threads at once. The call must not throw.
template <class Call>
auto RunBlocking(Call call, EventPump* pump = nullptr) -> decltype(call()) {
    if (!QCoreApplication::instance() || QThread::currentThread() != QCoreApplication::instance()->thread()) {
        const WithoutBrokenPipeSignal guard;
        return call();
    }
    std::optional<decltype(call())> result;
    QEventLoop painting;
    std::mutex mutex;
    std::condition_variable ended;
    bool done = false;
    std::thread worker([&] {
        {
            const WithoutBrokenPipeSignal guard;
            result.emplace(call());
        }
        QMetaObject::invokeMethod(
            &painting, [&painting] { painting.quit(); }, Qt::QueuedConnection);
        const std::lock_guard lock(mutex);
        done = true;
        ended.notify_one();
    });
    if (pump) {
        constexpr auto betweenPumps = std::chrono::milliseconds(10);
        for (std::unique_lock lock(mutex); !ended.wait_for(lock, betweenPumps, [&] { return done; });) {
            lock.unlock();
            pump->pump();
            lock.lock();
        }
    } else {
        painting.exec(QEventLoop::ExcludeUserInputEvents | QEventLoop::X11ExcludeTimers);
    }
    worker.join();
    return std::move(*result);
}

} // namespace lumora
