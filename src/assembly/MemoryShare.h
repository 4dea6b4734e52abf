#pragma once

#include <condition_variable>
#include <cstdint>
#include <mutex>
#include <utility>

namespace lumora {

// How much memory the pictures may take that are made side by side: as many of them are in work as fit, and one alone
// whatever it takes.
class MemoryShare {
public:
    explicit MemoryShare(std::int64_t bytes)
        : m_bytes(bytes) {}

    class Hold {
    public:
        Hold(Hold&& other) noexcept
            : m_share(std::exchange(other.m_share, nullptr))
            , m_bytes(other.m_bytes) {}
        Hold& operator=(Hold&&) = delete;
        ~Hold() {
            if (m_share != nullptr)
                m_share->giveBack(m_bytes);
        }

    private:
        friend class MemoryShare;
        Hold(MemoryShare& share, std::int64_t bytes)
            : m_share(&share)
            , m_bytes(bytes) {}
        MemoryShare* m_share;
        std::int64_t m_bytes;
    };

    // Waits until the bytes are free. Who holds a part must not ask for another.
    [[nodiscard]] Hold hold(std::int64_t bytes) {
        std::unique_lock lock(m_mutex);
        m_freed.wait(lock, [&] { return m_held == 0 || m_held + bytes <= m_bytes; });
        m_held += bytes;
        return {*this, bytes};
    }

private:
    void giveBack(std::int64_t bytes) {
        {
            const std::lock_guard lock(m_mutex);
            m_held -= bytes;
        }
        m_freed.notify_all();
    }

    const std::int64_t m_bytes;
    std::int64_t m_held = 0;
    std::mutex m_mutex;
    std::condition_variable m_freed;
};

} // namespace lumora
