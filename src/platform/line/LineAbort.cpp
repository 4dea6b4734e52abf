#include "platform/line/LineAbort.h"

#include <fcntl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <utility>

namespace lumora {

void LineAbort::abort() {
    const std::lock_guard lock(m_mutex);
    ++m_count;
    for (const int descriptor : m_descriptors) {
        // Linux resets a connection that is given no peer; a shutdown alone would end the data in good order. The
        // shutdown wakes a thread that waits for a socket without a connection.
        const sockaddr nobody{AF_UNSPEC, {}};
        static_cast<void>(::connect(descriptor, &nobody, sizeof(nobody)));
        ::shutdown(descriptor, SHUT_RDWR);
    }
}

LineAbort::Watch::Watch(LineAbort& line, const Poco::Net::Socket& socket)
    : m_line(&line)
    , m_descriptor(::fcntl(socket.impl()->sockfd(), F_DUPFD_CLOEXEC, 0)) {
    const std::lock_guard lock(m_line->m_mutex);
    if (m_descriptor >= 0)
        m_line->m_descriptors.insert(m_descriptor);
}

LineAbort::Watch::Watch(Watch&& other) noexcept
    : m_line(other.m_line)
    , m_descriptor(std::exchange(other.m_descriptor, -1)) {}

LineAbort::Watch& LineAbort::Watch::operator=(Watch&& other) noexcept {
    if (this != &other) {
        release();
        m_line = other.m_line;
        m_descriptor = std::exchange(other.m_descriptor, -1);
    }
    return *this;
}

void LineAbort::Watch::release() {
    if (m_descriptor < 0)
        return;
    const std::lock_guard lock(m_line->m_mutex);
    m_line->m_descriptors.erase(m_descriptor);
    ::close(std::exchange(m_descriptor, -1));
}

} // namespace lumora
