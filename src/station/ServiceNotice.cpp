#include "station/ServiceNotice.h"

#include "common/HostFile.h"

#include <sys/socket.h>
#include <sys/un.h>

#include <chrono>
#include <cstddef>
#include <cstring>

namespace lumora {

ServiceNotice::ServiceNotice()
    : m_socket(qgetenv("NOTIFY_SOCKET")) {
    // The processes that decode pictures have nothing to tell.
    qunsetenv("NOTIFY_SOCKET");
    tell("READY=1");
    const std::chrono::microseconds limit(qgetenv("WATCHDOG_USEC").toLongLong());
    if (m_socket.isEmpty() || limit.count() <= 0)
        return;
    m_alive.callOnTimeout(this, [this] { tell("WATCHDOG=1"); });
    m_alive.start(std::chrono::duration_cast<std::chrono::milliseconds>(limit / 2));
}

void ServiceNotice::tell(const QByteArray& state) const {
    sockaddr_un address{};
    const auto length = static_cast<std::size_t>(m_socket.size());
    if (m_socket.isEmpty() || length >= sizeof address.sun_path)
        return;
    address.sun_family = AF_UNIX;
    std::memcpy(address.sun_path, m_socket.constData(), length);
    if (address.sun_path[0] == '@') // a name without a file
        address.sun_path[0] = '\0';
    const Descriptor line(::socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC, 0));
    if (line.valid())
        ::sendto(line.number(), state.constData(), static_cast<std::size_t>(state.size()), MSG_NOSIGNAL,
                 reinterpret_cast<const sockaddr*>(&address),
                 static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + length));
}

} // namespace lumora
