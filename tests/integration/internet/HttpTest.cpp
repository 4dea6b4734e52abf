#include "platform/QtEventPump.h"
#include "platform/line/PocoInternet.h"
#include "support/LabServers.h"
#include "support/ScriptedServer.h"

#include <QElapsedTimer>
#include <QTemporaryDir>
#include <QTimer>

#include <gtest/gtest.h>

#include <array>
#include <functional>
#include <mutex>
#include <vector>

namespace lumora {
namespace {

// Answers each connection with the next of its texts and ends it.
class ScriptedWeb {
public:
    explicit ScriptedWeb(QByteArrayList answers)
        : m_answers(std::move(answers)) {}
    QString site() const { return u"http://127.0.0.1:%1"_s.arg(m_server.port()); }
    // The requests so far, whole.
    QByteArrayList requests() const {
        const std::lock_guard lock(m_mutex);
        return m_requests;
    }

private:
    void answer(Poco::Net::StreamSocket& line) {
        QByteArray request;
        std::array<char, 4096> part;
        while (!whole(request)) {
            const int count = line.receiveBytes(part.data(), static_cast<int>(part.size()));
            if (count <= 0)
                break;
            request.append(part.data(), count);
        }
        const std::lock_guard lock(m_mutex);
        const QByteArray answer = m_answers.value(m_requests.size(), m_answers.last());
        m_requests += request;
        line.sendBytes(answer.constData(), static_cast<int>(answer.size()));
    }
    static bool whole(const QByteArray& request) {
        const qsizetype end = request.indexOf("\r\n\r\n");
        return end >= 0 && (!request.startsWith("POST") || request.endsWith("body"));
    }

