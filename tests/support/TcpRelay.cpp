#include "support/TcpRelay.h"

#include <arpa/inet.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <tuple>
#include <utility>

namespace lumora {
namespace {

constexpr int tick = 20; // milliseconds between looks at the stop flag

sockaddr_in loopback(quint16 port) {
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_port = htons(port);
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    return address;
}

std::pair<int, quint16> listenSomewhere() {
    const int listener = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    sockaddr_in address = loopback(0);
    socklen_t size = sizeof(address);
    ::bind(listener, reinterpret_cast<sockaddr*>(&address), sizeof(address));
    ::listen(listener, 16);
    ::getsockname(listener, reinterpret_cast<sockaddr*>(&address), &size);
    return {listener, ntohs(address.sin_port)};
}

int connectTo(quint16 port) {
    const int socket = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    const sockaddr_in address = loopback(port);
    if (::connect(socket, reinterpret_cast<const sockaddr*>(&address), sizeof(address)) == 0)
        return socket;
    ::close(socket);
    return -1;
}

// Ends the connection with a reset, as a broken line does.
void reset(int socket) {
    const linger atOnce{1, 0};
    ::setsockopt(socket, SOL_SOCKET, SO_LINGER, &atOnce, sizeof(atOnce));
    ::close(socket);
}

bool sendAll(int socket, const char* bytes, std::size_t count) {
    while (count > 0) {
        const ssize_t sent = ::send(socket, bytes, count, MSG_NOSIGNAL);
        if (sent <= 0)
            return false;
        bytes += sent;
        count -= static_cast<std::size_t>(sent);
    }
    return true;
}

bool readable(int socket) {
    pollfd one{socket, POLLIN, 0};
    return ::poll(&one, 1, tick) > 0;
}

} // namespace

TcpRelay::TcpRelay(quint16 serverPort, Kind kind)
    : m_kind(kind)
    , m_serverPort(serverPort) {
    std::tie(m_listener, m_port) = listenSomewhere();
    m_acceptor = std::thread([this] { acceptLoop(); });
}

TcpRelay::~TcpRelay() {
    m_stop = true;
    m_acceptor.join();
    for (bool left = true; left;) {
        std::list<std::thread> ended;
        {
            const std::lock_guard lock(m_mutex);
            ended.swap(m_threads);
        }
        for (std::thread& thread : ended)
            thread.join();
        left = !ended.empty();
    }
    ::close(m_listener);
}

void TcpRelay::setFaults(const Faults& faults) {
    const std::lock_guard lock(m_mutex);
    m_faults = faults;
}

TcpRelay::Faults TcpRelay::faults() const {
    const std::lock_guard lock(m_mutex);
    return m_faults;
}

QByteArrayList TcpRelay::commands() const {
    const std::lock_guard lock(m_mutex);
    return m_commands;
}

bool TcpRelay::due() {
    const std::lock_guard lock(m_mutex);
    if (m_faults.times == 0)
        return false;
    if (m_faults.times > 0)
        --m_faults.times;
    ++m_made;
    return true;
}

void TcpRelay::spawn(std::thread thread) {
    const std::lock_guard lock(m_mutex);
    m_threads.push_back(std::move(thread));
}

void TcpRelay::acceptLoop() {
    while (!m_stop) {
        if (!readable(m_listener))
            continue;
        const int client = ::accept4(m_listener, nullptr, nullptr, SOCK_CLOEXEC);
        if (client < 0)
            continue;
        spawn(std::thread([this, client] {
            if (m_kind == Kind::Ftp) {
                control(client);
                return;
            }
            const int server = connectTo(m_serverPort);
            if (server < 0)
                reset(client);
            else
                pumpBytes(client, server);
        }));
    }
}

// Passes bytes both ways until both sides have ended or a fault breaks the line.
void TcpRelay::pumpBytes(int client, int server) {
    std::array<char, 16384> bytes;
    qint64 passed = 0;
    bool open[2] = {true, true};
    const int sockets[2] = {client, server};
    while (!m_stop && (open[0] || open[1])) {
        pollfd both[2] = {{open[0] ? client : -1, POLLIN, 0}, {open[1] ? server : -1, POLLIN, 0}};
        if (::poll(both, 2, tick) <= 0)
            continue;
        for (int from = 0; from < 2; ++from) {
            if (both[from].revents == 0)
                continue;
            const Faults now = faults();
            // In front of another server only the answer's bytes count.
            const bool counted = m_kind == Kind::Ftp || from == 1;
            const qint64 limit = !counted ? -1 : now.cutDataAfter >= 0 ? now.cutDataAfter : now.stallDataAfter;
            std::size_t room = bytes.size();
            if (limit >= 0 && now.times != 0) {
                if (passed >= limit && due()) {
                    while (!m_stop && now.cutDataAfter < 0)
                        std::this_thread::sleep_for(std::chrono::milliseconds(tick));
                    reset(client);
                    if (now.serverSeesEnd)
                        ::close(server);
                    else
                        reset(server);
                    return;
                }
                room = std::min<std::size_t>(room, static_cast<std::size_t>(std::max<qint64>(1, limit - passed)));
            }
            const ssize_t count = ::recv(sockets[from], bytes.data(), room, 0);
            if (count <= 0) {
                ::shutdown(sockets[1 - from], SHUT_WR);
                open[from] = false;
                continue;
            }
            if (counted)
                passed += count;
            if (!sendAll(sockets[1 - from], bytes.data(), static_cast<std::size_t>(count)))
                open[from] = false;
        }
    }
    ::close(client);
    ::close(server);
}

void TcpRelay::data(int listener, quint16 serverPort) {
    while (!m_stop && !readable(listener)) {
    }
    const int client = m_stop ? -1 : ::accept4(listener, nullptr, nullptr, SOCK_CLOEXEC);
    ::close(listener);
    if (client < 0)
        return;
    const int server = connectTo(serverPort);
    if (server < 0)
        reset(client);
    else
        pumpBytes(client, server);
}

// Replaces the data port in a reply by one of the relay.
QByteArray TcpRelay::ownPort(const QByteArray& reply) {
    int serverPort = 0;
    if (reply.startsWith("229 ")) {
        serverPort = reply.mid(reply.indexOf("|||") + 3).split('|').value(0).toInt();
    } else {
        const qsizetype open = reply.indexOf('(');
        const QByteArrayList numbers = reply.mid(open + 1, reply.indexOf(')') - open - 1).split(',');
        serverPort = numbers.value(4).toInt() * 256 + numbers.value(5).toInt();
    }
    const auto [listener, port] = listenSomewhere();
    spawn(std::thread([this, listener = listener, serverPort] { data(listener, static_cast<quint16>(serverPort)); }));
    if (reply.startsWith("229 "))
        return "229 Entering Extended Passive Mode (|||" + QByteArray::number(port) + "|)\r\n";
    return "227 Entering Passive Mode (127,0,0,1," + QByteArray::number(port / 256) + ',' +
           QByteArray::number(port % 256) + ").\r\n";
}

void TcpRelay::control(int client) {
    const int server = connectTo(m_serverPort);
    if (server < 0) {
        reset(client);
        return;
    }
    std::array<char, 4096> bytes;
    QByteArray fromClient;
    QByteArray fromServer;
    bool broken = false;
    bool open = true;
    while (!m_stop && open && !broken) {
        pollfd both[2] = {{client, POLLIN, 0}, {server, POLLIN, 0}};
        if (::poll(both, 2, tick) <= 0)
            continue;
        if (both[0].revents != 0) {
            const ssize_t count = ::recv(client, bytes.data(), bytes.size(), 0);
            open = count > 0;
            fromClient.append(bytes.data(), std::max<ssize_t>(0, count));
        }
        if (both[1].revents != 0) {
            const ssize_t count = ::recv(server, bytes.data(), bytes.size(), 0);
            open = open && count > 0;
            fromServer.append(bytes.data(), std::max<ssize_t>(0, count));
        }
        for (qsizetype end; !broken && (end = fromClient.indexOf('\n')) >= 0;) {
            const QByteArray line = fromClient.left(end + 1);
            fromClient.remove(0, end + 1);
            {
                const std::lock_guard lock(m_mutex);
                m_commands += line.trimmed();
            }
            const Faults now = faults();
            const bool meant = !now.command.isEmpty() && line.startsWith(now.command);
            if (meant && now.cutAtCommand && due())
                broken = true;
            else if (meant && !now.reply.isEmpty() && due())
                sendAll(client, (now.reply + "\r\n").constData(), static_cast<std::size_t>(now.reply.size()) + 2);
            else
                sendAll(server, line.constData(), static_cast<std::size_t>(line.size()));
        }
        for (qsizetype end; !broken && (end = fromServer.indexOf('\n')) >= 0;) {
            QByteArray line = fromServer.left(end + 1);
            fromServer.remove(0, end + 1);
            const Faults now = faults();
            if (now.delayReplies.count() > 0)
                std::this_thread::sleep_for(now.delayReplies);
            if (line.startsWith("226") && now.loseClosingReply && due()) {
                broken = true;
                break;
            }
            if (line.startsWith("226") && (now.holdClosingReply || !now.closingReply.isEmpty()) && due()) {
                if (now.holdClosingReply)
                    continue;
                line = now.closingReply + "\r\n";
            }
            if (line.startsWith("227 ") || line.startsWith("229 "))
                line = ownPort(line);
            if (now.manyLines)
                line = line.left(3) + "-first\r\n 226 is no end\r\n" + line;
            sendAll(client, line.constData(), static_cast<std::size_t>(line.size()));
        }
    }
    if (broken) {
        reset(client);
        reset(server);
    } else {
        ::close(client);
        ::close(server);
    }
}

} // namespace lumora
