#include "platform/line/FtpSessionWire.h"

#include "common/AnsiCodePage.h"
#include "common/HostFile.h"
#include "common/StationLog.h"
#include "platform/line/FtpListing.h"

#include <QElapsedTimer>
#include <QRegularExpression>

#include <Poco/Exception.h>
#include <Poco/Net/NetException.h>
#include <Poco/Net/SocketAddress.h>

#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

using Poco::Net::SocketAddress;
using Poco::Net::StreamSocket;

constexpr Poco::UInt16 ftpPort = 21;
constexpr Poco::UInt16 ftpsPort = 990; // encrypted from the first byte on
// Beyond these a server is not talking FTP.
constexpr qsizetype longestReply = 64 * 1024;
constexpr qsizetype longestListing = 16 * 1024 * 1024;
constexpr int mostDelays = 10; // "ready in n minutes"
constexpr int mostReads = 10;  // behind the end of a put, where nothing is to come
constexpr std::size_t chunk = 64 * 1024;

Result<void> noFailure() {
    return {};
}

bool completed(int code) {
    return code >= 200 && code <= 299;
}

// The refusal speaks of encryption, which these servers ask for before anything else.
bool asksForEncryption(const QByteArray& text) {
    static const QRegularExpression words(u"\\b(tls|ssl|ftps|encrypt\\w*|cleartext|plain ftp|use auth)\\b"_s,
                                          QRegularExpression::CaseInsensitiveOption);
    return words.match(QString::fromLatin1(text)).hasMatch();
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

// Tells the other side that no more is wanted; whether it hears that changes nothing.
void endOfLine(StreamSocket& socket) {
    try {
        socket.shutdownSend();
    } catch (const Poco::Exception&) {
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
    Failure failure{kind, u"ftp %1: %2"_s.arg(m_host, reason)};
    writeLog(u"ftp connection given up"_s, failure);
    return failure;
}

Failure FtpSessionWire::refused(const Reply& reply) {
    if (reply.code == 421)
        close();
    // RFC 959: 4xx is a passing refusal.
    return {Failure::Kind::Refused, u"ftp %1: %2"_s.arg(m_host, AnsiCodePage::decode(reply.text).trimmed()),
            reply.code < 500};
}

// Every call of the library may throw; nothing passes this point. After a failure of the line the dialogue is out of
// step, so the connection is given up.
template <class Step>
auto FtpSessionWire::guarded(Step step) -> decltype(step()) {
    try {
        return step();
    } catch (const TlsRefused& refusal) {
        const Failure failure = notTrusted(refusal);
        broken(failure.kind, failure.message);
        return failure;
    } catch (const Poco::TimeoutException&) {
        return broken(Failure::Kind::TimedOut, u"no answer within the time limit"_s);
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
        m_control.socket.setSendTimeout(Poco::Timespan(1, 0));
        sendAll(m_control.socket, "QUIT\r\n", 6);
        if (m_control.socket.secure())
            m_control.socket.shutdownSend();
    } catch (const std::exception&) { // QUIT is not needed on a broken line
    }
    m_control = {};
}

Result<QByteArray> FtpSessionWire::argumentBytes(const QString& argument) const {
    const QByteArray bytes = AnsiCodePage::encode(argument);
    if (bytes.contains('\r') || bytes.contains('\n') || bytes.contains('\0'))
        return Failure{Failure::Kind::Refused, u"ftp %1: a name with a line break was not sent"_s.arg(m_host)};
    return bytes;
}

void FtpSessionWire::send(const QByteArray& line) {
    const QByteArray whole = line + "\r\n";
    sendAll(m_control.socket, whole.constData(), static_cast<std::size_t>(whole.size()));
}

FtpSessionWire::Reply FtpSessionWire::readReply() {
    // What came before a cut can still be read behind it.
    m_call.check();
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
        const int count = m_control.socket.receiveBytes(bytes.data(), static_cast<int>(bytes.size()));
        if (count <= 0)
            throw Poco::Net::ConnectionResetException("the server closed the connection");
        m_received.append(bytes.data(), count);
    }
}

FtpSessionWire::Reply FtpSessionWire::ask(const QByteArray& line) {
    if (!m_open)
        throw Poco::Net::ConnectionResetException("the connection is closed");
    QElapsedTimer timer;
    timer.start();
    send(line);
    const Reply reply = readReply();
    // Only the word: what follows it is a password, or a name.
    writeLog(
        u"ftp %1 %2, %3 ms"_s.arg(QString::fromLatin1(line.split(' ').first())).arg(reply.code).arg(timer.elapsed()));
    return reply;
}

Result<void> FtpSessionWire::open(const QString& host, const QString& user, const QString& password,
                                  Internet::DataChannel channel) {
    m_host = host;
    m_channel = channel;
    return guarded([&]() -> Result<void> {
        const Poco::UInt16 usualPort = m_tls == FtpTls::Implicit ? ftpsPort : ftpPort;
        m_control = LineSocket(ResolvedAddress(host.toStdString(), usualPort, m_call), m_call);
        m_open = true;
        m_control.socket.setNoDelay(true);
        if (m_tls == FtpTls::Implicit)
            m_control.encrypt(host.toStdString(), m_call);
        Reply greeting = readReply();
        writeLog(u"ftp connected, %1"_s.arg(greeting.code));
        for (int delays = 0; greeting.code >= 100 && greeting.code < 200 && delays < mostDelays; ++delays)
            greeting = readReply();
        Result<void> result = completed(greeting.code) ? noFailure() : refusedLogin(greeting);
        if (result && m_tls == FtpTls::Explicit)
            result = askForTls();
        if (result)
            result = login(user, password);
        if (result && m_tls != FtpTls::None)
            result = protectData();
        if (!result)
            close();
        return result;
    });
}

Failure FtpSessionWire::notTrusted(const TlsRefused& refusal) const {
    return tlsFailure(refusal.fault(), u"ftp "_s + m_host, QString::fromStdString(refusal.message()));
}

// Neither user nor password is said before the line is encrypted: a refusal ends the connection.
Result<void> FtpSessionWire::askForTls() {
    const Reply reply = ask("AUTH TLS");
    if (reply.code == 421)
        return refused(reply);
    if (!completed(reply.code) && reply.code != 334)
        return tlsFailure(TlsFault::NotOffered, u"ftp "_s + m_host, AnsiCodePage::decode(reply.text));
    // What came in the open behind the answer was put there by somebody else.
    if (!m_received.isEmpty())
        return tlsFailure(TlsFault::NotTrusted, u"ftp "_s + m_host, u"words in plain text behind the answer"_s);
    m_control.encrypt(m_host.toStdString(), m_call);
    return {};
}

// RFC 4217: without this the files travel in plain text.
Result<void> FtpSessionWire::protectData() {
    ask("PBSZ 0");
    const Reply reply = ask("PROT P");
    if (reply.code == 421)
        return refused(reply);
    return completed(reply.code)
               ? noFailure()
               : tlsFailure(TlsFault::DataNotEncrypted, u"ftp "_s + m_host, AnsiCodePage::decode(reply.text));
}

// Servers want to see that files come from whoever logged in, so the data line resumes the control line's session.
// Under TLS 1.2 that is the session of its handshake; under TLS 1.3 the newest ticket that came over the control line,
// each time a copy, as a ticket may be used again. A server that sends none gets a whole handshake, with the same look
// at its certificate.
void FtpSessionWire::encryptData(LineSocket& data) {
    if (m_tls != FtpTls::None)
        data.encrypt(m_host.toStdString(), m_call, TlsSessionOf(m_control.socket));
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
    if (!completed(reply.code))
        return refusedLogin(reply);
    const auto home = askDirectory();
    if (!home && !m_open)
        return home.failure();
    m_home = home ? *home : QString();
    if (m_home.endsWith(u'/') || m_home.endsWith(u'\\'))
        m_home.chop(1);
    return {};
}

Failure FtpSessionWire::refusedLogin(const Reply& reply) {
    Failure failure = refused(reply);
    if (asksForEncryption(reply.text))
        failure = {Failure::Kind::Unsupported, u"this server wants encryption: "_s + failure.message};
    return failure;
}

Result<void> FtpSessionWire::command(const char* word, const QString& argument) {
    const auto bytes = argumentBytes(argument);
    if (!bytes)
        return bytes.failure();
    return guarded([&]() -> Result<void> {
        const Reply reply = ask(QByteArray(word) + ' ' + *bytes);
        return completed(reply.code) ? noFailure() : refused(reply);
    });
}

Result<QString> FtpSessionWire::askDirectory() {
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
}

// A server that is not closed in to the account's folder tells the whole path of its own disk.
Result<QString> FtpSessionWire::currentDirectory() {
    return guarded([&]() -> Result<QString> {
        const auto path = askDirectory();
        if (!path || m_home.isEmpty() || !path->startsWith(m_home))
            return path;
        QString below = path->mid(m_home.size());
        if (!m_home.contains(u'/'))
            below.replace(u'\\', u'/');
        return below.isEmpty() ? u"/"_s : below.startsWith(u'/') ? Result<QString>(below) : path;
    });
}

Result<void> FtpSessionWire::changeDirectory(const QString& directory) {
    const bool fromHome = directory.startsWith(u'/') && !m_home.isEmpty();
    if (!fromHome)
        return command("CWD", directory);
    return command("CWD", directory.size() == 1 ? m_home : m_home + directory);
}

Result<void> FtpSessionWire::setType(FtpType type) {
    if (m_typeSet == type)
        return {};
    const Reply reply = ask(type == FtpType::Ascii ? "TYPE A" : "TYPE I");
    if (!completed(reply.code))
        return refused(reply);
    m_typeSet = type;
    return {};
}

Result<SocketAddress> FtpSessionWire::openPassive() {
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
    return SocketAddress(m_control.socket.peerAddress().host(), static_cast<Poco::UInt16>(port));
}

Result<Poco::Net::ServerSocket> FtpSessionWire::openActive() {
    const auto own = m_control.socket.address();
    Poco::Net::ServerSocket listener;
    listener.bind(SocketAddress(own.host(), 0), true);
    listener.listen(1);
    const int port = listener.address().port();
    QByteArray host = QByteArray::fromStdString(own.host().toString());
    const bool four = own.family() == SocketAddress::IPv4;
    const Reply reply = four ? ask("PORT " + host.replace('.', ',') + ',' + QByteArray::number(port / 256) + ',' +
                                   QByteArray::number(port % 256))
                             : ask("EPRT |2|" + host + '|' + QByteArray::number(port) + '|');
    if (!completed(reply.code))
        return refused(reply);
    return listener;
}

Result<void> FtpSessionWire::transfer(const QByteArray& line, Direction direction, const Transfer& move,
                                      std::optional<FtpType> type) {
    m_transferCode = 0;
    if (const auto typed = setType(type.value_or(m_type)); !typed)
        return typed;
    LineSocket data;
    Poco::Net::ServerSocket listener;
    LineAbort::Watch listening;
    if (m_channel == Internet::DataChannel::Passive) {
        const auto address = openPassive();
        if (!address)
            return address.failure();
        data = LineSocket(*address, m_call);
    } else {
        auto active = openActive();
        if (!active)
            return active.failure();
        listener = *active;
        listening = LineAbort::Watch(m_call.line(), listener);
    }
    const Reply start = ask(line);
    if (start.code >= 200) {
        m_transferCode = start.code;
        return refused(start);
    }
    if (m_channel == Internet::DataChannel::Active) {
        m_call.check();
        if (!listener.poll(m_call.limits().connect, Poco::Net::Socket::SELECT_READ))
            throw Poco::TimeoutException();
        data.socket = listener.acceptConnection();
        data.watch = LineAbort::Watch(m_call.line(), data.socket);
        data.socket.setReceiveTimeout(m_call.limits().silence);
        data.socket.setSendTimeout(m_call.limits().silence);
        m_call.check();
    }

    QElapsedTimer timer;
    timer.start();
    Result<void> moved;
    try {
        encryptData(data);
        moved = move(data.socket);
    } catch (const Poco::TimeoutException&) {
        return broken(Failure::Kind::TimedOut, u"the transfer stood still"_s);
    } catch (const TlsRefused& refusal) {
        moved = notTrusted(refusal);
    } catch (const Poco::Exception& exception) {
        moved =
            Failure{Failure::Kind::Disconnected,
                    u"ftp %1: the transfer was cut: %2"_s.arg(m_host, QString::fromStdString(exception.displayText()))};
    }
    // Some servers wait for the end of a download's connection before they say that all has gone.
    if (moved && direction == Direction::Down && data.socket.secure())
        endOfLine(data.socket);
    if (!moved || direction == Direction::Down)
        data.close();
    if (!moved) {
        // The server's own reason, if it still gives one, says more than a cut line: a full disk, a quota.
        const Failure& cut = moved.failure();
        m_control.socket.setReceiveTimeout(std::min(m_call.limits().silence, Poco::Timespan(5, 0)));
        const Reply reason = readReply();
        m_control.socket.setReceiveTimeout(m_call.limits().silence);
        return reason.code >= 400 ? refused(reason) : cut;
    }
    const Reply end = readReply();
    m_transferCode = end.code;
    writeLog(u"ftp %1 ended with %2, %3 ms"_s.arg(QString::fromLatin1(line.split(' ').first()))
                 .arg(end.code)
                 .arg(timer.elapsed()));
    if (!completed(end.code))
        return refused(end);
    return direction == Direction::Up ? endOfPut(data.socket) : noFailure();
}

// An encrypted download whose end was not told is whole only if the server tells the same length.
Result<void> FtpSessionWire::endOfGet(const QString& remoteName, qint64 received) {
    const auto told = length(remoteName);
    if (told && *told == received)
        return {};
    return Failure{Failure::Kind::Disconnected,
                   u"ftp %1: the encrypted line ended before its end was told"_s.arg(m_host)};
}

// A line that was cut behind the last bytes leaves a server that took what it had for the whole and says so.
Result<void> FtpSessionWire::endOfPut(StreamSocket& data) {
    std::array<char, 16> rest;
    data.setReceiveTimeout(std::min(m_call.limits().silence, Poco::Timespan(2, 0)));
    try {
        for (int reads = 0; reads < mostReads && data.receiveBytes(rest.data(), static_cast<int>(rest.size())) > 0;
             ++reads) {
        }
    } catch (const TlsEndedEarly&) {
        // It was this side that had to tell the end, and the server has confirmed it over the control line.
    } catch (const Poco::TimeoutException&) {
        // The server keeps the data connection open although it has all bytes; that does no harm.
    } catch (const Poco::Exception&) {
        return Failure{Failure::Kind::Disconnected, u"ftp %1: the transfer was cut at its end"_s.arg(m_host)};
    }
    m_call.check();
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
        return transfer("STOR " + *name, Direction::Up, [&](StreamSocket& data) -> Result<void> {
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
                m_call.moved(static_cast<std::int64_t>(*count));
            }
            data.shutdownSend();
            return {};
        });
    });
}

