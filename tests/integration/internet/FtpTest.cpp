#include "common/HostFile.h"
#include "platform/QtEventPump.h"
#include "platform/line/PocoInternet.h"
#include "support/FakeLab.h"
#include "support/LabServers.h"
#include "support/Take.h"

#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>

#include <QElapsedTimer>
#include <QProcess>
#include <QTemporaryDir>
#include <QTimer>

#include <gtest/gtest.h>

#include <list>

namespace lumora {
namespace {

namespace fs = std::filesystem;
using DataChannel = Internet::DataChannel;

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

HostPath write(const QTemporaryDir& folder, const char* name, const QByteArray& bytes) {
    const HostPath path = toHostPath(folder.path()) / name;
    EXPECT_TRUE(writeWholeFile(path, bytes));
    return path;
}

// --- What every connection must keep, that of the fake lab too ---

// Host, user, password and folder of a running server; tests/matrix/run gives each of its own.
constexpr const char* givenServer = "LUMORA_FTP_SERVER";
// A PEM file of authorities where that server encrypts.
constexpr const char* givenAuthorities = "LUMORA_FTP_CA";

struct Lab {
    enum class Server { Fake, Lab, Given };
    const char* name;
    Server server = Server::Lab;
    FtpType type = FtpType::Image;
};

void PrintTo(const Lab& lab, std::ostream* out) {
    *out << lab.name;
}

class FtpContract : public ::testing::TestWithParam<Lab> {
protected:
    void SetUp() override {
        switch (GetParam().server) {
        case Lab::Server::Fake:
            fake.folders[u"zalamim234"_s];
            login = {u"fake"_s, LabServers::user(), LabServers::password()};
            break;
        case Lab::Server::Lab:
            labServers.emplace();
            ASSERT_TRUE(labServers->running()) << labServers->failure().toStdString();
            login = {labServers->ftpHost(), LabServers::user(), LabServers::password()};
            account = labServers->account();
            break;
        case Lab::Server::Given:
            login = qEnvironmentVariable(givenServer).split(u' ', Qt::SkipEmptyParts);
            ASSERT_EQ(login.size(), 4);
            account = toHostPath(login[3]);
            for (const auto& left : fs::directory_iterator(account / "zalamim234"))
                fs::remove_all(left.path());
            break;
        }
    }

    bool isFake() const { return GetParam().server == Lab::Server::Fake; }
    Result<std::unique_ptr<FtpConnection>> connect(DataChannel channel, const QString& password = {}) {
        Internet& line = isFake() ? static_cast<Internet&>(fake) : internet;
        return line.connectFtp(login[0], login[1], password.isEmpty() ? login[2] : password, channel);
    }
    QByteArray stored(const QString& folder, const char* name) {
        if (isFake())
            return fake.folders[folder].contains(QLatin1String(name)) ? fake.folders[folder][QLatin1String(name)]
                                                                      : QByteArray("<absent>");
        return contentOf(account / toHostPath(folder) / name);
    }

