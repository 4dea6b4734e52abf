// Encrypted lines, before a server of the test's own whose certificates are made here.
#include "common/HostFile.h"
#include "platform/line/BlockingCall.h"
#include "platform/line/HostReach.h"
#include "platform/line/PocoInternet.h"
#include "support/LabServers.h"
#include "support/ScriptedServer.h"

#include <Poco/Net/Context.h>
#include <Poco/Net/SecureStreamSocket.h>

#include <QProcess>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace lumora {
namespace {

using Poco::Net::Context;
using Poco::Net::SecureStreamSocket;
using Poco::Net::StreamSocket;
using DataChannel = Internet::DataChannel;

// An authority, and certificates by it: good, wrong (for another host), old (expired), named (for a host without
// alternative names); one that is signed by itself.
constexpr const char* makeCertificates = R"(set -e; cd "$1"
openssl req -x509 -newkey ec -pkeyopt ec_paramgen_curve:prime256v1 -nodes -days 2 -subj /CN=lab -keyout key -out authority
openssl req -x509 -key key -days 2 -subj /CN=alone -addext subjectAltName=IP:127.0.0.1 -out alone
while read -r name days host; do
  openssl req -new -key key -subj /CN=lab.example -addext "subjectAltName=$host" -out request
  openssl x509 -req -in request -CA authority -CAkey key -CAcreateserial -days "$days" -copy_extensions copy -out "$name"
done <<<$'good 2 IP:127.0.0.1\nwrong 2 DNS:other.example\nold -1 IP:127.0.0.1'
openssl req -new -key key -subj /CN=localhost -out request
openssl x509 -req -in request -CA authority -CAkey key -CAcreateserial -days 2 -out named)";

const QString& certificates() {
    static const QTemporaryDir folder;
    static const int made =
        QProcess::execute(u"bash"_s, {u"-c"_s, QString::fromLatin1(makeCertificates), u"-"_s, folder.path()});
    EXPECT_EQ(made, 0);
    static const QString path = folder.path() + u'/';
    return path;
}

// What the server is like, and what it has seen.
struct Manner {
    const char* certificate = "good";
    bool implicit = false;
    int protocolsOff = 0;
    QByteArray auth = "234 go on";
    QByteArray protection = "200 private";
    qsizetype sent = -1; // bytes of a download; -1: all
    bool tellsEnd = true;
    bool tellsSize = true;
};

class TlsTest : public ::testing::Test {
protected:
    StreamSocket encrypted(const StreamSocket& plain) {
        Context::Params params;
        params.privateKeyFile = (certificates() + u"key"_s).toStdString();
        params.certificateFile = (certificates() + QLatin1StringView(manner.certificate)).toStdString();
        params.verificationMode = Context::VERIFY_NONE;
        if (!context) {
            context = new Context(Context::TLS_SERVER_USE, params);
            context->enableSessionCache(true, "lab");
            context->disableProtocols(manner.protocolsOff);
        }
        SecureStreamSocket secure = SecureStreamSocket::attach(plain, context);
        secure.completeHandshake();
        return secure;
    }

    void serve(StreamSocket& client) {
        const WithoutBrokenPipeSignal guard;
        context = {};
        StreamSocket line = manner.implicit ? encrypted(client) : client;
        Poco::Net::ServerSocket listening(Poco::Net::SocketAddress("127.0.0.1", 0));
        const auto tell = [&line](const QByteArray& reply) {
            line.sendBytes((reply + "\r\n").constData(), static_cast<int>(reply.size()) + 2);
        };
        tell("220 ready");
        QByteArray heard;
        std::array<char, 4096> part;
        for (;;) {
            const int count = line.receiveBytes(part.data(), static_cast<int>(part.size()));
            if (count <= 0)
                return;
            heard.append(part.data(), count);
            for (qsizetype end = heard.indexOf("\r\n"); end >= 0; end = heard.indexOf("\r\n")) {
                const QByteArray word = heard.left(end).split(' ').first();
                heard.remove(0, end + 2);
                inPlainText += line.secure() ? QByteArray() : word + ' ';
                if (word == "AUTH") {
                    tell(manner.auth);
                    if (manner.auth.startsWith('2'))
                        line = encrypted(line);
                } else if (word == "EPSV") {
                    tell("229 (|||" + QByteArray::number(listening.address().port()) + "|)");
                } else if (word == "STOR" || word == "LIST" || word == "RETR") {
                    tell("150 now");
                    StreamSocket plain = listening.acceptConnection();
                    SecureStreamSocket data(encrypted(plain));
                    if (!data.sessionWasReused()) {
                        tell("522 session reuse required");
                        continue;
                    }
                    if (word == "STOR") {
                        stored.clear();
                        int bytes = 0;
                        while ((bytes = data.receiveBytes(part.data(), static_cast<int>(part.size()))) > 0)
                            stored.append(part.data(), bytes);
                    } else {
                        const QByteArray content = word == "LIST" ? "-rw-r--r-- 1 a b 5 Nov 21 03:47 x\r\n" : file;
                        data.sendBytes(content.constData(),
                                       static_cast<int>(manner.sent < 0 ? content.size() : manner.sent));
                    }
                    manner.tellsEnd ? data.close() : plain.shutdown();
                    tell("226 done");
                } else {
                    tell(word == "USER"   ? "331 password"
                         : word == "PWD"  ? "257 \"/\""
                         : word == "SIZE" ? manner.tellsSize ? "213 " + QByteArray::number(file.size()) : "502 no"
                         : word == "PROT" ? manner.protection
                                          : "200 good");
                }
            }
        }
    }