Result<void> FtpSessionWire::get(const QString& remoteName, const HostPath& local, std::optional<FtpType> type) {
    const auto name = argumentBytes(remoteName);
    if (!name)
        return name.failure();
    NewContent content(local, toText(local));
    if (content.failed())
        return content.commit();
    qint64 taken = 0;
    bool endIsTold = true;
    auto received = guarded([&] {
        return transfer(
            "RETR " + *name, Direction::Down,
            [&](StreamSocket& data) -> Result<void> {
                std::vector<char> bytes(chunk);
                for (;;) {
                    int count = 0;
                    try {
                        count = data.receiveBytes(bytes.data(), static_cast<int>(bytes.size()));
                    } catch (const TlsEndedEarly&) {
                        endIsTold = false;
                    }
                    if (count <= 0)
                        return {};
                    taken += count;
                    m_call.moved(count);
                    content.append(bytes.data(), static_cast<std::size_t>(count));
                    if (content.failed())
                        return content.commit();
                }
            },
            type);
    });
    if (received && !endIsTold)
        received = endOfGet(remoteName, taken);
    return received ? content.commit() : received;
}

Result<FtpListing> FtpSessionWire::list(const QString& pattern, EmptyFolder empty) {
    const auto bytes = argumentBytes(pattern);
    if (!bytes)
        return bytes.failure();
    QByteArray listing;
    const auto received = guarded([&] {
        return transfer(
            *bytes == "*.*" ? QByteArray("LIST") : "LIST " + *bytes, Direction::Down,
            [&](StreamSocket& data) -> Result<void> {
                std::vector<char> part(chunk);
                for (;;) {
                    const int count = data.receiveBytes(part.data(), static_cast<int>(part.size()));
                    if (count <= 0)
                        return {};
                    m_call.moved(count);
                    listing.append(part.data(), count);
                    if (listing.size() > longestListing)
                        return Failure{Failure::Kind::TooLarge, u"ftp %1: a listing without an end"_s.arg(m_host)};
                }
            });
    });
    const bool refusedAsEmpty =
        empty == EmptyFolder::MayBeRefused && listing.isEmpty() && (m_transferCode == 450 || m_transferCode == 550);
    if (!received && !refusedAsEmpty)
        return received.failure();
    FtpListing read = ParseFtpListing(listing);
    read.refused = !received;
    return read;
}

Result<std::optional<qint64>> FtpSessionWire::length(const QString& remoteName) {
    using Length = std::optional<qint64>;
    const auto name = argumentBytes(remoteName);
    if (!name)
        return name.failure();
    return guarded([&]() -> Result<Length> {
        const auto typed = setType(FtpType::Image);
        if (!typed)
            return m_open && !typed.failure().passing ? Result<Length>(Length()) : typed.failure();
        const Reply reply = ask("SIZE " + *name);
        if (reply.code >= 400 && reply.code < 500)
            return refused(reply);
        bool known = false;
        const qint64 bytes = reply.text.mid(4).trimmed().toLongLong(&known);
        return reply.code == 213 && known && bytes >= 0 ? Length(bytes) : Length();
    });
}

QString FtpSessionWire::lastResponse() const {
    return AnsiCodePage::decode(m_last.text);
}

} // namespace lumora
