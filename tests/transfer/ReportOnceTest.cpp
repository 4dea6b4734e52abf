#include "transfer/report/ReportOnce.h"
#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "support/ExampleOrder.h"
#include "support/Take.h"
#include "support/TestPlatform.h"
#include "transfer/delivery/Attempts.h"

#include <gtest/gtest.h>

#include <functional>

namespace lumora {

namespace {

using namespace Qt::StringLiterals;
using Phase = OrderState::Phase;
using Report = OrderState::Report;
using Told = ReportOnce::Told;

struct HeardCalls final : ReportCalls {
    bool reportOrder(const QString& query) override {
        onOrder();
        heard += query;
        return answered;
    }
    bool reportDone(const QString& query) override {
        heard += query;
        return true;
    }

    std::function<void()> onOrder = [] {};
    QStringList heard;
    bool answered = true;
};

struct AReport : ::testing::Test {
    AReport() {
        state.profile.ReportOn = 1;
        state.profile.ClientCode = u"lab & co"_s;
        state.transfer.ShemTikiya = folder.name();
        state.shemot.n3 = u"***"_s;
        EXPECT_TRUE(test.files.makeFolder(u"C:\\orders"_path) && test.files.makeFolder(folder.path()));
    }
    OrderState kept() const { return take(ReadOrderState(test.files, folder)); }

