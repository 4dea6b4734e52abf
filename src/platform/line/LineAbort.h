#pragma once

#include <Poco/Net/Socket.h>

#include <atomic>
#include <cstdint>
#include <mutex>
#include <set>

namespace lumora {

// Cuts the sockets of a line from another thread than the one that waits on them, and counts what moves over them. The
// other side sees a reset, so that it does not take the part of a file for the whole.
class LineAbort {
public:
    LineAbort() = default;
    LineAbort(const LineAbort&) = delete;
    LineAbort& operator=(const LineAbort&) = delete;

    // Cuts every watched socket. Sockets that are watched later are not cut.
    void abort();
    // How often abort() was called; a dialogue that began at another count has been cut.
    int count() const { return m_count; }

    // Bytes of files, listings and bodies that went over the line, in both directions.
    void moved(std::int64_t bytes) { m_moved += bytes; }
    std::int64_t bytesMoved() const { return m_moved; }

    // A socket that abort() reaches while this lives, connected or not. It holds a descriptor of its own, so the socket
    // must be released before its closing is to be seen by the other side.
    class Watch {
    public:
        Watch() = default;
        Watch(LineAbort& line, const Poco::Net::Socket& socket);
        ~Watch() { release(); }
        Watch(Watch&& other) noexcept;
        Watch& operator=(Watch&& other) noexcept;
        void release();

    private:
        LineAbort* m_line = nullptr;
        int m_descriptor = -1;
    };

private:
    std::mutex m_mutex;
    std::set<int> m_descriptors;
    std::atomic<int> m_count = 0;
    std::atomic<std::int64_t> m_moved = 0;
};

} // namespace lumora
