#include "platform/line/PocoInternet.h"
#include "support/LabServers.h"
#include "support/TcpRelay.h"

#include <QElapsedTimer>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

namespace fs = std::filesystem;
using DataChannel = Internet::DataChannel;

// Limits short enough for a test that waits for them.
TimeLimits shortLimits() {
    return {Poco::Timespan(2, 0), Poco::Timespan(0, 700'000)};
}

QByteArray contentOf(const HostPath& path) {
    QFile file(toText(path));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("<absent>");
}

// CR, LF, CR LF and LF CR in all mixtures, every byte value, and enough of it that it does not fit a socket's buffer.
QByteArray anyBytes(int size) {
    QByteArray bytes(size, Qt::Uninitialized);
    unsigned state = 12345;
    for (char& c : bytes) {
        state = state * 1664525U + 1013904223U;
        const unsigned choice = state >> 28;
        c = choice < 3 ? '\r' : choice < 6 ? '\n' : static_cast<char>(state >> 16);
    }
    return bytes;
}

class FtpTest : public ::testing::Test {
protected:
    QTemporaryDir local;
    LabServers lab;
    PocoInternet internet{shortLimits()};

    void SetUp() override { ASSERT_TRUE(lab.running()) << lab.failure().toStdString(); }

    HostPath file(const char* name, const QByteArray& bytes) const {
        const HostPath path = toHostPath(local.path()) / name;
        std::ofstream(path, std::ios::binary).write(bytes.constData(), bytes.size());
        return path;
    }
    std::unique_ptr<FtpConnection> connect(const QString& host, DataChannel channel = DataChannel::Passive) {
        auto connection = internet.connectFtp(host, LabServers::user(), LabServers::password(), channel);
        EXPECT_TRUE(connection) << (connection ? "" : connection.failure().message.toStdString());
        if (!connection)
            return nullptr;
        EXPECT_TRUE((*connection)->setCurrentDirectory(u"zalamim234"_s));
        return std::move(*connection);
    }
    static std::vector<std::string> names(const std::vector<FtpEntry>& entries) {
        std::vector<std::string> all;
        for (const FtpEntry& entry : entries)
            all.push_back(entry.name.toStdString());
        std::sort(all.begin(), all.end());
        return all;
    }
};

TEST_F(FtpTest, WalksMakesPutsListsGetsAndDeletes) {
    for (const DataChannel channel : {DataChannel::Passive, DataChannel::Active}) {
        const QByteArray bytes = anyBytes(3'000'000);
        auto ftp = connect(lab.ftpHost(), channel);
        ASSERT_TRUE(ftp);
        EXPECT_EQ(ftp->currentDirectory().value(), u"/zalamim234"_s);
        const QString order =
            channel == DataChannel::Passive ? u"2026_11_21_KUP_1234^105"_s : u"2026_11_21_KUP_1234^106"_s;
        ASSERT_TRUE(ftp->makeDirectory(order));
        const auto again = ftp->makeDirectory(order);
        ASSERT_FALSE(again);
        EXPECT_EQ(again.failure().kind, Failure::Kind::Refused);
        EXPECT_TRUE(again.failure().message.contains(u"550"_s)) << again.failure().message.toStdString();
        ASSERT_TRUE(ftp->setCurrentDirectory(order));
        EXPECT_TRUE(ftp->list(u"*.*"_s)->empty());

        const auto sent = ftp->put(file("a.jpp", bytes), u"a.jpp"_s);
        ASSERT_TRUE(sent) << sent.failure().message.toStdString();
        ASSERT_TRUE(ftp->put(file("empty", QByteArray()), u"empty"_s));
        const HostPath there = lab.ordersFolder() / toHostPath(order);
        EXPECT_TRUE(contentOf(there / "a.jpp") == bytes);
        EXPECT_EQ(contentOf(there / "empty"), QByteArray());
        EXPECT_EQ(names(*ftp->list(u"*.*"_s)), (std::vector<std::string>{"a.jpp", "empty"}));

        const HostPath back = toHostPath(local.path()) / "back";
        ASSERT_TRUE(ftp->get(u"a.jpp"_s, back));
        EXPECT_EQ(contentOf(back).size(), contentOf(there / "a.jpp").size());
        ASSERT_TRUE(ftp->remove(u"a.jpp"_s));
        EXPECT_FALSE(fs::exists(there / "a.jpp"));
        EXPECT_FALSE(ftp->remove(u"a.jpp"_s));
        EXPECT_TRUE(ftp->lastResponse().startsWith(u"550"_s));
        EXPECT_FALSE(ftp->get(u"a.jpp"_s, toHostPath(local.path()) / "never"));
        EXPECT_FALSE(fs::exists(toHostPath(local.path()) / "never"));
        EXPECT_TRUE(ftp->setCurrentDirectory(u"/"_s));
        EXPECT_EQ(ftp->currentDirectory().value(), u"/"_s);
    }
    EXPECT_FALSE(lab.ftpLog().contains("TYPE I"));
}

TEST_F(FtpTest, SendsHebrewNamesAsBytesOfTheCodePageAndReadsThemBack) {
    auto ftp = connect(lab.ftpHost());
    ASSERT_TRUE(ftp);
    const QString folder = u"הזמנה 7"_s;
    ASSERT_TRUE(ftp->makeDirectory(folder));
    ASSERT_TRUE(ftp->setCurrentDirectory(folder));
    EXPECT_EQ(ftp->currentDirectory().value(), u"/zalamim234/"_s + folder);
    ASSERT_TRUE(ftp->put(file("x", "x"), u"שלום.txt"_s));
    EXPECT_TRUE(fs::exists(lab.ordersFolder() / "\xe4\xe6\xee\xf0\xe4 7" / "\xf9\xec\xe5\xed.txt"));
    EXPECT_EQ(names(*ftp->list(u"*.*"_s)), (std::vector<std::string>{"שלום.txt"}));
}

TEST_F(FtpTest, RefusesANameWithALineBreakBeforeAnythingIsSent) {
    TcpRelay relay(lab.ftpPort());
    auto ftp = connect(relay.host());
    ASSERT_TRUE(ftp);
    const auto before = relay.commands();
    for (const QString& name : {u"x\r\nMKD y"_s, u"x\ny"_s, u"a"_s + QChar(0)}) {
        EXPECT_FALSE(ftp->makeDirectory(name));
        EXPECT_FALSE(ftp->put(file("x", "x"), name));
        EXPECT_FALSE(ftp->list(name));
    }
    EXPECT_EQ(relay.commands(), before);
    EXPECT_TRUE(ftp->currentDirectory());
}

TEST_F(FtpTest, TellsARefusedLoginInTheServersWordsAndNeverThePassword) {
    const auto refused = internet.connectFtp(lab.ftpHost(), LabServers::user(), u"wr0ng-pass"_s, DataChannel::Passive);
    ASSERT_FALSE(refused);
    EXPECT_EQ(refused.failure().kind, Failure::Kind::Refused);
    EXPECT_TRUE(refused.failure().message.contains(u"530"_s)) << refused.failure().message.toStdString();
    EXPECT_FALSE(refused.failure().message.contains(u"wr0ng"_s));
}

TEST_F(FtpTest, FailsAtOnceWhereNobodyListensAndWithinTheLimitWhereNobodyAnswers) {
    const auto closed = internet.connectFtp(u"127.0.0.1:%1"_s.arg(FreePort()), LabServers::user(),
                                            LabServers::password(), DataChannel::Passive);
    ASSERT_FALSE(closed);
    EXPECT_EQ(closed.failure().kind, Failure::Kind::Disconnected);
    TcpRelay relay(lab.ftpPort());
    relay.setFaults({.delayReplies = std::chrono::milliseconds(1500)});
    const auto mute =
        internet.connectFtp(relay.host(), LabServers::user(), LabServers::password(), DataChannel::Passive);
    ASSERT_FALSE(mute);
    EXPECT_EQ(mute.failure().kind, Failure::Kind::TimedOut);
}

TEST_F(FtpTest, FallsBackToPasvWhereEpsvIsRefused) {
    TcpRelay relay(lab.ftpPort());
    relay.setFaults({.command = "EPSV", .reply = "500 Unknown command"});
    auto ftp = connect(relay.host());
    ASSERT_TRUE(ftp);
    ASSERT_TRUE(ftp->put(file("x", "x"), u"x.jpp"_s));
    EXPECT_TRUE(ftp->list(u"*.*"_s));
    EXPECT_EQ(relay.commands().count("EPSV"), 1);
    EXPECT_EQ(relay.commands().count("PASV"), 2);
}

// What a put answers to each fault of the line; where the server can still tell of a cut, it is the server that
// refuses. A fresh connection is good again behind each.
TEST_F(FtpTest, FailsAPutWhateverBreaksIt) {
    const struct {
        const char* name;
        TcpRelay::Faults faults;
        Failure::Kind kind;
        int bytes;
    } cases[] = {
        {"cut in the middle", {.cutDataAfter = 300'000, .times = 1}, Failure::Kind::Refused, 3'000'000},
        {"cut behind what fits the buffers", {.cutDataAfter = 100, .times = 1}, Failure::Kind::Refused, 5'000},
        {"stalled", {.stallDataAfter = 300'000, .times = 1}, Failure::Kind::TimedOut, 9'000'000},
        {"closing reply lost", {.loseClosingReply = true, .times = 1}, Failure::Kind::Disconnected, 5'000},
        {"put refused", {.command = "STOR", .reply = "552 Quota exceeded", .times = 1}, Failure::Kind::Refused, 5'000},
        {"too many", {.command = "STOR", .reply = "421 Too many", .times = 1}, Failure::Kind::Refused, 5'000},
        {"control cut", {.command = "STOR", .cutAtCommand = true, .times = 1}, Failure::Kind::Disconnected, 5'000},
    };
    for (const auto& each : cases) {
        SCOPED_TRACE(each.name);
        TcpRelay relay(lab.ftpPort());
        relay.setFaults(each.faults);
        auto ftp = connect(relay.host());
        ASSERT_TRUE(ftp);
        const QByteArray bytes = anyBytes(each.bytes);
        QElapsedTimer waiting;
        waiting.start();
        const QString name = QString::fromLatin1(each.name) + u".jpp"_s;
        const auto sent = ftp->put(file("x", bytes), name);
        EXPECT_FALSE(sent);
        EXPECT_EQ(relay.faultsMade(), 1);
        if (sent)
            continue;
        EXPECT_EQ(sent.failure().kind, each.kind) << sent.failure().message.toStdString();
        EXPECT_LT(waiting.elapsed(), 20'000);

        ftp = connect(relay.host());
        ASSERT_TRUE(ftp);
        const QString second = u"2"_s + name;
        ASSERT_TRUE(ftp->put(file("x", bytes), second));
        EXPECT_TRUE(contentOf(lab.ordersFolder() / toHostPath(second)) == bytes);
    }
}

TEST_F(FtpTest, TakesAReplyThatComesLateAndAConnectionThatIsRefusedOnce) {
    TcpRelay relay(lab.ftpPort());
    relay.setFaults({.delayReplies = std::chrono::milliseconds(100)});
    auto ftp = connect(relay.host());
    ASSERT_TRUE(ftp);
    EXPECT_TRUE(ftp->put(file("x", "x"), u"late.jpp"_s));
    relay.setFaults({.refuseConnections = true, .times = 1});
    EXPECT_FALSE(internet.connectFtp(relay.host(), LabServers::user(), LabServers::password(), DataChannel::Passive));
    EXPECT_TRUE(internet.connectFtp(relay.host(), LabServers::user(), LabServers::password(), DataChannel::Passive));
}

TEST_F(FtpTest, MissesALocalFileBeforeItAsksTheServer) {
    auto ftp = connect(lab.ftpHost());
    ASSERT_TRUE(ftp);
    const auto missing = ftp->put(toHostPath(local.path()) / "no.jpp", u"no.jpp"_s);
    ASSERT_FALSE(missing);
    EXPECT_EQ(missing.failure().kind, Failure::Kind::NotFound);
    EXPECT_TRUE(ftp->list(u"*.*"_s)->empty());
}

TEST(SecondKindOfFtpServer, TakesTheSameCalls) {
    SecondFtpServer server;
    ASSERT_TRUE(server.running()) << server.failure().toStdString();
    QTemporaryDir local;
    PocoInternet internet(shortLimits());
    auto opened = internet.connectFtp(server.ftpHost(), SecondFtpServer::user(), SecondFtpServer::password(),
                                      DataChannel::Passive);
    ASSERT_TRUE(opened) << opened.failure().message.toStdString();
    FtpConnection& ftp = **opened;
    EXPECT_EQ(ftp.currentDirectory().value(), u"/"_s);
    ASSERT_TRUE(ftp.makeDirectory(u"zalamim234"_s));
    ASSERT_TRUE(ftp.setCurrentDirectory(u"zalamim234"_s));
    EXPECT_TRUE(ftp.list(u"*.*"_s)->empty());
    // This kind turns CR LF into LF on arrival, so only bytes without a line end of two are compared.
    QByteArray bytes = anyBytes(2'000'000);
    bytes.replace('\r', 'r');
    const HostPath source = toHostPath(local.path()) / "a";
    std::ofstream(source, std::ios::binary).write(bytes.constData(), bytes.size());
    const auto sent = ftp.put(source, u"no  ending"_s);
    ASSERT_TRUE(sent) << sent.failure().message.toStdString();
    EXPECT_TRUE(contentOf(server.account() / "zalamim234" / "no  ending") == bytes);
    const auto entries = ftp.list(u"*.*"_s);
    ASSERT_EQ(entries->size(), 1U);
    EXPECT_EQ(entries->front().name, u"no  ending"_s);
    EXPECT_FALSE(ftp.remove(u"missing"_s));
    EXPECT_TRUE(ftp.remove(u"no  ending"_s));
}

} // namespace
} // namespace lumora