    QTemporaryDir local;
    FakeLab fake;
    QString authorities = GetParam().server == Lab::Server::Given ? qEnvironmentVariable(givenAuthorities) : QString();
    PocoInternet internet{
        TimeLimits(), GetParam().type, {authorities.isEmpty() ? FtpTls::None : FtpTls::Explicit, authorities}};
    std::optional<LabServers> labServers;
    QStringList login;
    HostPath account;
};

std::map<QString, std::optional<qint64>> filesOf(const FtpListing& listing) {
    std::map<QString, std::optional<qint64>> files;
    for (const FtpEntry& entry : listing.entries) {
        if (entry.name != u"."_s && entry.name != u".."_s)
            files[entry.name] = entry.length;
    }
    return files;
}

void expectRefused(const Result<void>& answer, const FtpConnection& ftp) {
    ASSERT_FALSE(answer);
    EXPECT_EQ(answer.failure().kind, Failure::Kind::Refused) << answer.failure().message.toStdString();
    EXPECT_TRUE(answer.failure().message.contains(u"550"_s)) << answer.failure().message.toStdString();
    EXPECT_TRUE(ftp.lastResponse().startsWith(u"550"_s)) << ftp.lastResponse().toStdString();
}

TEST_P(FtpContract, WalksMakesPutsListsMeasuresGetsAndDeletes) {
    for (const DataChannel channel : {DataChannel::Passive, DataChannel::Active}) {
        const auto connected = take(connect(channel));
        FtpConnection& ftp = *connected;
        EXPECT_EQ(take(ftp.currentDirectory()), u"/"_s);
        ASSERT_TRUE(ftp.setCurrentDirectory(u"zalamim234"_s));
        EXPECT_EQ(take(ftp.currentDirectory()), u"/zalamim234"_s);
        const QString order = channel == DataChannel::Passive ? u"2026_11_21_KUP^105"_s : u"2026_11_21_KUP^106"_s;
        const QString there = u"zalamim234/"_s + order;
        ASSERT_TRUE(ftp.makeDirectory(order));
        expectRefused(ftp.makeDirectory(order), ftp);
        expectRefused(ftp.setCurrentDirectory(u"nowhere"_s), ftp);
        ASSERT_TRUE(ftp.setCurrentDirectory(order));
        for (const EmptyFolder empty : {EmptyFolder::IsListed, EmptyFolder::MayBeRefused})
            EXPECT_TRUE(filesOf(take(ftp.list(u"*.*"_s, empty))).empty());

        const QByteArray bytes = anyBytes(3'000'000);
        ASSERT_TRUE(ftp.put(write(local, "x", bytes.left(10'000)), u"a b.jpp"_s));
        EXPECT_EQ(take(ftp.length(u"a b.jpp"_s)), 10'000);
        const auto sent = ftp.put(write(local, "x", bytes), u"a b.jpp"_s);
        ASSERT_TRUE(sent) << sent.failure().message.toStdString();
        ASSERT_TRUE(ftp.put(write(local, "x", QByteArray()), u"empty"_s));
        EXPECT_TRUE(stored(there, "a b.jpp") == bytes);
        EXPECT_EQ(stored(there, "empty"), QByteArray());
        EXPECT_EQ(ftp.put(toHostPath(local.path()) / "no", u"no"_s).failure().kind, Failure::Kind::NotFound);

        const auto listed = ftp.list(u"*.*"_s);
        EXPECT_EQ(listed->unread, QString());
        EXPECT_EQ(filesOf(*listed),
                  (std::map<QString, std::optional<qint64>>{{u"a b.jpp"_s, bytes.size()}, {u"empty"_s, 0}}));
        EXPECT_EQ(take(ftp.length(u"a b.jpp"_s)), bytes.size());
        EXPECT_EQ(take(ftp.length(u"none"_s)), std::nullopt);

        const HostPath back = toHostPath(local.path()) / "back";
        ASSERT_TRUE(ftp.get(u"a b.jpp"_s, back));
        // The bytes may come as text does, with line ends of two bytes.
        EXPECT_TRUE(contentOf(back) == bytes || GetParam().type == FtpType::Ascii);
        ASSERT_TRUE(ftp.getExact(u"a b.jpp"_s, back));
        EXPECT_EQ(contentOf(back), bytes);
        expectRefused(ftp.get(u"none"_s, toHostPath(local.path()) / "never"), ftp);
        EXPECT_FALSE(fs::exists(toHostPath(local.path()) / "never"));
        ASSERT_TRUE(ftp.remove(u"a b.jpp"_s));
        EXPECT_EQ(stored(there, "a b.jpp"), QByteArray("<absent>"));
        expectRefused(ftp.remove(u"a b.jpp"_s), ftp);
        ASSERT_TRUE(ftp.setCurrentDirectory(u"/"_s));
        EXPECT_EQ(take(ftp.currentDirectory()), u"/"_s);
        ASSERT_TRUE(ftp.setCurrentDirectory(u"/zalamim234"_s));
        EXPECT_EQ(take(ftp.currentDirectory()), u"/zalamim234"_s);
        EXPECT_TRUE(!labServers ||
                    labServers->ftpLog().contains(GetParam().type == FtpType::Ascii ? "TYPE A" : "TYPE I"));
    }
}

TEST_P(FtpContract, KeepsNamesOfTheCodePageAndRefusesAWrongPasswordAndANameWithALineBreak) {
    const auto connected = take(connect(DataChannel::Passive));
    FtpConnection& ftp = *connected;
    ASSERT_TRUE(ftp.setCurrentDirectory(u"zalamim234"_s));
    for (const QString& name : {u"x\r\nMKD y"_s, u"x\ny"_s, u"a"_s + QChar(0)}) {
        EXPECT_FALSE(ftp.makeDirectory(name));
        EXPECT_FALSE(ftp.put(write(local, "x", "x"), name));
        EXPECT_FALSE(ftp.list(name));
    }
    EXPECT_TRUE(filesOf(take(ftp.list(u"*.*"_s))).empty());
    ASSERT_TRUE(ftp.makeDirectory(u"הזמנה 7"_s));
    ASSERT_TRUE(ftp.setCurrentDirectory(u"הזמנה 7"_s));
    EXPECT_EQ(take(ftp.currentDirectory()), u"/zalamim234/הזמנה 7"_s);
    ASSERT_TRUE(ftp.put(write(local, "x", "x"), u"שלום.txt"_s));
    EXPECT_TRUE(filesOf(take(ftp.list(u"*.*"_s))).contains(u"שלום.txt"_s));
    EXPECT_TRUE(isFake() || stored(u"zalamim234"_s, "\xe4\xe6\xee\xf0\xe4 7/\xf9\xec\xe5\xed.txt") == "x");
    fake.refusedLogins = 1;
    const auto refused = connect(DataChannel::Passive, u"wr0ng-pass"_s);
    ASSERT_FALSE(refused);
    EXPECT_EQ(refused.failure().kind, Failure::Kind::Refused);
    EXPECT_TRUE(refused.failure().message.contains(u"530"_s)) << refused.failure().message.toStdString();
    EXPECT_FALSE(refused.failure().message.contains(u"wr0ng"_s));
}

TEST_P(FtpContract, AnAbortEndsTheConnectionsThatStandAndNoOther) {
    auto connected = take(connect(DataChannel::Passive));
    isFake() ? fake.abort() : internet.abort();
    EXPECT_FALSE(connected->list(u"*.*"_s));
    EXPECT_FALSE(connected->put(write(local, "x", "x"), u"x"_s));
    EXPECT_EQ(connected->length(u"x"_s).ok(), false);
    connected = take(connect(DataChannel::Passive));
    EXPECT_TRUE(connected->list(u"*.*"_s));
}

std::vector<Lab> labs() {
    if (qEnvironmentVariableIsSet(givenServer))
        return {{.name = "given", .server = Lab::Server::Given}};
    return {{.name = "fake", .server = Lab::Server::Fake},
            {.name = "vsftpd_A", .type = FtpType::Ascii},
            {.name = "vsftpd_I"}};
}

INSTANTIATE_TEST_SUITE_P(Labs, FtpContract, ::testing::ValuesIn(labs()),
                         [](const ::testing::TestParamInfo<Lab>& each) { return each.param.name; });

// --- A line with faults in front of the lab's server ---

class FaultyLine {
public:
    explicit FaultyLine(quint16 serverPort) {
        m_program.setProcessChannelMode(QProcess::ForwardedErrorChannel);
        m_program.start(QStringLiteral(LUMORA_FAULTY_LINE), {QString::number(serverPort)});
        m_port = toldNumber();
    }
    ~FaultyLine() {
        m_program.closeWriteChannel();
        m_program.waitForFinished(5'000);
    }
    QString host() const { return u"127.0.0.1:%1"_s.arg(m_port); }
    // A fault as that program takes it; empty: a good line. Returns how often the fault before has struck.
    int set(const QByteArray& fault) {
        m_program.write(fault + '\n');
        return toldNumber();
    }

private:
    int toldNumber() {
        while (!m_program.canReadLine()) {
            if (!m_program.waitForReadyRead(30'000))
                return -1;
        }
        return m_program.readLine().trimmed().toInt();
    }

    QProcess m_program;
    int m_port = 0;
};

class FtpTest : public ::testing::Test {
protected:
    QTemporaryDir local;
    LabServers lab;
    FaultyLine relay{lab.ftpPort()};
    PocoInternet internet;

    void SetUp() override { ASSERT_TRUE(lab.running()) << lab.failure().toStdString(); }

    std::unique_ptr<FtpConnection> connect(PocoInternet& line) {
        auto connection =
            take(line.connectFtp(relay.host(), LabServers::user(), LabServers::password(), DataChannel::Passive));
        EXPECT_TRUE(connection->setCurrentDirectory(u"zalamim234"_s));
        return connection;
    }
    std::unique_ptr<FtpConnection> connect() { return connect(internet); }
};

TEST_F(FtpTest, FailsAtOnceWhereNobodyListensAndWithinTheLimitWhereNobodyAnswers) {
    const auto closed = internet.connectFtp(u"127.0.0.1:%1"_s.arg(FreePort()), u"a"_s, u"b"_s, DataChannel::Passive);
    ASSERT_FALSE(closed);
    EXPECT_EQ(closed.failure().kind, Failure::Kind::Disconnected);
    relay.set("GREETING 1 late(3)");
    PocoInternet brief(TimeLimits{Poco::Timespan(30, 0), Poco::Timespan(0, 300'000)});
    const auto mute = brief.connectFtp(relay.host(), u"a"_s, u"b"_s, DataChannel::Passive);
    ASSERT_FALSE(mute);
    EXPECT_EQ(mute.failure().kind, Failure::Kind::TimedOut);
}

// What a put answers to each fault of the line; where the server can still tell of a cut, it is the server that
// refuses. A fresh connection is good again behind each.
TEST_F(FtpTest, FailsAPutWhateverBreaksIt) {
    const struct {
        const char* name;
        const char* fault;
        Failure::Kind kind;
        int bytes;
    } cases[] = {
        {"cut in the middle", "STOR 1 passed(cut=300_000)", Failure::Kind::Refused, 9'000'000},
        {"cut behind what fits the buffers", "STOR 1 passed(cut=100)", Failure::Kind::Refused, 5'000},
        {"stalled", "STOR 1 passed(stall=300_000)", Failure::Kind::TimedOut, 9'000'000},
        {"closing reply bad", "STOR 1 closing('451 Disk full')", Failure::Kind::Refused, 5'000},
        {"closing reply never comes", "STOR 1 hang_before_the_end", Failure::Kind::TimedOut, 5'000},
        {"cut with a good reply", "STOR 1 passed(cut=300_000, reset_server=False)", Failure::Kind::Disconnected,
         9'000'000},
        {"cut behind the last bytes, with a good reply", "STOR 1 passed(cut=100, reset_server=False)",
         Failure::Kind::Disconnected, 5'000},
    };
    // Long enough for a busy machine's server to let the client in, and short enough to wait for.
    PocoInternet shortOfPatience(TimeLimits{Poco::Timespan(30, 0), Poco::Timespan(3, 0)});
    for (const auto& each : cases) {
        SCOPED_TRACE(each.name);
        relay.set(each.fault);
        auto ftp = connect(each.kind == Failure::Kind::TimedOut ? shortOfPatience : internet);
        const QByteArray bytes = anyBytes(each.bytes);
        const QString name = QString::fromLatin1(each.name) + u".jpp"_s;
        const auto sent = ftp->put(write(local, "x", bytes), name);
        EXPECT_FALSE(sent);
        EXPECT_EQ(relay.set({}), 1);
        if (sent)
            continue;
        EXPECT_EQ(sent.failure().kind, each.kind) << sent.failure().message.toStdString();

        ftp = connect();
        const QString second = u"2"_s + name;
        ASSERT_TRUE(ftp->put(write(local, "x", bytes), second));
        EXPECT_TRUE(contentOf(lab.ordersFolder() / toHostPath(second)) == bytes);
    }
}

// That file opens, and can't be read at its beginning.
TEST_F(FtpTest, BreaksThePutOfAFileThatCantBeReadOn) {
    auto ftp =
        take(internet.connectFtp(lab.ftpHost(), LabServers::user(), LabServers::password(), DataChannel::Passive));
    EXPECT_TRUE(ftp->setCurrentDirectory(u"zalamim234"_s));
    EXPECT_FALSE(ftp->put("/proc/self/mem", u"x.jpp"_s));
    EXPECT_TRUE(lab.ftpLog().contains("FTP response: Client \"127.0.0.1\", \"426 ")) << lab.ftpLog().toStdString();
}

TEST_F(FtpTest, ReadsRepliesOfManyLinesThatComeLate) {
    relay.set("EACH 999 lambda session, line: time.sleep(0.03) or session.forward(line, answer=many_lines)");
    auto ftp = connect();
    ASSERT_TRUE(ftp->put(write(local, "x", "xx"), u"x.jpp"_s));
    EXPECT_EQ(take(ftp->list(u"*.*"_s)).entries.size(), 1U);
    EXPECT_EQ(take(ftp->currentDirectory()), u"/zalamim234"_s);
    EXPECT_FALSE(ftp->remove(u"none"_s));
    EXPECT_EQ(ftp->lastResponse().count(u'\n'), 4);
}

TEST_F(FtpTest, LetsABusyServerGreetLaterAndCountsFoldersFromItsHome) {
    relay.set("GREETING 1 lambda session, line: session.tell('120 In a moment')");
    EXPECT_TRUE(connect());
    fs::create_directory(lab.ordersFolder() / "below");
    relay.set("PWD 1 reply('257 \"/zalamim234\"')");
    auto ftp = connect();
    EXPECT_TRUE(ftp->setCurrentDirectory(u"/below"_s));
}

TEST_F(FtpTest, TellsARefusedListingFromAnEmptyFolderAndEncryptionFromAWrongPassword) {
    auto ftp = connect();
    for (const char* reply : {"550 No files found", "450 No files found", "426 Cut"}) {
        relay.set("LIST 2 reply('" + QByteArray(reply) + "')");
        EXPECT_FALSE(ftp->list(u"*.*"_s)) << reply;
        EXPECT_EQ(ftp->list(u"*.*"_s, EmptyFolder::MayBeRefused).ok(), reply[1] == '5') << reply;
    }
    relay.set("EPSV 1 reply('550 No port')");
    EXPECT_TRUE(ftp->list(u"*.*"_s, EmptyFolder::MayBeRefused));
    for (const char* reply : {"530 Non-anonymous sessions must use encryption.", "550 SSL/TLS required",
                              "534 Policy requires SSL", "421 Sorry, cleartext sessions are not accepted"}) {
        relay.set("USER 1 reply('" + QByteArray(reply) + "')");
        const auto refused = internet.connectFtp(relay.host(), u"ftp"_s, u"x"_s, DataChannel::Passive);
        ASSERT_FALSE(refused);
        EXPECT_EQ(refused.failure().kind, Failure::Kind::Unsupported) << reply;
        EXPECT_TRUE(refused.failure().message.startsWith(u"this server wants encryption"_s));
    }
}

// Each ends at once, by a click on the thread that waits.
TEST_F(FtpTest, AnAbortEndsEveryWait) {
    QtEventPump pump;
    internet.pumpWhileWaiting(&pump);
    const HostPath large = write(local, "x", anyBytes(9'000'000));
    // Its queue is full, so that a further connection is never made.
    Poco::Net::ServerSocket full;
    full.bind(Poco::Net::SocketAddress("127.0.0.1", 0));
    full.listen(0);
    std::list<Poco::Net::StreamSocket> queue(3);
    for (Poco::Net::StreamSocket& socket : queue)
        socket.connectNB(full.address());
    const auto reaches = [&](const QString& host) {
        return internet.connectFtp(host, u"a"_s, u"b"_s, DataChannel::Passive).ok();
    };
    const struct {
        const char* name;
        const char* fault;
        std::function<bool(FtpConnection&)> wait;
    } cases[] = {
        {"connect", "", [&](FtpConnection&) { return reaches(u"127.0.0.1:%1"_s.arg(full.address().port())); }},
        {"put", "STOR 1 passed(stall=300_000)",
         [&](FtpConnection& ftp) { return ftp.put(large, u"stalled.jpp"_s).ok(); }},
        {"list", "LIST 1 passed(stall=0)", [](FtpConnection& ftp) { return ftp.list(u"*.*"_s).ok(); }},
        {"closing reply", "STOR 1 hang_before_the_end",
         [&](FtpConnection& ftp) { return ftp.put(write(local, "y", "y"), u"held.jpp"_s).ok(); }},
        {"name server", "", [&](FtpConnection&) { return reaches(u"ftp.invalid"_s); }},
    };
    for (const auto& each : cases) {
        relay.set({});
        auto ftp = connect();
        relay.set(each.fault);
        QElapsedTimer waiting;
        QTimer aborting;
        aborting.callOnTimeout([&] {
            aborting.stop();
            waiting.start();
            internet.abort();
        });
        aborting.start(400);
        EXPECT_FALSE(each.wait(*ftp)) << each.name;
        if (waiting.isValid()) {
            EXPECT_LT(waiting.elapsed(), 15'000) << each.name; // the limits themselves are far longer
        } else {
            EXPECT_EQ(std::string(each.name), "name server") << "failed before the abort";
        }
    }
}

} // namespace
} // namespace lumora
