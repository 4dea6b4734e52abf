#pragma once

#include <algorithm>
#include <chrono>
#include <condition_variable>
#include <deque>
#include <functional>
#include <future>
#include <mutex>
#include <system_error>
#include <thread>
#include <utility>
#include <vector>

namespace lumora {

// Pure work done ahead on all cores while one thread takes the results in order. Work is a function without shared
// state: its inputs are captured by value and its result is returned. Only so many pieces are under way or wait to be
// taken that memory does not grow with the length of the list, and so many that a slow one lets the others go on. The
// destructor drops what has not begun and waits for what is under way.
template <class T>
class WorkAhead {
public:
    using Work = std::function<T()>;

    // next(i) gives the work for item i of count; it is called on the taking thread.
    WorkAhead(int count, std::function<Work(int)> next)
        : m_count(count)
        , m_next(std::move(next)) {}
    WorkAhead(const WorkAhead&) = delete;
    WorkAhead& operator=(const WorkAhead&) = delete;
    ~WorkAhead() {
        {
            const std::lock_guard lock(m_mutex);
            m_ended = true;
        }
        m_wake.notify_all();
    }

    static int cores() { return static_cast<int>(std::clamp(std::thread::hardware_concurrency(), 1U, 16U)); }

    // Begins the first pieces before any is taken.
    void begin() {
        while (m_started < m_count && static_cast<int>(m_results.size()) < 3 * cores())
            start(m_next(m_started++));
    }

    // The result of the next item, in order; calls whileWaiting again and again until it is there. The caller may drop
    // a result that it no longer needs.
    template <class Waiting>
    T take(Waiting whileWaiting) {
        begin();
        if (m_threads.empty())
            takeWork()();
        std::future<T>& front = m_results.front();
        while (front.wait_for(std::chrono::milliseconds(10)) == std::future_status::timeout)
            whileWaiting();
        T result = front.get();
        m_results.pop_front();
        begin();
        return result;
    }

private:
    using Task = std::packaged_task<T()>;

    void start(Work work) {
        Task task(std::move(work));
        m_results.push_back(task.get_future());
        {
            const std::lock_guard lock(m_mutex);
            m_waiting.push_back(std::move(task));
        }
        m_wake.notify_one();
        if (static_cast<int>(m_threads.size()) >= cores())
            return;
        try {
            m_threads.emplace_back([this] { workOn(); });
        } catch (const std::system_error&) {
            // The other threads do it; without any it is done when its result is taken.
        }
    }

    // Waits for a task; an empty one at the end.
    Task takeWork() {
        std::unique_lock lock(m_mutex);
        m_wake.wait(lock, [this] { return m_ended || !m_waiting.empty(); });
        if (m_ended)
            return {};
        Task task = std::move(m_waiting.front());
        m_waiting.pop_front();
        return task;
    }

    void workOn() {
        for (Task task = takeWork(); task.valid(); task = takeWork())
            task();
    }

    const int m_count;
    const std::function<Work(int)> m_next;
    int m_started = 0;
    std::deque<std::future<T>> m_results;

    std::mutex m_mutex;
    std::condition_variable m_wake;
    std::deque<Task> m_waiting; // in the order of m_results
    bool m_ended = false;
    std::vector<std::jthread> m_threads; // declared last, so that they end first
};

} // namespace lumora
