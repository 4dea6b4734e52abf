#include "PageLook.h"

#include "order/PrintFile.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/FakeWebLab.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/http/UploadForm.h"
#include "views/window/MainWindow.h"
#include "views/window/ScreenDialogs.h"

#include <QTest>

#include <functional>
#include <tuple>

namespace lumora {

namespace {

const QString orderName = u"2026_11_21_KUP_1234^105"_s;
const QString first = u"021015GNB0000_03AABB.jpp"_s;

// The two sending pages in each phase that a customer meets, reached over a lab in memory by what a customer, a clock
// and a line do.
class SendingLook : public PageLook {
protected:
    SendingLook()
        : walk(GetParam(),
               u"[Addresses]\nHttpHost = http://192.0.2.10\nHttpTikiya = hazmanot\nHttpScriptPath = /hazmanot/\n"_s,
               &lab) {
        SessionState& state = walk.program().state();
        lab.folders[state.profile.FtpFolder2];
        state.MisparHazmana = u"105"_s;
        state.transfer.OrderFolder = u"C:\\2000lumora\\!!000"_path / orderName;
        state.shemot.ppr = u"10/15"_s;
        state.shemot.maat = GetParam().english ? u"Glossy"_s : u"מבריק"_s;
        state.shemot.Bord = u"NB"_s;
        write(u"!105_1234.jpp"_s, "bytes");
        write(first, print(1));
        write(u"111015GNB0001_03AACC.jpp"_s, print(2));
        write(orderName + u".txt"_s, "\"Shemot.n1\",\"Dana Levi\"\r\n\"Shemot.n2\",\"03-1234567\"\r\n"
                                     "\"Shemot.Hearot\",\"gift - \"\r\n");
    }

    QByteArray print(int picture) {
        const auto& [files, state] = std::tie(walk.program().platform().files, walk.program().state());
        const auto jpeg = files.read(walk.pictureFolder() / u"IMG_00%1.jpg"_s.arg(picture, 2, 10, QChar(u'0')));
        return *packPrintFile(*jpeg, PrintFileShape::of(state.profile), QByteArray(40, ' '));
    }
    void write(const QString& name, const QByteArray& bytes) {
        walk.write(walk.program().state().transfer.OrderFolder / name, bytes);
    }
    FakeLab::Folder& remote() { return lab.folders[walk.program().state().profile.FtpFolder2 + u'/' + orderName]; }
    // No sending page stands while the order is handed over.
    template <class P>
    P& open(const std::function<void(SessionState&)>& handOver = {}) {
        PageChain& chain = walk.program().chain();
        chain.unload(PageId::FtpFrm);
        chain.unload(PageId::UploadForm);
        if (handOver)
            handOver(walk.program().state());
        chain.show(P::pageId);
        auto& page = walk.page<P>(P::pageId);
        QObject::connect(&page, &Page::changed, &page, [this] { lookIfDue(); });
        return page;
    }
    // The page counts down; its button starts at once.
    void startNow(const SendingPage& page) {
        until(page, SendingPhase::Countdown);
        walk.press(u"FtpFrm"_s, u"Image5"_s);
    }
    void until(const SendingPage& page, SendingPhase phase) {
        ASSERT_TRUE(QTest::qWaitFor([&] { return page.phase() == phase; }, 30000))
            << qPrintable(page.sendingControls().Label4Do.text);
    }
    void awaitPrints(const SendingPage& page) {
        ASSERT_TRUE(QTest::qWaitFor([&] { return !page.prints().empty(); }, 30000));
    }
    // Looks at the page from within its own work, as soon as it is so far. One after the other.
    void lookWhen(const QString& name, std::function<bool()> soFar) { waits.emplace_back(name, std::move(soFar)); }
    void lookIfDue() {
        if (looking || waits.empty() || !waits.front().second())
            return;
        const QString name = waits.front().first;
        waits.erase(waits.begin());
        looking = true;
        look(walk, name);
        looking = false;
    }

