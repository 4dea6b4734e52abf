#pragma once

#include "platform/line/Internet.h"
#include "platform/line/LineSocket.h"

#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>

#include <functional>
#include <optional>

namespace lumora {

// The dialogue of one FTP connection. It is written on sockets and not on the library's FTP session because the reply
// that closes a transfer decides here, a failed write must be seen, and the server's own words go into every failure.
// Used by one thread at a time; every call blocks.
class FtpSessionWire {
public:
    FtpSessionWire(LineCall call, FtpType type, FtpTls tls)
        : m_call(std::move(call))
        , m_type(type)
        , m_tls(tls) {}

    Result<void> open(const QString& host, const QString& user, const QString& password, Internet::DataChannel channel);
    void close();

    // A command of one word with an argument; the answer must be of 200 to 299.
    Result<void> command(const char* word, const QString& argument);
    Result<void> changeDirectory(const QString& directory);
    Result<QString> currentDirectory();
    Result<void> put(const HostPath& local, const QString& remoteName);
    // type: none for that of the line.
    Result<void> get(const QString& remoteName, const HostPath& local, std::optional<FtpType> type);
    Result<FtpListing> list(const QString& pattern, EmptyFolder empty);
    Result<std::optional<qint64>> length(const QString& remoteName);

    QString lastResponse() const;
    FtpType type() const { return m_type; }

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

    Failure notTrusted(const TlsRefused& refusal) const;
    // The control line goes on encrypted, or nothing more is said over it.
    Result<void> askForTls();
    Result<void> protectData();
    void encryptData(LineSocket& data);
    Result<void> login(const QString& user, const QString& password);
    Failure refusedLogin(const Reply& reply);
    // What the server answers to PWD.
    Result<QString> askDirectory();
    Result<void> setType(FtpType type);
    Result<Poco::Net::SocketAddress> openPassive();
    Result<Poco::Net::ServerSocket> openActive();
    enum class Direction { Up, Down };
    // Opens a data connection, gives the command, moves the bytes and judges the reply that closes the transfer.
    Result<void> transfer(const QByteArray& line, Direction direction, const Transfer& move,
                          std::optional<FtpType> type = std::nullopt);
    Result<void> endOfGet(const QString& remoteName, qint64 received);
    Result<void> endOfPut(Poco::Net::StreamSocket& data);

    LineCall m_call;
    FtpType m_type;
    FtpTls m_tls;
    LineSocket m_control;
    QString m_host;
    QByteArray m_received; // bytes behind the reply that was read last
    Reply m_last;
    QString m_home;         // the login folder as the server tells it, without a slash at its end; empty: the root
    int m_transferCode = 0; // of the reply that refused or closed the last transfer; 0 where it did not come so far
    Internet::DataChannel m_channel = Internet::DataChannel::Passive;
    bool m_open = false;
    std::optional<FtpType> m_typeSet;
    bool m_extendedPassive = true; // until the server has refused it once
};

} // namespace lumora
