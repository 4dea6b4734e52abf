#include "platform/line/FtpSessionWire.h"

#include "common/AnsiCodePage.h"
#include "common/HostFile.h"
#include "platform/line/FtpListing.h"

#include <Poco/Exception.h>
#include <Poco/Net/NetException.h>
#include <Poco/Net/SocketAddress.h>

#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <vector>

namespace lumora {
namespace {

using Poco::Net::SocketAddress;
using Poco::Net::StreamSocket;

constexpr Poco::UInt16 ftpPort = 21;
// Beyond these a server is not talking FTP.
constexpr qsizetype longestReply = 64 * 1024;
constexpr qsizetype longestListing = 16 * 1024 * 1024;
constexpr std::size_t chunk = 64 * 1024;

Result<void> noFailure() {
    return {};
}

void sendAll(StreamSocket& socket, const char* bytes, std::size_t count) {
    while (count > 0) {
        const int sent = socket.sendBytes(bytes, static_cast<int>(count), MSG_NOSIGNAL);
        if (sent <= 0)
            throw Poco::Net::ConnectionResetException();
        bytes += sent;
        count -= static_cast<std::size_t>(sent);
    }
}

// The port of "229 Entering Extended Passive Mode (|||30100|)"; 0 if there is none.
int extendedPassivePort(const QByteArray& text) {
    const qsizetype open = text.indexOf('(');
    if (open < 0 || open + 4 >= text.size())
        return 0;
    const char bar = text[open + 1];
    const QByteArray inside = text.mid(open + 1, std::max<qsizetype>(0, text.indexOf(')', open) - open - 1));
    return inside.startsWith(QByteArray(3, bar)) && inside.endsWith(bar) ? inside.mid(3).chopped(1).toUShort() : 0;
}

// The port of "227 Entering Passive Mode (127,0,0,1,117,148)."; 0 if there is none. The address is not used: the data
// goes to where the control line goes, whatever a server behind a gateway takes for its own address.
int passivePort(const QByteArray& text) {
    std::array<int, 6> numbers{};
    std::size_t count = 0;
    const qsizetype comma = text.indexOf(',');
    if (comma < 0)
        return 0;
    qsizetype at = comma;
    while (at > 0 && text[at - 1] >= '0' && text[at - 1] <= '9')
        --at;
    for (; at < text.size() && count < numbers.size(); ++at) {
        if (text[at] >= '0' && text[at] <= '9')
            numbers[count] = std::min(numbers[count] * 10 + (text[at] - '0'), 1000);
        else if (text[at] == ',')
            ++count;
        else
            break;
    }
    if (count != 5 || numbers[4] > 255 || numbers[5] > 255)
        return 0;
    return numbers[4] * 256 + numbers[5];
}

} // namespace

Failure FtpSessionWire::broken(Failure::Kind kind, const QString& reason) {
    close();
    return {kind, QStringLiteral("ftp %1: %2").arg(m_host, reason)};
}

Failure FtpSessionWire::refused(const Reply& reply) {
    if (reply.code == 421)
        close();
    return {Failure::Kind::Refused,
            QStringLiteral("ftp %1: %2").arg(m_host, AnsiCodePage::decode(reply.text).trimmed())};
}

// Every call of the library may throw; nothing passes this point. After a failure of the line the dialogue is out of
// step, so the connection is given up.
template <class Step>
auto FtpSessionWire::guarded(Step step) -> decltype(step()) {
    try {
        return step();
    } catch (const Poco::TimeoutException&) {
        return broken(Failure::Kind::TimedOut, QStringLiteral("no answer within the time limit"));
    } catch (const Poco::Exception& exception) {
        return broken(Failure::Kind::Disconnected, QString::fromStdString(exception.displayText()));
    } catch (const std::exception& exception) {
        return broken(Failure::Kind::Other, QString::fromLocal8Bit(exception.what()));
    }
}

void FtpSessionWire::close() {
    if (!m_open)
        return;
    m_open = false;
    try {
        m_control.setSendTimeout(Poco::Timespan(1, 0));
        sendAll(m_control, "QUIT\r\n", 6);
        m_control.close();
    } catch (const std::exception&) {
        m_control = StreamSocket(); // a line that is gone needs no farewell
    }
}

Result<QByteArray> FtpSessionWire::argumentBytes(const QString& argument) const {
    const QByteArray bytes = AnsiCodePage::encode(argument);
    if (bytes.contains('\r') || bytes.contains('\n') || bytes.contains('\0'))
        return Failure{Failure::Kind::Refused,
                       QStringLiteral("ftp %1: a name with a line break was not sent").arg(m_host)};
    return bytes;
}

void FtpSessionWire::send(const QByteArray& line) {
    const QByteArray whole = line + "\r\n";
    sendAll(m_control, whole.constData(), static_cast<std::size_t>(whole.size()));
}

FtpSessionWire::Reply FtpSessionWire::readReply() {
    Reply reply;
    for (;;) {
        for (qsizetype end = m_received.indexOf('\n'); end >= 0; end = m_received.indexOf('\n')) {
            QByteArray line = m_received.left(end);
            m_received.remove(0, end + 1);
            if (line.endsWith('\r'))
                line.chop(1);
            const bool coded = line.size() >= 3 &&
                               std::all_of(line.begin(), line.begin() + 3, [](char c) { return c >= '0' && c <= '9'; });
            const int code = coded ? line.left(3).toInt() : 0;
            const bool last = coded && (line.size() == 3 || line[3] == ' ') && (reply.code == 0 || reply.code == code);
            if (reply.code == 0 && !coded)
                throw Poco::Net::NetException("not the reply of an FTP server");
            if (reply.code == 0)
                reply.code = code;
            if (!reply.text.isEmpty())
                reply.text += '\n';
            reply.text += line;
            if (last) {
                m_last = reply;
                return reply;
            }
        }
        if (m_received.size() + reply.text.size() > longestReply)
            throw Poco::Net::NetException("a reply without an end");
        std::array<char, 4096> bytes;
        const int count = m_control.receiveBytes(bytes.data(), static_cast<int>(bytes.size()));
        if (count <= 0)
            throw Poco::Net::ConnectionResetException("the server closed the connection");
        m_received.append(bytes.data(), count);
    }
}

FtpSessionWire::Reply FtpSessionWire::ask(const QByteArray& line) {
    if (!m_open)
        throw Poco::Net::ConnectionResetException("the connection is closed");
    send(line);
    return readReply();
}

Result<void> FtpSessionWire::open(const QString& host, const QString& user, const QString& password,
                                  Internet::DataChannel channel) {
    m_host = host;
    m_channel = channel;
    return guarded([&]() -> Result<void> {
        const std::string name = host.toStdString();
        const bool withPort = name.find(':') != std::string::npos;
        const SocketAddress address = withPort ? SocketAddress(name) : SocketAddress(name, ftpPort);
        m_control.connect(address, m_limits.connect);
        m_open = true;
        m_control.setReceiveTimeout(m_limits.silence);
        m_control.setSendTimeout(m_limits.silence);
        m_control.setNoDelay(true);
        Reply greeting = readReply();
        while (greeting.code >= 100 && greeting.code < 200) // "ready in n minutes"
            greeting = readReply();
        if (greeting.code < 200 || greeting.code > 299) {
            const Failure failure = refused(greeting);
            close();
            return failure;
        }
        auto result = login(user, password);
        if (!result)
            close();
        return result;
    });
}

Result<void> FtpSessionWire::login(const QString& user, const QString& password) {
    const auto userBytes = argumentBytes(user);
    const auto passwordBytes = argumentBytes(password);
    if (!userBytes)
        return userBytes.failure();
    if (!passwordBytes)
        return passwordBytes.failure();
    Reply reply = ask("USER " + *userBytes);
    if (reply.code == 331)
        reply = ask("PASS " + *passwordBytes);
    if (reply.code < 200 || reply.code > 299)
        return refused(reply);
    return {};
}

Result<void> FtpSessionWire::command(const char* word, const QString& argument) {
    const auto bytes = argumentBytes(argument);
    if (!bytes)
        return bytes.failure();
    return guarded([&]() -> Result<void> {
        const Reply reply = ask(QByteArray(word) + ' ' + *bytes);
        return reply.code >= 200 && reply.code <= 299 ? noFailure() : refused(reply);
    });
}

Result<QString> FtpSessionWire::currentDirectory() {
    return guarded([&]() -> Result<QString> {
        const Reply reply = ask("PWD");
        if (reply.code != 257)
            return refused(reply);
        // 257 "/a ""quoted"" name" and a remark
        const qsizetype open = reply.text.indexOf('"');
        QByteArray path;
        for (qsizetype at = open + 1; open >= 0 && at < reply.text.size(); ++at) {
            if (reply.text[at] == '"') {
                if (at + 1 >= reply.text.size() || reply.text[at + 1] != '"')
                    return AnsiCodePage::decode(path);
                ++at;
            }
            path += reply.text[at];
        }
        return refused(reply);
    });
}

Result<StreamSocket> FtpSessionWire::openPassive() {
    int port = 0;
    if (m_extendedPassive) {
        const Reply reply = ask("EPSV");
        if (reply.code == 421)
            return refused(reply);
        port = reply.code == 229 ? extendedPassivePort(reply.text) : 0;
        m_extendedPassive = port != 0;
    }
    if (port == 0) {
        const Reply reply = ask("PASV");
        port = reply.code == 227 ? passivePort(reply.text) : 0;
        if (port == 0)
            return refused(reply);
    }
    StreamSocket data;
    data.connect(SocketAddress(m_control.peerAddress().host(), static_cast<Poco::UInt16>(port)), m_limits.connect);
    return data;
}

Result<Poco::Net::ServerSocket> FtpSessionWire::openActive() {
    const auto own = m_control.address();
    Poco::Net::ServerSocket listener;
    listener.bind(SocketAddress(own.host(), 0), true);
    listener.listen(1);
    const int port = listener.address().port();
    QByteArray host = QByteArray::fromStdString(own.host().toString());
    const bool four = own.family() == SocketAddress::IPv4;
    const Reply reply = four ? ask("PORT " + host.replace('.', ',') + ',' + QByteArray::number(port / 256) + ',' +
                                   QByteArray::number(port % 256))
                             : ask("EPRT |2|" + host + '|' + QByteArray::number(port) + '|');
    if (reply.code < 200 || reply.code > 299)
        return refused(reply);
    return listener;
}

Result<void> FtpSessionWire::transfer(const QByteArray& line, const Transfer& move) {
    // Type ASCII on the wire, and the bytes as they are: what the lab's server expects, and what leaves a picture whole
    // there.
    if (!m_typeSet) {
        const Reply type = ask("TYPE A");
        if (type.code < 200 || type.code > 299)
            return refused(type);
        m_typeSet = true;
    }
    StreamSocket data;
    Poco::Net::ServerSocket listener;
    if (m_channel == Internet::DataChannel::Passive) {
        auto passive = openPassive();
        if (!passive)
            return passive.failure();
        data = *passive;
    } else {
        auto active = openActive();
        if (!active)
            return active.failure();
        listener = *active;
    }
    const Reply start = ask(line);
    if (start.code >= 200)
        return refused(start);
    if (m_channel == Internet::DataChannel::Active) {
        if (!listener.poll(m_limits.connect, Poco::Net::Socket::SELECT_READ))
            throw Poco::TimeoutException();
        data = listener.acceptConnection();
    }
    data.setReceiveTimeout(m_limits.silence);
    data.setSendTimeout(m_limits.silence);

    Result<void> moved;
    try {
        moved = move(data);
    } catch (const Poco::TimeoutException&) {
        return broken(Failure::Kind::TimedOut, QStringLiteral("the transfer stood still"));
    } catch (const Poco::Exception& exception) {
        moved = Failure{Failure::Kind::Disconnected, QStringLiteral("ftp %1: the transfer was cut: %2")
                                                         .arg(m_host, QString::fromStdString(exception.displayText()))};
        data.close();
    }
    if (!moved) {
        // The server's own reason, if it still gives one, says more than a cut line: a full disk, a quota.
        const Failure cut = moved.failure();
        data.close();
        m_control.setReceiveTimeout(std::min(m_limits.silence, Poco::Timespan(5, 0)));
        const Reply reason = readReply();
        m_control.setReceiveTimeout(m_limits.silence);
        return reason.code >= 400 ? refused(reason) : cut;
    }
    const Reply end = readReply();
    if (end.code < 200 || end.code > 299)
        return refused(end);
    // A line that was cut behind the last bytes leaves a server that took what it had for the whole and says so.
    std::array<char, 16> rest;
    data.setReceiveTimeout(std::min(m_limits.silence, Poco::Timespan(2, 0)));
    try {
        while (data.receiveBytes(rest.data(), static_cast<int>(rest.size())) > 0) {
        }
    } catch (const Poco::TimeoutException&) {
        // It keeps the data connection open although it has all; no harm.
    } catch (const Poco::Exception&) {
        return Failure{Failure::Kind::Disconnected,
                       QStringLiteral("ftp %1: the transfer was cut at its end").arg(m_host)};
    }
    return {};
}

Result<void> FtpSessionWire::put(const HostPath& local, const QString& remoteName) {
    const auto name = argumentBytes(remoteName);
    if (!name)
        return name.failure();
    const auto source = openSource(local, toText(local));
    if (!source)
        return source.failure();
    return guarded([&] {
        return transfer("STOR " + *name, [&](StreamSocket& data) -> Result<void> {
            std::vector<char> bytes(chunk);
            for (;;) {
                const auto count = readSome(*source, bytes.data(), bytes.size(), toText(local));
                if (!count) {
                    data.setLinger(true, 0); // a reset: the server must not take the part for the whole
                    return count.failure();
                }
                if (*count == 0)
                    break;
                sendAll(data, bytes.data(), *count);
            }
            data.shutdownSend();
            return {};
        });
    });
}

Result<void> FtpSessionWire::get(const QString& remoteName, const HostPath& local) {
    const auto name = argumentBytes(remoteName);
    if (!name)
        return name.failure();
    NewContent content(local, toText(local));
    if (content.failed())
        return content.commit();
    auto received = guarded([&] {
        return transfer("RETR " + *name, [&](StreamSocket& data) -> Result<void> {
            std::vector<char> bytes(chunk);
            for (;;) {
                const int count = data.receiveBytes(bytes.data(), static_cast<int>(bytes.size()));
                if (count <= 0)
                    return {};
                content.append(bytes.data(), static_cast<std::size_t>(count));
                if (content.failed())
                    return content.commit();
            }
        });
    });
    return received ? content.commit() : received;
}

Result<std::vector<FtpEntry>> FtpSessionWire::list(const QString& pattern) {
    const auto bytes = argumentBytes(pattern);
    if (!bytes)
        return bytes.failure();
    QByteArray listing;
    const auto received = guarded([&] {
        return transfer(*bytes == "*.*" ? QByteArray("LIST") : "LIST " + *bytes,
                        [&](StreamSocket& data) -> Result<void> {
                            std::vector<char> part(chunk);
                            for (;;) {
                                const int count = data.receiveBytes(part.data(), static_cast<int>(part.size()));
                                if (count <= 0)
                                    return {};
                                listing.append(part.data(), count);
                                if (listing.size() > longestListing)
                                    return Failure{Failure::Kind::TooLarge,
                                                   QStringLiteral("ftp %1: a listing without an end").arg(m_host)};
                            }
                        });
    });
    if (!received)
        return received.failure();
    return ParseFtpListing(listing);
}

QString FtpSessionWire::lastResponse() const {
    return AnsiCodePage::decode(m_last.text);
}

} // namespace lumora