    Result<std::unique_ptr<FtpConnection>> connect(FtpTls way,
                                                   const QString& authorities = certificates() + u"authority"_s,
                                                   const QString& host = u"127.0.0.1"_s) {
        internet.emplace(TimeLimits{Poco::Timespan(30, 0), Poco::Timespan(3, 0)}, FtpType::Image,
                         LineEncryption{way, authorities});
        return internet->connectFtp(host + u":%1"_s.arg(server->port()), u"ftp"_s, u"secret"_s, DataChannel::Passive);
    }

    // A server of this manner, behind the end of the one before.
    void begin(const Manner& like) {
        server.reset();
        manner = like;
        inPlainText.clear();
        server.emplace([this](StreamSocket& client) { serve(client); });
    }

    QTemporaryDir folder;
    const QByteArray file = QByteArray("a\r\nb\n\r\0c", 8).repeated(50'000);
    Manner manner;
    QByteArray inPlainText;
    QByteArray stored;
    Context::Ptr context;
    std::optional<PocoInternet> internet;
    HostPath local = toHostPath(folder.path()) / "local";
    HostPath back = toHostPath(folder.path()) / "back";
    std::optional<ScriptedServer> server;
};

TEST_F(TlsTest, FilesTravelEncryptedInTheSessionOfTheLogin) {
    ASSERT_TRUE(writeWholeFile(local, file));
    for (const bool implicit : {false, true}) {
        for (const int off : {0, int(Context::PROTO_TLSV1_3)}) {
            SCOPED_TRACE(std::to_string(implicit) + " without " + std::to_string(off));
            begin({.implicit = implicit, .protocolsOff = off});
            const auto ftp = connect(implicit ? FtpTls::Implicit : FtpTls::Explicit);
            ASSERT_TRUE(ftp) << ftp.failure().message.toStdString();
            for (int again = 0; again < 3; ++again) {
                const auto put = (*ftp)->put(local, u"x"_s);
                ASSERT_TRUE(put) << put.failure().message.toStdString();
                EXPECT_EQ(stored, file);
            }
            EXPECT_EQ((*ftp)->list(u"*.*"_s)->entries.size(), 1U);
            ASSERT_TRUE((*ftp)->getExact(u"x"_s, back));
            EXPECT_EQ(contentOf(back), file);
            EXPECT_EQ(inPlainText, implicit ? "" : "AUTH ");
        }
    }
}

TEST_F(TlsTest, AServerThatCanNotBeTrustedHearsNoPassword) {
    const QString known = certificates() + u"authority"_s;
    const struct {
        const char* name;
        Manner manner;
        QString authorities;
        TlsFault fault;
        QString host = u"127.0.0.1"_s;
    } cases[] = {
        {"another host", {.certificate = "wrong"}, known, TlsFault::WrongHost},
        {"a common name alone", {.certificate = "named"}, known, TlsFault::WrongHost, u"localhost"_s},
        {"expired", {.certificate = "old"}, known, TlsFault::Expired},
        {"signed by itself", {.certificate = "alone"}, known, TlsFault::SelfSigned},
        {"unknown authority", {}, {}, TlsFault::UnknownAuthority},
        {"no file", {}, u"/nowhere/ca.pem"_s, TlsFault::NoAuthorities},
        {"AUTH refused", {.auth = "502 what?"}, known, TlsFault::NotOffered},
        {"plain text behind AUTH", {.auth = "299 no TLS\r\n230 in"}, known, TlsFault::NotTrusted},
        {"TLS 1.1", {.protocolsOff = Context::PROTO_TLSV1_2 | Context::PROTO_TLSV1_3}, known, TlsFault::TooOld},
        {"files in the open", {.protection = "536 no"}, known, TlsFault::DataNotEncrypted},
    };
    for (const auto& one : cases) {
        SCOPED_TRACE(one.name);
        begin(one.manner);
        const auto refused = connect(FtpTls::Explicit, one.authorities, one.host);
        ASSERT_FALSE(refused);
        EXPECT_EQ(refused.failure().tls, one.fault) << refused.failure().message.toStdString();
        server.reset();
        EXPECT_TRUE(inPlainText == "AUTH " || inPlainText == "AUTH QUIT ") << inPlainText.toStdString();
    }
    begin({});
    EXPECT_EQ(connect(FtpTls::Implicit).failure().tls, TlsFault::NotOffered);
    const auto web = [&] { return u"https://127.0.0.1:%1"_s.arg(server->port()); };
    EXPECT_EQ(internet->fetch(web()).failure().tls, TlsFault::NotOffered);
    begin({.certificate = "wrong", .implicit = true});
    EXPECT_EQ(internet->fetch(web()).failure().tls, TlsFault::WrongHost);
    EXPECT_EQ(ReachHost(web(), 80, {FtpTls::None, known}).failure().tls, TlsFault::WrongHost);
    begin({.implicit = true});
    EXPECT_TRUE(ReachHost(web(), 80, {FtpTls::None, known}));
}

TEST_F(TlsTest, ACutDownloadIsFoundUnlessItsLengthProvesIt) {
    const struct {
        qsizetype sent;
        bool tellsEnd, tellsSize, whole;
    } cases[] = {{-1, false, true, true}, {-1, false, false, false}, {100, false, true, false}};
    for (const auto& one : cases) {
        begin({.sent = one.sent, .tellsEnd = one.tellsEnd, .tellsSize = one.tellsSize});
        const auto ftp = connect(FtpTls::Explicit);
        ASSERT_TRUE(ftp);
        const auto got = (*ftp)->getExact(u"x"_s, back);
        EXPECT_EQ(got.ok(), one.whole) << (got ? std::string() : got.failure().message.toStdString());
        EXPECT_EQ(std::filesystem::remove(back), one.whole);
        EXPECT_TRUE(one.sent >= 0 || !(*ftp)->list(u"*.*"_s)) << "a listing has no length";
    }
}

TEST_F(TlsTest, AnHttpsAnswerIsWholeOrAFailureAndNoRedirectLeavesIt) {
    bool tellsEnd = true;
    QByteArray answer;
    const ScriptedServer web([&](StreamSocket& client) {
        const WithoutBrokenPipeSignal guard;
        context = {};
        StreamSocket line = encrypted(client);
        std::array<char, 4096> part;
        line.receiveBytes(part.data(), static_cast<int>(part.size()));
        line.sendBytes(answer.constData(), static_cast<int>(answer.size()));
        if (!tellsEnd)
            client.shutdown();
        line.close();
    });
    begin({});
    static_cast<void>(connect(FtpTls::Explicit));
    const QString url = u"https://127.0.0.1:%1/x"_s.arg(web.port());
    answer = "HTTP/1.1 200 OK\r\n\r\nheard";
    EXPECT_EQ(internet->fetch(url)->body, "heard");
    tellsEnd = false;
    EXPECT_FALSE(internet->fetch(url)) << "where nothing else tells the end of the answer";
    answer = "HTTP/1.1 200 OK\r\nContent-Length: 5\r\n\r\nheard";
    EXPECT_TRUE(internet->fetch(url));
    answer = "HTTP/1.1 302 Moved\r\nLocation: http" + url.mid(5).toLatin1() + "\r\nContent-Length: 0\r\n\r\n";
    EXPECT_EQ(internet->fetch(url)->status, 302);
}

TEST_F(TlsTest, AServerThatFallsSilentInTheHandshakeIsGivenUp) {
    const ScriptedServer silent([](StreamSocket& client) {
        std::array<char, 4096> part;
        while (client.receiveBytes(part.data(), static_cast<int>(part.size())) > 0) {
        }
    });
    PocoInternet brief({Poco::Timespan(30, 0), Poco::Timespan(0, 300'000)}, FtpType::Image, {FtpTls::Implicit, {}});
    const auto mute = brief.connectFtp(u"127.0.0.1:%1"_s.arg(silent.port()), u"a"_s, u"b"_s, DataChannel::Passive);
    EXPECT_EQ(mute.failure().kind, Failure::Kind::TimedOut);
}

} // namespace
} // namespace lumora
