#pragma once

#include <algorithm>
#include <chrono>
#include <deque>
#include <functional>
#include <future>
#include <system_error>
#include <thread>
#include <utility>

namespace lumora {

// Pure work done ahead on the machine's other cores while one thread takes the results in order. Work is a function
// without shared state: its inputs are captured by value and its result is returned. At most depth() pieces are under
// way or wait to be taken, so that memory does not grow with the length of the list. The destructor waits for what is
// under way.
template <class T>
class WorkAhead {
public:
    using Work = std::function<T()>;

    // next(i) gives the work for item i of count; it is called on the taking thread.
    WorkAhead(int count, std::function<Work(int)> next)
        : m_count(count)
        , m_next(std::move(next)) {}

    // Two pieces keep two cores busy and hold two pictures; more would cost memory and bring no time.
    static int depth() { return static_cast<int>(std::clamp(std::thread::hardware_concurrency(), 1U, 2U)); }

    // The result of the next item, in order; calls whileWaiting again and again until it is there. The caller may drop
    // a result that it no longer needs.
    template <class Waiting>
    T take(Waiting whileWaiting) {
        refill();
        std::future<T>& front = m_underWay.front();
        if (front.wait_for(std::chrono::seconds(0)) != std::future_status::deferred) {
            while (front.wait_for(std::chrono::milliseconds(10)) == std::future_status::timeout)
                whileWaiting();
        }
        T result = front.get();
        m_underWay.pop_front();
        refill();
        return result;
    }

private:
    void refill() {
        while (m_started < m_count && static_cast<int>(m_underWay.size()) < depth())
            m_underWay.push_back(start(m_next(m_started++)));
    }

    static std::future<T> start(Work work) {
        try {
            return std::async(std::launch::async, work);
        } catch (const std::system_error&) {
            // No thread could be started: the work is done when its result is taken.
            return std::async(std::launch::deferred, std::move(work));
        }
    }

    int m_count;
    std::function<Work(int)> m_next;
    int m_started = 0;
    std::deque<std::future<T>> m_underWay;
};

} // namespace lumora