    TestPlatform test;
    SessionState state = exampleOrder();
    OrderFolder folder{u"C:\\orders\\2026_11_21_KUP_1234^105"_path};
    HeardCalls calls;
    SendingStop stop;
};

TEST_F(AReport, goesOutForEachArrivalOrCarefullyOnceForAnOrder) {
    struct Case {
        const char* what;
        bool careful;
        Sender by;
        Sending sending;
        std::int16_t reportOn;
        Phase phase;
        Report report;
        Told told;
        Phase phaseAfter;
        Report reportAfter;
    };
    using enum OrderState::Report;
    using enum ReportOnce::Told;
    const Case cases[] = {
        {"FTP", false, Sender::Ftp, Sending::NewOrder, 1, Phase::Arrived, NotYet, Now, Phase::Reported, Done},
        {"FTP, again", false, Sender::Ftp, Sending::Resend, 1, Phase::Reported, Done, Now, Phase::Reported, Done},
        {"FTP, no reports", false, Sender::Ftp, Sending::NewOrder, 0, Phase::Arrived, NotYet, NotWanted,
         Phase::Reported, NotYet},
        {"FTP, a part", false, Sender::Ftp, Sending::Resend, 1, Phase::Sending, NotYet, Now, Phase::Sending, NotYet},
        {"FTP, a part, no reports", false, Sender::Ftp, Sending::Resend, 0, Phase::Sending, NotYet, NotWanted,
         Phase::Sending, NotYet},
        {"a chain", false, Sender::Ftp, Sending::Chain, 1, Phase::Arrived, NotYet, Now, Phase::Reported, Done},
        {"HTTP", false, Sender::Http, Sending::NewOrder, 0, Phase::Arrived, NotYet, Now, Phase::Reported, Done},
        {"HTTP, again", false, Sender::Http, Sending::Resend, 1, Phase::Arrived, NotYet, NotWanted, Phase::Reported,
         NotYet},
        {"careful", true, Sender::Ftp, Sending::NewOrder, 1, Phase::Arrived, NotYet, Now, Phase::Reported, Done},
        {"careful, again", true, Sender::Ftp, Sending::Resend, 1, Phase::Reported, Done, Before, Phase::Reported, Done},
        {"careful, another sender", true, Sender::Http, Sending::Resend, 1, Phase::Reported, Done, Before,
         Phase::Reported, Done},
        {"careful, a kill before the end", true, Sender::Ftp, Sending::NewOrder, 1, Phase::Arrived, Begun, NotKnown,
         Phase::Arrived, Begun},
        {"careful, a part", true, Sender::Ftp, Sending::Resend, 1, Phase::Sending, NotYet, NotWanted, Phase::Sending,
         NotYet},
        {"careful, a chain", true, Sender::Ftp, Sending::Chain, 1, Phase::Arrived, NotYet, NotWanted, Phase::Arrived,
         NotYet},
        {"careful, HTTP, stopped before", true, Sender::Http, Sending::Resend, 0, Phase::Arrived, NotYet, Now,
         Phase::Reported, Done},
        {"careful, no reports", true, Sender::Ftp, Sending::NewOrder, 0, Phase::Arrived, NotYet, NotWanted,
         Phase::Reported, NotYet},
    };
    for (const Case& each : cases) {
        SCOPED_TRACE(each.what);
        state.Careful = each.careful;
        state.transfer.SugMishloah = each.sending;
        state.profile.ReportOn = each.reportOn;
        OrderState before;
        before.phase = each.phase;
        before.report = each.report;
        ASSERT_TRUE(WriteOrderState(test.files, folder, before));
        OrderJournal journal(test.files, folder);
        calls.heard.clear();
        calls.onOrder = [&] { EXPECT_TRUE(!each.careful || kept().report == Begun) << "begun before the request"; };
        ReportOnce reports(state, test.files, journal, stop);
        if (each.careful) {
            EXPECT_EQ(reports.isDueWhereFound(each.by), each.told == Told::Now);
        }
        EXPECT_EQ(reports.tell(each.by, calls), each.told);
        EXPECT_EQ(calls.heard.size(), each.told == Told::Now ? 2 : 0);
        EXPECT_EQ(kept().phase, each.phaseAfter);
        EXPECT_EQ(kept().report, each.reportAfter);
        if (each.told == Told::NotKnown) {
            EXPECT_EQ(reports.tellAgain(calls), Told::Now);
            EXPECT_EQ(calls.heard.size(), 2);
            EXPECT_EQ(kept().report, Done);
        }
    }
}

TEST_F(AReport, thatNoAnswerCameToStaysBegunCarefully) {
    calls.answered = false;
    for (const bool careful : {true, false}) {
        state.Careful = careful;
        OrderState before;
        before.phase = Phase::Arrived;
        ASSERT_TRUE(WriteOrderState(test.files, folder, before));
        OrderJournal journal(test.files, folder);
        ReportOnce(state, test.files, journal, stop).tell(Sender::Ftp, calls);
        EXPECT_EQ(kept().report, careful ? Report::Begun : Report::Done);
    }
}

TEST_F(AReport, thatIsStoppedStaysBegun) {
    OrderJournal journal(test.files, folder);
    ASSERT_TRUE(journal.arrived(false));
    stop.StopFlag = true;
    EXPECT_EQ(ReportOnce(state, test.files, journal, stop).tell(Sender::Ftp, calls), Told::Cut);
    EXPECT_TRUE(calls.heard.isEmpty() && kept().report == Report::NotYet) << "the next arrival tells";
    stop.StopFlag = false;
    calls.onOrder = [&] { stop.StopFlag = true; };
    EXPECT_EQ(ReportOnce(state, test.files, journal, stop).tell(Sender::Ftp, calls), Told::Cut);
    EXPECT_EQ(calls.heard.size(), 1) << "no done call";
    EXPECT_EQ(kept().report, Report::Begun);
}

TEST_F(AReport, isNotBegunCarefullyWhereThatCouldNotBeKept) {
    for (const bool careful : {true, false}) {
        state.Careful = careful;
        OrderJournal journal(test.files, folder);
        ASSERT_TRUE(journal.arrived(true));
        ASSERT_TRUE(test.files.removeTree(folder.path()));
        calls.heard.clear();
        ReportOnce reports(state, test.files, journal, stop);
        EXPECT_EQ(reports.tell(Sender::Ftp, calls), careful ? Told::NotKept : Told::Now);
        EXPECT_FALSE(reports.kept());
        EXPECT_EQ(calls.heard.size(), careful ? 0 : 2);
        ASSERT_TRUE(test.files.makeFolder(folder.path()));
        if (careful) {
            EXPECT_EQ(reports.tell(Sender::Ftp, calls), Told::Now) << "the next arrival tells";
        }
    }
}

TEST_F(AReport, tellsAnOrderThatIsSentAgainAsItsLogHasItAndCutsNoValue) {
    SessionState then = exampleOrder();
    then.shemot.n3 = u"Herzl 1"_s;
    then.shemot.Hearot = u"black & white #1, 100% + gift"_s;
    ASSERT_TRUE(test.files.writeWhole(folder.logPath(),
                                      OrderLog::of(then, OrderLog::Layout::Plain, {}, {}, test.clock.time).write()));
    state.shemot.TotalPics = 40; // the pieces
    for (const auto sending : {Sending::NewOrder, Sending::Resend}) {
        for (const bool careful : {true, false}) {
            state.Careful = careful;
            state.transfer.SugMishloah = sending;
            OrderJournal journal(test.files, folder);
            ASSERT_TRUE(journal.arrived(true));
            calls.heard.clear();
            ReportOnce(state, test.files, journal, stop).tellAgain(calls);
            ASSERT_EQ(calls.heard.size(), 2);
            EXPECT_EQ(calls.heard[1], careful ? u"?t1=lab %26 co&t2=true"_s : u"?t1=lab & co&t2=true"_s);
            const bool fromLog = careful && sending == Sending::Resend;
            EXPECT_TRUE(calls.heard[0].endsWith(
                fromLog ? u"&t2=Notes: black %26 white %231, 100%25 %2B gift&t3=Pratim: 03-1234567    Dana Levi"
                          "&t4=Adress: Herzl 1&t5=Mail: dana@example.com&t8=Total_pics: 13"_s
                        : u"&t2=Notes: gift - &t3=Pratim: 03-1234567    Dana Levi&t4=Adress: ***"
                          "&t5=Mail: dana@example.com&t8=Total_pics: 40"_s))
                << calls.heard[0].toStdString();
        }
    }
}

} // namespace
} // namespace lumora