    mutable std::mutex m_mutex;
    QByteArrayList m_answers;
    QByteArrayList m_requests;
    ScriptedServer m_server{[this](Poco::Net::StreamSocket& line) { answer(line); }};
};

// Answers with these bytes of an answer, and then cuts the line or stands still until the other side ends it.
enum class Then { Cut, StandStill };
std::function<void(Poco::Net::StreamSocket&)> answering(const QByteArray& bytes, Then then) {
    return [=](Poco::Net::StreamSocket& line) {
        std::array<char, 4096> part;
        line.receiveBytes(part.data(), static_cast<int>(part.size()));
        line.sendBytes(bytes.constData(), static_cast<int>(bytes.size()));
        line.setReceiveTimeout(Poco::Timespan(60, 0));
        while (then == Then::StandStill && line.receiveBytes(part.data(), static_cast<int>(part.size())) > 0) {
        }
        line.setLinger(true, 0);
    };
}

QString addressOf(const ScriptedServer& server) {
    return u"http://127.0.0.1:%1/x"_s.arg(server.port());
}

QByteArray redirect(int status, const QByteArray& location) {
    return "HTTP/1.1 " + QByteArray::number(status) + " Moved\r\nLocation: " + location +
           "\r\nContent-Length: 5\r\n\r\nmoved";
}

class HttpTest : public ::testing::Test {
protected:
    QTemporaryDir local;
    LabServers lab;
    PocoInternet internet;
    PocoInternet brief{TimeLimits{Poco::Timespan(30, 0), Poco::Timespan(0, 700'000)}}; // for an answer that never ends
    HostPath target = toHostPath(local.path()) / "page";

    void SetUp() override { ASSERT_TRUE(lab.running()) << lab.failure().toStdString(); }
};

TEST_F(HttpTest, SendsTheAddressAsItStands) {
    const QString script = lab.site() + u"/aaaqamootreport/padd.asp"_s;
    const auto answer = internet.fetch(script + u"?k1=tarvelmond&t1=a b&t3=Pratim: דנה\r\nלוי&t5=50%&t2=x#y+\"z\""_s);
    ASSERT_TRUE(answer) << answer.failure().message.toStdString();
    EXPECT_EQ(answer->body, QByteArray("OK\r\n"));
    EXPECT_EQ(lab.requests(1).value(0), QByteArray("GET /aaaqamootreport/padd.asp?k1=tarvelmond&t1=a%20b&t3=Pratim:%20"
                                                   "\xe3\xf0\xe4%20%20\xec\xe5\xe9&t5=50%&t2=x#y+\"z\" HTTP/1.1"));
    EXPECT_TRUE(lab.reports().value(0).startsWith("REPORT k1=tarvelmond | t1=a b | t2=x"));
}

TEST_F(HttpTest, GivesTheBodyWhateverTheStatusButDownloadsOnlyAGoodAnswer) {
    const QString absent = lab.site() + u"/aaaqamootreport/padd.aspc.txt"_s;
    const auto page = internet.fetch(absent);
    ASSERT_TRUE(page);
    EXPECT_EQ(page->status, 404);
    EXPECT_TRUE(page->body.contains("404"));
    const auto refused = internet.download(absent, target);
    ASSERT_FALSE(refused);
    EXPECT_EQ(refused.failure().kind, Failure::Kind::Refused);
    EXPECT_FALSE(std::filesystem::exists(target));
    const QString good = lab.site() + u"/aaasssppp/p.asp?t1=x&t2=true"_s;
    const auto inTheWay = internet.download(good, toHostPath(local.path()));
    ASSERT_FALSE(inTheWay);
    EXPECT_EQ(inTheWay.failure().kind, Failure::Kind::Other) << "a trouble of this computer";
    ASSERT_TRUE(internet.download(good, target));
    EXPECT_EQ(contentOf(target), QByteArray("OK\r\n"));
}

TEST_F(HttpTest, FailsClearlyWhereThereIsNoAnswer) {
    const std::pair<QString, Failure::Kind> cases[] = {
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

TEST_F(HttpTest, LeavesNoFileOfAnAnswerThatIsCutOrStandsStillOrNeverEnds) {
    const QByteArray half = "HTTP/1.1 200 OK\r\nContent-Length: 100\r\n\r\nhalf";
    const ScriptedServer cuts(answering(half, Then::Cut));
    EXPECT_FALSE(internet.download(addressOf(cuts), target));
    const ScriptedServer standsStill(answering(half, Then::StandStill));
    const auto stalled = brief.download(addressOf(standsStill), target);
    ASSERT_FALSE(stalled);
    EXPECT_EQ(stalled.failure().kind, Failure::Kind::TimedOut) << stalled.failure().message.toStdString();
    const ScriptedServer endless([](Poco::Net::StreamSocket& line) {
        std::vector<char> block(1024 * 1024, 'x');
        line.receiveBytes(block.data(), static_cast<int>(block.size()));
        line.sendBytes("HTTP/1.1 200 OK\r\n\r\n", 19);
        for (;;)
            line.sendBytes(block.data(), static_cast<int>(block.size()));
    });
    const auto large = internet.download(addressOf(endless), target);
    ASSERT_FALSE(large);
    EXPECT_EQ(large.failure().kind, Failure::Kind::TooLarge) << large.failure().message.toStdString();
    EXPECT_TRUE(std::filesystem::is_empty(toHostPath(local.path())));
}

TEST_F(HttpTest, FollowsRedirectsToTheSameHostAndTakesNoAnswerThatIsShort) {
    const QByteArray there = "HTTP/1.1 200 OK\r\nContent-Length: 5\r\n\r\nthere";
    const struct {
        const char* name;
        bool post;
        QByteArrayList answers; // the last one again and again
        const char* body;       // null: a failure
        int requests;
        const char* last; // how the last request begins
    } cases[] = {
        {"301", false, {redirect(301, "/new?a=1"), there}, "there", 2, "GET /new?a=1 HTTP/1.1\r\n"},
        {"302, beside it", false, {redirect(302, "new"), there}, "there", 2, "GET /a/new HTTP/1.1\r\n"},
        {"302, twice beside it", false, {redirect(302, "new"), redirect(302, "b/c"), there}, "there", 3, "GET /a/b/c "},
        {"307", false, {redirect(307, "/new"), there}, "there", 2, "GET /new "},
        {"five", false, QByteArrayList(5, redirect(301, "/new")) << there, "there", 6, "GET /new "},
        {"without end", false, {redirect(301, "/new")}, nullptr, 6, "GET /new "},
        {"another host", false, {redirect(302, "http://192.0.2.1/new")}, "moved", 1, "GET /a/b "},
        {"another scheme", false, {redirect(302, "https://127.0.0.1/new")}, "moved", 1, "GET /a/b "},
        {"POST 301", true, {redirect(301, "/new"), there}, nullptr, 1, "POST /a/b "},
        {"POST 302", true, {redirect(302, "/new"), there}, nullptr, 1, "POST /a/b "},
        {"POST 307", true, {redirect(307, "/new"), there}, "there", 2, "POST /new "},
        {"POST 308", true, {redirect(308, "/new"), there}, "there", 2, "POST /new "},
        {"POST 308 elsewhere", true, {redirect(308, "http://192.0.2.1/new")}, nullptr, 1, "POST /a/b "},
        {"short", false, {"HTTP/1.1 200 OK\r\nContent-Length: 100\r\n\r\nhalf"}, nullptr, 1, "GET /a/b "},
        {"POST 500", true, {"HTTP/1.1 500 Error\r\nContent-Length: 3\r\n\r\nbad"}, "bad", 1, "POST /a/b "},
        {"POST short", true, {"HTTP/1.1 200 OK\r\nContent-Length: 100\r\n\r\nhalf"}, nullptr, 1, "POST /a/b "},
    };
    for (const auto& each : cases) {
        SCOPED_TRACE(each.name);
        ScriptedWeb web(each.answers);
        PostRequest request;
        request.body = "the body";
        const QString url = web.site() + u"/a/b?c"_s;
        const auto answer = each.post ? internet.post(url, request) : internet.fetch(url);
        EXPECT_EQ(answer.ok(), each.body != nullptr);
        EXPECT_TRUE(!answer || answer->body == each.body);
        ASSERT_EQ(web.requests().size(), each.requests);
        QByteArray last = web.requests().last();
        EXPECT_TRUE(last.replace("?c ", " ").startsWith(each.last)) << last.toStdString();
        EXPECT_TRUE(!each.post || last.endsWith("the body"));
    }
}

TEST_F(HttpTest, TellsALengthByHead) {
    const struct {
        QByteArray answer;
        std::optional<qint64> length;
    } cases[] = {{"HTTP/1.1 200 OK\r\nContent-Length: 9424170000\r\n\r\n", 9424170000},
                 {"HTTP/1.1 200 OK\r\n\r\n", std::nullopt},
                 {"HTTP/1.1 405 Not Allowed\r\nContent-Length: 9\r\n\r\n", std::nullopt}};
    for (const auto& each : cases) {
        ScriptedWeb web({each.answer});
        const auto length = internet.contentLength(web.site() + u"/x"_s);
        ASSERT_TRUE(length) << length.failure().message.toStdString();
        EXPECT_EQ(*length, each.length);
        EXPECT_TRUE(web.requests().first().startsWith("HEAD /x HTTP/1.1\r\n"));
    }
    ScriptedWeb web({"HTTP/1.1 404 Not Found\r\nContent-Length: 9\r\n\r\n"});
    EXPECT_EQ(internet.contentLength(web.site() + u"/x"_s).failure().kind, Failure::Kind::NotFound);
}

TEST_F(HttpTest, AnAbortEndsACall) {
    QtEventPump pump;
    internet.pumpWhileWaiting(&pump);
    const ScriptedServer server(answering("HTTP/1.1 2", Then::StandStill));
    for (const bool post : {false, true}) {
        QElapsedTimer waiting;
        QTimer aborting;
        aborting.callOnTimeout([&] {
            aborting.stop();
            waiting.start();
            internet.abort();
        });
        aborting.start(300);
        EXPECT_FALSE(post ? internet.post(addressOf(server), {}) : internet.fetch(addressOf(server)));
        ASSERT_TRUE(waiting.isValid()) << "it ended before the abort";
        EXPECT_LT(waiting.elapsed(), 15'000); // the limits themselves are far longer
    }
}

TEST_F(HttpTest, LetsQueuedPaintingRunButNoTimerWhileItWaits) {
    const ScriptedServer server(answering({}, Then::StandStill));
    QObject page;
    bool painted = false;
    bool ticked = false;
    QMetaObject::invokeMethod(
        &page, [&] { painted = true; }, Qt::QueuedConnection);
    QTimer::singleShot(50, &page, [&] { ticked = true; });
    EXPECT_FALSE(brief.fetch(addressOf(server)));
    EXPECT_TRUE(painted);
    EXPECT_FALSE(ticked);
}

} // namespace
} // namespace lumora
