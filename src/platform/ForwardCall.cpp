#include "platform/ForwardCall.h"

#include <QSocketNotifier>

#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>

#include <algorithm>
#include <cstddef>
#include <string>
#include <utility>

namespace lumora {
namespace {

struct SocketName {
    sockaddr_un address = {};
    socklen_t length = 0;
    const sockaddr* any() const { return reinterpret_cast<const sockaddr*>(&address); }
};

// A socket name that begins with a zero byte makes no file (Linux). Device and inode identify the data folder,
// whichever path leads to it.
SocketName socketOf(const HostPath& dataFolder) {
    SocketName name;
    struct stat folder {};
    if (::stat(dataFolder.c_str(), &folder) != 0)
        return name;
    const std::string text = "lumora-forward-" + std::to_string(folder.st_dev) + "-" + std::to_string(folder.st_ino);
    name.address.sun_family = AF_UNIX;
    std::copy(text.begin(), text.end(), name.address.sun_path + 1);
    name.length = static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + 1 + text.size());
    return name;
}

Descriptor datagramSocket() {
    return Descriptor(::socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
}

} // namespace

ForwardCalls::ForwardCalls(const HostPath& dataFolder, std::function<void()> called)
    : m_socket(datagramSocket()) {
    const SocketName name = socketOf(dataFolder);
    if (!m_socket.valid() || name.length == 0 || ::bind(m_socket.number(), name.any(), name.length) != 0)
        return;
    m_notifier = std::make_unique<QSocketNotifier>(m_socket.number(), QSocketNotifier::Read);
    QObject::connect(m_notifier.get(), &QSocketNotifier::activated, m_notifier.get(),
                     [socket = m_socket.number(), called = std::move(called)] {
                         char call = 0;
                         while (::recv(socket, &call, 1, 0) > 0) {
                         }
                         called();
                     });
}

ForwardCalls::~ForwardCalls() = default;

bool CallForward(const HostPath& dataFolder) {
    const Descriptor socket = datagramSocket();
    const SocketName name = socketOf(dataFolder);
    return socket.valid() && name.length > 0 && ::sendto(socket.number(), "f", 1, 0, name.any(), name.length) == 1;
}

} // namespace lumora
