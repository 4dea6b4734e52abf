#include "platform/line/PocoInternet.h"
#include "support/LabServers.h"
#include "support/TcpRelay.h"

#include <Poco/Exception.h>
#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/SocketAddress.h>
#include <Poco/Net/StreamSocket.h>

#include <QFile>
#include <QTemporaryDir>
#include <QTimer>

#include <gtest/gtest.h>

#include <fstream>
#include <thread>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

class HttpTest : public ::testing::Test {
protected:
    QTemporaryDir local;
    LabServers lab;
    PocoInternet internet{TimeLimits{Poco::Timespan(2, 0), Poco::Timespan(0, 700'000)}};
    HostPath target = toHostPath(local.path()) / "page";

    void SetUp() override { ASSERT_TRUE(lab.running()) << lab.failure().toStdString(); }
};

TEST_F(HttpTest, SendsTheAddressAsItStands) {
    const QString script = lab.site() + u"/aaaqamootreport/padd.asp"_s;
    const auto answer = internet.fetch(script + u"?k1=tarvelmond&t1=a b&t3=Pratim: דנה\r\nלוי&t5=50%&t2=x#y+\"z\""_s);
    ASSERT_TRUE(answer) << answer.failure().message.toStdString();
    EXPECT_EQ(*answer, QByteArray("OK\r\n"));
    EXPECT_EQ(lab.requests(1).value(0), QByteArray("GET /aaaqamootreport/padd.asp?k1=tarvelmond&t1=a%20b&t3=Pratim:%20"
                                                   "\xe3\xf0\xe4%20%20\xec\xe5\xe9&t5=50%&t2=x#y+\"z\" HTTP/1.1"));
    EXPECT_TRUE(lab.reports().value(0).startsWith("REPORT k1=tarvelmond | t1=a b | t2=x"));
}

TEST_F(HttpTest, GivesTheBodyWhateverTheStatusButDownloadsOnlyAGoodAnswer) {
    const QString absent = lab.site() + u"/aaaqamootreport/padd.aspc.txt"_s;
    const auto page = internet.fetch(absent);
    ASSERT_TRUE(page);
    EXPECT_TRUE(page->contains("404"));
    const auto refused = internet.download(absent, target);
    ASSERT_FALSE(refused);
    EXPECT_EQ(refused.failure().kind, Failure::Kind::Refused);
    EXPECT_FALSE(std::filesystem::exists(target));
    ASSERT_TRUE(internet.download(lab.site() + u"/aaasssppp/p.asp?t1=x&t2=true"_s, target));
    QFile file(toText(target));
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    EXPECT_EQ(file.readAll(), QByteArray("OK\r\n"));
}

TEST_F(HttpTest, FailsClearlyWhereThereIsNoAnswer) {
    const std::pair<QString, Failure::Kind> cases[] = {
        {u"https://127.0.0.1/x"_s, Failure::Kind::Unsupported},
        {u"ftp://127.0.0.1/x"_s, Failure::Kind::Unsupported},
        {u"http:///x"_s, Failure::Kind::Unsupported},
        {QString(), Failure::Kind::Unsupported},
        {u"http://127.0.0.1:%1/x"_s.arg(FreePort()), Failure::Kind::Disconnected},
    };
    for (const auto& [url, kind] : cases) {
        const auto answer = internet.fetch(url);
        ASSERT_FALSE(answer) << url.toStdString();
        EXPECT_EQ(answer.failure().kind, kind) << answer.failure().message.toStdString();
    }
}

TEST_F(HttpTest, LeavesNoFileOfAnAnswerThatWasCutOrStoodStill) {
    TcpRelay relay(lab.httpPort(), TcpRelay::Kind::Plain);
    const QString url = u"http://%1/nothing"_s.arg(relay.host());
    relay.setFaults({.cutDataAfter = 40, .times = 1});
    EXPECT_FALSE(internet.download(url, target));
    relay.setFaults({.stallDataAfter = 40, .times = 1});
    const auto stalled = internet.fetch(url);
    ASSERT_FALSE(stalled);
    EXPECT_EQ(stalled.failure().kind, Failure::Kind::TimedOut) << stalled.failure().message.toStdString();
    EXPECT_TRUE(std::filesystem::is_empty(toHostPath(local.path())));
}

TEST_F(HttpTest, LeavesNoFileOfAnAnswerThatNeverEnds) {
    Poco::Net::ServerSocket server(Poco::Net::SocketAddress("127.0.0.1", 0));
    std::thread endless([&] {
        Poco::Net::StreamSocket line = server.acceptConnection();
        std::vector<char> block(1024 * 1024, 'x');
        line.receiveBytes(block.data(), static_cast<int>(block.size()));
        const std::string head = "HTTP/1.1 200 OK\r\n\r\n";
        line.sendBytes(head.data(), static_cast<int>(head.size()));
        try {
            for (;;)
                line.sendBytes(block.data(), static_cast<int>(block.size()));
        } catch (const Poco::Exception&) { // the other side has had enough
        }
    });
    const auto answer = internet.download(u"http://127.0.0.1:%1/x"_s.arg(server.address().port()), target);
    endless.join();
    ASSERT_FALSE(answer);
    EXPECT_EQ(answer.failure().kind, Failure::Kind::TooLarge) << answer.failure().message.toStdString();
    EXPECT_TRUE(std::filesystem::is_empty(toHostPath(local.path())));
}

TEST_F(HttpTest, LetsQueuedPaintingRunButNoTimerWhileItWaits) {
    TcpRelay relay(lab.httpPort(), TcpRelay::Kind::Plain);
    relay.setFaults({.stallDataAfter = 0, .times = 1});
    QObject page;
    bool painted = false;
    bool ticked = false;
    QMetaObject::invokeMethod(
        &page, [&] { painted = true; }, Qt::QueuedConnection);
    QTimer::singleShot(50, &page, [&] { ticked = true; });
    EXPECT_FALSE(internet.fetch(u"http://%1/x"_s.arg(relay.host())));
    EXPECT_TRUE(painted);
    EXPECT_FALSE(ticked);
}

} // namespace
} // namespace lumora
