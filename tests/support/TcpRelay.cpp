#include "support/TcpRelay.h"

#include <Poco/Exception.h>

#include <QByteArrayList>

#include <sys/socket.h>

#include <algorithm>

namespace lumora {
namespace {

using Poco::Net::Socket;
using Poco::Net::StreamSocket;

const Poco::Timespan tick(0, 20'000); // between looks at the stop flag

Poco::Net::SocketAddress loopback(int port) {
    return {"127.0.0.1", static_cast<Poco::UInt16>(port)};
}

// Ends the connection with a reset, as a broken line does.
void reset(StreamSocket& socket) {
    socket.setLinger(true, 0);
    socket.close();
}

// A connection to the server; the client's is reset where there is none.
bool connected(StreamSocket& server, int port, StreamSocket& client) {
    try {
        server.connect(loopback(port));
        return true;
    } catch (const Poco::Exception&) {
        reset(client);
        return false;
    }
}

// Nothing where the other side has ended, in whatever way.
QByteArray received(StreamSocket& socket, qint64 most) {
    QByteArray bytes(most, Qt::Uninitialized);
    try {
        bytes.truncate(std::max(0, socket.receiveBytes(bytes.data(), static_cast<int>(most))));
    } catch (const Poco::Exception&) {
        bytes.clear();
    }
    return bytes;
}

bool sendAll(StreamSocket& socket, const QByteArray& bytes) {
    try {
        for (int sent = 0; sent < bytes.size();)
            sent += socket.sendBytes(bytes.constData() + sent, static_cast<int>(bytes.size()) - sent, MSG_NOSIGNAL);
        return true;
    } catch (const Poco::Exception&) {
        return false;
    }
}

// Those of the sockets that have something to read, a tick awaited.
Socket::SocketList readable(Socket::SocketList sockets) {
    Socket::SocketList none;
    Socket::SocketList neither;
    Socket::select(sockets, none, neither, tick);
    return sockets;
}

bool isAmong(const Socket::SocketList& sockets, const Socket& one) {
    return std::find(sockets.begin(), sockets.end(), one) != sockets.end();
}

} // namespace

TcpRelay::TcpRelay(quint16 serverPort, Kind kind)
    : m_kind(kind)
    , m_serverPort(serverPort)
    , m_acceptor([this] { acceptLoop(); }) {}

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
}

void TcpRelay::setFaults(const Faults& faults) {
    const std::lock_guard lock(m_mutex);
    m_faults = faults;
}

TcpRelay::Faults TcpRelay::faults() const {
    const std::lock_guard lock(m_mutex);
    return m_faults;
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

void TcpRelay::spawn(const std::function<void()>& work) {
    const std::lock_guard lock(m_mutex);
    m_threads.emplace_back(work);
}

void TcpRelay::acceptLoop() {
    while (!m_stop) {
        if (!m_listener.poll(tick, Socket::SELECT_READ))
            continue;
        const StreamSocket client = m_listener.acceptConnection();
        spawn([this, client] { m_kind == Kind::Ftp ? control(client) : pumpBytes(client, m_serverPort); });
    }
}

// Passes bytes both ways until both sides have ended or a fault breaks the line.
void TcpRelay::pumpBytes(StreamSocket client, quint16 serverPort) {
    StreamSocket server;
    if (!connected(server, serverPort, client))
        return;
    qint64 passed = 0;
    Socket::SocketList open = {client, server}; // for what comes from them
    while (!m_stop && !open.empty()) {
        for (const Socket& ready : readable(open)) {
            const bool fromServer = ready == server;
            StreamSocket& from = fromServer ? server : client;
            StreamSocket& to = fromServer ? client : server;
            const Faults now = faults();
            // In front of another server only the answer's bytes count.
            const bool counted = m_kind == Kind::Ftp || fromServer;
            const qint64 limit = !counted ? -1 : now.cutDataAfter >= 0 ? now.cutDataAfter : now.stallDataAfter;
            qint64 room = 16384;
            if (limit >= 0 && now.times != 0) {
                if (passed >= limit && due()) {
                    while (!m_stop && now.cutDataAfter < 0)
                        std::this_thread::sleep_for(std::chrono::milliseconds(tick.totalMilliseconds()));
                    reset(client);
                    now.serverSeesEnd ? server.close() : reset(server);
                    return;
                }
                room = std::clamp<qint64>(limit - passed, 1, room);
            }
            const QByteArray bytes = received(from, room);
            passed += counted ? bytes.size() : 0;
            if (bytes.isEmpty())
                ::shutdown(to.impl()->sockfd(), SHUT_WR);
            if (bytes.isEmpty() || !sendAll(to, bytes))
                std::erase(open, ready);
        }
    }
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
    Poco::Net::ServerSocket listener(loopback(0));
    const int port = listener.address().port();
    spawn([this, listener, serverPort]() mutable {
        while (!m_stop && !listener.poll(tick, Socket::SELECT_READ)) {
        }
        if (!m_stop)
            pumpBytes(listener.acceptConnection(), static_cast<quint16>(serverPort));
    });
    if (reply.startsWith("229 "))
        return "229 Entering Extended Passive Mode (|||" + QByteArray::number(port) + "|)\r\n";
    return "227 Entering Passive Mode (127,0,0,1," + QByteArray::number(port / 256) + ',' +
           QByteArray::number(port % 256) + ").\r\n";
}

void TcpRelay::control(StreamSocket client) {
    StreamSocket server;
    if (!connected(server, m_serverPort, client))
        return;
    QByteArray fromClient;
    QByteArray fromServer;
    bool broken = false;
    bool open = true;
    while (!m_stop && open && !broken) {
        const Socket::SocketList ready = readable({client, server});
        for (auto& [socket, bytes] : {std::pair(&client, &fromClient), std::pair(&server, &fromServer)}) {
            if (!isAmong(ready, *socket))
                continue;
            const QByteArray part = received(*socket, 4096);
            open = open && !part.isEmpty();
            bytes->append(part);
        }
        for (qsizetype end; !broken && (end = fromClient.indexOf('\n')) >= 0;) {
            const QByteArray line = fromClient.left(end + 1);
            fromClient.remove(0, end + 1);
            const Faults now = faults();
            const bool meant = !now.command.isEmpty() && line.startsWith(now.command);
            if (meant && now.cutAtCommand && due())
                broken = true;
            else if (meant && !now.reply.isEmpty() && due())
                sendAll(client, now.reply + "\r\n");
            else
                sendAll(server, line);
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
            sendAll(client, now.manyLines ? line.left(3) + "-first\r\n 226 is no end\r\n" + line : line);
        }
    }
    if (broken) {
        reset(client);
        reset(server);
    }
}

} // namespace lumora
