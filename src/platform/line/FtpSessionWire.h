#pragma once

#include "platform/line/Internet.h"
#include "platform/line/TimeLimits.h"

#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>

#include <functional>
#include <string>

namespace lumora {

// The dialogue of one FTP connection. It is written on sockets and not on the library's FTP session because the reply
// that closes a transfer decides here, a failed write must be seen, and the server's own words go into every failure.
// Used by one thread at a time; every call blocks.
class FtpSessionWire {
public:
    explicit FtpSessionWire(TimeLimits limits)
        : m_limits(limits) {}

    Result<void> open(const QString& host, const QString& user, const QString& password, Internet::DataChannel channel);
    void close();

    // A command of one word with an argument; the answer must be of 200 to 299.
    Result<void> command(const char* word, const QString& argument);
    Result<QString> currentDirectory();
    Result<void> put(const HostPath& local, const QString& remoteName);
    Result<void> get(const QString& remoteName, const HostPath& local);
    Result<std::vector<FtpEntry>> list(const QString& pattern);

    QString lastResponse() const;

private:
    struct Reply {
        int code = 0;
        QByteArray text; // all lines
    };
    using Transfer = std::function<Result<void>(Poco::Net::StreamSocket&)>;

    Failure broken(Failure::Kind kind, const QString& reason);
    Failure refused(const Reply& reply);
    Result<QByteArray> argumentBytes(const QString& argument) const;
    void send(const QByteArray& line);
    Reply readReply();
    Reply ask(const QByteArray& line);
    template <class Step>
    auto guarded(Step step) -> decltype(step());

    Result<void> login(const QString& user, const QString& password);
    Result<Poco::Net::StreamSocket> openPassive();
    Result<Poco::Net::ServerSocket> openActive();
    // Opens a data connection, gives the command, moves the bytes and judges the reply that closes the transfer.
    Result<void> transfer(const QByteArray& line, const Transfer& move);

    TimeLimits m_limits;
    Poco::Net::StreamSocket m_control;
    QString m_host;
    QByteArray m_received; // bytes behind the reply that was read last
    Reply m_last;
    Internet::DataChannel m_channel = Internet::DataChannel::Passive;
    bool m_open = false;
    bool m_typeSet = false;
    bool m_extendedPassive = true; // until the server has refused it once
};

} // namespace lumora