    FakeWebLab lab;
    Walk walk;
    std::vector<std::pair<QString, std::function<bool()>>> waits;
    bool looking = false;
};

} // namespace

TEST_P(SendingLook, HasNoFaultByFtpFromTheCountThroughAFailureToTheEnd) {
    auto& page = open<FtpFrm>([](SessionState& state) { state.Waiting = true; });
    until(page, SendingPhase::Countdown);
    awaitPrints(page);
    go(walk, u":17-countdown Command23 :17-waiting Image3 :20-leave-sending Command14"_s);

    lab.putFaults = {{first, FakeLab::always, -1}};
    lookWhen(u"18-sending"_s, [&] { return page.phase() == SendingPhase::Sending && page.controls().percent >= 50; });
    lookWhen(u"18-checking"_s, [&] { return page.phase() == SendingPhase::Checking; });
    lookWhen(u"18-sending-again"_s, [&] {
        return page.phase() == SendingPhase::Sending && !page.controls().Label34.text.isEmpty() &&
               !page.controls().Label4File.hint.isEmpty();
    });
    walk.press(u"FtpFrm"_s, u"Image5"_s);
    EXPECT_EQ(page.phase(), SendingPhase::NotAll);
    EXPECT_TRUE(waits.empty());
    go(walk, u":19-failed Command24 :22-for-the-lab cmdClosehOpen cmdInternetOpen :22-by-hand"_s);
    go(walk, u"Command9"_s);

    lab.putFaults.clear();
    lookWhen(u"21-reporting"_s, [&] { return page.phase() == SendingPhase::Reporting; });
    walk.press(u"FtpFrm"_s, u"Command10"_s);
    EXPECT_EQ(page.phase(), SendingPhase::Success);
    go(walk, u":21-sent Command28>hatchala"_s);
}

TEST_P(SendingLook, HasNoFaultByFtpAtTheEndsThatAreNoFailure) {
    lab.deadCalls = FakeLab::always;
    auto& untold = open<FtpFrm>([&](SessionState& state) {
        state.profile.ReportOn = 1;
        state.Careful = true;
    });
    startNow(untold);
    EXPECT_TRUE(untold.phase() == SendingPhase::Success && untold.reportUnknown());
    look(walk, u"24-sent-untold"_s);

    walk.program().state().Careful = false;
    remote().clear();
    remote()[u"stranger.jpp"_s] = "x";
    auto& there = open<FtpFrm>();
    startNow(there);
    EXPECT_EQ(there.phase(), SendingPhase::AllThere);
    look(walk, u"24-all-there"_s);

    const QString path = (walk.program().state().transfer.OrderFolder / first).text();
    remote().clear();
    auto& twice = open<FtpFrm>([&](SessionState& state) {
        state.transfer.SugMishloah = Sending::Resend;
        state.handOver.lines = {path, path};
    });
    startNow(twice);
    EXPECT_EQ(twice.phase(), SendingPhase::Unclear);
    look(walk, u"24-unclear"_s);

    lab.folders.erase(walk.program().state().profile.FtpFolder2 + u'/' + orderName);
    auto& part = open<FtpFrm>([&](SessionState& state) {
        state.handOver.lines = {path};
        state.Careful = true;
    });
    startNow(part);
    EXPECT_EQ(part.phase(), SendingPhase::PartThere);
    look(walk, u"24-part-there"_s);

    remote().clear();
    auto& stopped = open<FtpFrm>([&](SessionState& state) { state.handOver.lines = {path}; });
    lab.onPut = [&](const QString&) { walk.press(u"FtpFrm"_s, u"Command15"_s); };
    startNow(stopped);
    EXPECT_EQ(stopped.phase(), SendingPhase::Stopped);
    go(walk, u"! :24-stopped"_s);
}

TEST_P(SendingLook, HasNoFaultWithoutAnOrderAndWithoutAServer) {
    until(open<UploadForm>([](SessionState& state) { state.profile.HttpHost.clear(); }), SendingPhase::NoServer);
    look(walk, u"68-http-no-server"_s);
    until(open<FtpFrm>([](SessionState& state) { state.profile.FtpServer.clear(); }), SendingPhase::NoServer);
    go(walk, u"! :23-no-server"_s);
    until(open<FtpFrm>([](SessionState& state) {
              state.profile.FtpServer = u"192.0.2.10"_s;
              state.transfer.OrderFolder = {};
          }),
          SendingPhase::NoOrder);
    look(walk, u"23-no-order"_s);
    until(open<UploadForm>(), SendingPhase::NoOrder);
    look(walk, u"69-http-no-order"_s);
}

TEST_P(SendingLook, HasNoFaultByHttpFromTheCheckThroughAFailureToTheEndPanel) {
    lab.deadCalls = lab.deadPosts = FakeLab::always;
    auto& page = open<UploadForm>([](SessionState& state) { state.Waiting = true; });
    lookWhen(u"60-http-checking"_s, [&] { return page.controls().Pic4Hamten.visible; });
    until(page, SendingPhase::Countdown);
    awaitPrints(page);
    go(walk, u":61-http-countdown Command3 :62-http-stopped Command10"_s);
    lookWhen(u"63-http-sending"_s, [&] { return page.controls().percent >= 50; });
    lookWhen(u"64-http-sending-again"_s,
             [&] { return page.controls().percent == 25 && !page.controls().Label1.text.isEmpty(); });
    until(page, SendingPhase::NotAll);
    go(walk, u":65-http-failed Command24 :65-http-for-the-lab Command9"_s);

    lab.deadCalls = lab.deadPosts = 0;
    lookWhen(u"66-http-verifying"_s, [&] { return page.phase() == SendingPhase::Checking; });
    walk.press(u"UploadForm"_s, u"Image5"_s);
    EXPECT_EQ(page.phase(), SendingPhase::Success);
    EXPECT_TRUE(waits.empty());
    look(walk, u"67-http-sent"_s);
    until(open<UploadForm>(), SendingPhase::AllThere);
    go(walk, u":70-http-all-there Command28>hatchala"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, SendingLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
