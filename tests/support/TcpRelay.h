#pragma once

#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>

#include <QByteArray>
#include <QString>

#include <atomic>
#include <chrono>
#include <functional>
#include <list>
#include <mutex>
#include <thread>

namespace lumora {

using namespace Qt::StringLiterals;

// A bad line: stands in front of a server on 127.0.0.1, passes everything on, and makes the faults it is told to. In
// front of an FTP server it also carries the data connections, by putting ports of its own into the answers to EPSV and
// PASV.
class TcpRelay {
public:
    enum class Kind { Ftp, Plain };

    struct Faults {
        qint64 cutDataAfter = -1;   // bytes of a data connection (Plain: of an answer), then its ends are reset
        qint64 stallDataAfter = -1; // bytes, then nothing goes on until the relay ends
        std::chrono::milliseconds delayReplies{0};
        bool loseClosingReply = false; // the 226 is swallowed and the control connection reset
        bool holdClosingReply = false; // the 226 is swallowed and nothing else happens
        QByteArray closingReply = {};  // comes in place of the 226
        bool serverSeesEnd = false;    // with cutDataAfter: the server's side of the cut is an orderly end
        bool manyLines = false;        // every reply comes in three lines
        QByteArray command = {};       // with cutAtCommand or reply: "STOR"
        bool cutAtCommand = false;     // the control connection is reset when the command comes, which is not passed on
        QByteArray reply = {}; // answered in place of the server, which never hears the command: "552 Quota exceeded"
        int times = -1;        // so many faults, then a good line; -1: for ever
    };

    explicit TcpRelay(quint16 serverPort, Kind kind = Kind::Ftp);
    ~TcpRelay();
    TcpRelay(const TcpRelay&) = delete;
    TcpRelay& operator=(const TcpRelay&) = delete;

    quint16 port() const { return m_listener.address().port(); }
    QString host() const { return u"127.0.0.1:%1"_s.arg(port()); }

    // Applies from now on.
    void setFaults(const Faults& faults);
    int faultsMade() const { return m_made; }

private:
    void acceptLoop();
    void control(Poco::Net::StreamSocket client);
    void pumpBytes(Poco::Net::StreamSocket client, quint16 serverPort);
    // Counts a fault if one more is due.
    bool due();
    Faults faults() const;
    QByteArray ownPort(const QByteArray& reply);
    void spawn(const std::function<void()>& work);

    Kind m_kind;
    quint16 m_serverPort;
    Poco::Net::ServerSocket m_listener{Poco::Net::SocketAddress("127.0.0.1", 0)};
    std::atomic<bool> m_stop = false;
    std::atomic<int> m_made = 0;
    mutable std::mutex m_mutex;
    Faults m_faults;
    std::list<std::thread> m_threads;
    std::thread m_acceptor;
};

} // namespace lumora
