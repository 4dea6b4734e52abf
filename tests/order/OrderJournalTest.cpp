#include "order/OrderJournal.h"

#include "order/OrderSender.h"
#include "support/ExampleOrder.h"
#include "support/Take.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using Phase = OrderState::Phase;
using Report = OrderState::Report;
using Way = OrderState::Way;

const QString printPath = u"C:\\2026_11_21_KUP_1234^105\\a.jpp"_s;

class AJournal : public ::testing::Test {
protected:
    AJournal() { EXPECT_TRUE(test.files.makeFolder(folder.path())); }

    OrderState stored() const {
        const Result<OrderState> read = ReadOrderState(test.files, folder);
        EXPECT_TRUE(read);
        return read ? *read : OrderState();
    }
    void give(const QString& name) const { EXPECT_TRUE(test.files.writeWhole(folder.filePath(name), "x")); }

    TestPlatform test;
    OrderFolder folder{u"C:\\2026_11_21_KUP_1234^105"_path};
};

TEST_F(AJournal, keepsEachStepAndWritesNothingWhereNothingChanges) {
    SessionState session = exampleOrder();
    session.Optint = OrderKind::EditedPrint;
    struct Step {
        const char* what;
        std::function<Result<void>(OrderJournal&)> step;
        Phase phase;
        int inHand;
        Report report;
        int lines; // of the basket
    };
    const Step steps[] = {
        {"begin",
         [&](OrderJournal& journal) {
             return journal.begin(session, Way::Station, {u"one"_s, u"two"_s}, u"C:\\old"_path);
         },
         Phase::Preparing, 0, Report::NotYet, 2},
        {"prepared", [](OrderJournal& journal) { return journal.prepared(); }, Phase::Prepared, 0, Report::NotYet, 2},
        {"folder asked for", [](OrderJournal& journal) { return journal.folderIsAsked(Sender::Http); }, Phase::Prepared,
         0, Report::NotYet, 2},
        {"sending", [](OrderJournal& journal) { return journal.sendingBegins(Sender::Http, true); }, Phase::Sending, 0,
         Report::NotYet, 0},
        {"take", [](OrderJournal& journal) { return journal.take(printPath); }, Phase::Sending, 1, Report::NotYet, 0},
        {"release", [](OrderJournal& journal) { return journal.release(printPath); }, Phase::Sending, 0, Report::NotYet,
         0},
        {"arrived", [](OrderJournal& journal) { return journal.arrived(true); }, Phase::Arrived, 0, Report::NotYet, 0},
        {"begun", [](OrderJournal& journal) { return journal.reportBegun(); }, Phase::Arrived, 0, Report::Begun, 0},
        {"done", [](OrderJournal& journal) { return journal.reportDone(); }, Phase::Reported, 0, Report::Done, 0},
        // Once it has arrived it stays so, whoever sends it again.
        {"sent again", [](OrderJournal& journal) { return journal.sendingBegins(Sender::Ftp, false); }, Phase::Reported,
         0, Report::Done, 0},
        {"arrived again", [](OrderJournal& journal) { return journal.arrived(true); }, Phase::Reported, 0, Report::Done,
         0},
    };
    for (const Step& step : steps) {
        OrderJournal journal(test.files, folder); // as behind a start of the program
        ASSERT_TRUE(step.step(journal)) << step.what;
        const OrderState state = stored();
        EXPECT_TRUE(journal.state().phase == step.phase && state.phase == step.phase) << step.what;
        EXPECT_EQ(state.filesInHand.size(), step.inHand) << step.what;
        EXPECT_EQ(state.report, step.report) << step.what;
        EXPECT_EQ(state.items.size(), step.lines) << step.what;
        EXPECT_EQ(state.number + state.serial + state.replaces, u"1051234old"_s) << step.what;
        EXPECT_EQ(state.folderAsked == Sender::Http, &step == &steps[2]) << step.what;
        EXPECT_EQ(state.folderMadeByUs, step.phase >= Phase::Sending) << step.what;
        EXPECT_EQ(state.way, step.phase >= Phase::Sending ? Way::Http : Way::Station) << step.what;
        ASSERT_TRUE(test.files.removeFile(folder.filePath(u".order"_s)));
        ASSERT_TRUE(step.step(journal)) << step.what;
        EXPECT_FALSE(test.files.fileExists(folder.filePath(u".order"_s))) << step.what << ": written again";
        ASSERT_TRUE(WriteOrderState(test.files, folder, state));
    }
}

TEST_F(AJournal, keepsTheMarksOfItsFirstStartWhereAnOrderGoesOn) {
    SessionState session = exampleOrder();
    session.Optint = OrderKind::Print;
    const auto marksWith = [&](const char* picture) {
        EXPECT_TRUE(test.files.writeWhole(u"C:\\a.jpg"_path, picture));
        EXPECT_TRUE(OrderJournal(test.files, folder).begin(session, Way::Ftp, {u"1 1015GNBC:\\a.jpg"_s}, {}));
        return stored().marks.value(0);
    };
    const QString first = marksWith("a picture");
    EXPECT_FALSE(first.isEmpty());
    EXPECT_EQ(marksWith("that of another card"), first);
}

TEST_F(AJournal, makesAStateForAnOrderThatHasNoneAtItsFirstStep) {
    give(u"!105_1234.jpg"_s);
    EXPECT_FALSE(OrderJournal(test.files, folder).known());
    ASSERT_TRUE(OrderJournal(test.files, folder).take(printPath));
    EXPECT_EQ(stored().number + stored().serial, u"1051234"_s);
    EXPECT_EQ(stored().way, Way::Http);
    EXPECT_FALSE(stored().folderMadeByUs);

    give(u".order"_s); // damaged: any file may have been cut, and the lab may have been told
    const OrderJournal damaged(test.files, folder);
    EXPECT_EQ(damaged.state().filesInHand, QStringList(folder.filePath(u"!105_1234.jpg"_s).text()));
    EXPECT_EQ(damaged.state().report, OrderState::Report::Begun);
    const OrderFolder pieces(u"C:\\2026_11_21_KUP_1234^106P"_path);
    ASSERT_TRUE(test.files.makeFolder(pieces.path()));
    ASSERT_TRUE(OrderJournal(test.files, pieces).sendingBegins(Sender::Ftp, false));
    EXPECT_EQ(take(ReadOrderState(test.files, pieces)).number, u"106"_s);
}

TEST_F(AJournal, knowsTheFolderOfTheServerOnWhichItWasMade) {
    give(u"!105_1234.jpg"_s);
    OrderJournal journal(test.files, folder);
    ASSERT_TRUE(journal.sendingBegins(Sender::Ftp, true));
    EXPECT_FALSE(journal.ownsFolder(Sender::Ftp)) << "made for the other sender";
    EXPECT_FALSE(journal.ownsFolder(Sender::Http));
    ASSERT_TRUE(journal.folderIsAsked(Sender::Ftp));
    EXPECT_TRUE(journal.mayHaveMadeFolder(Sender::Ftp));
    EXPECT_FALSE(journal.mayHaveMadeFolder(Sender::Http));
    ASSERT_TRUE(journal.sendingBegins(Sender::Http, true));
    ASSERT_TRUE(journal.folderIsLost(Sender::Ftp));
    EXPECT_TRUE(journal.ownsFolder(Sender::Http));
    EXPECT_FALSE(journal.ownsFolder(Sender::Ftp));
}

TEST_F(AJournal, takesAwayWhatWasKeptAsideWhenTheSendingBegins) {
    ASSERT_TRUE(test.files.makeFolder(folder.filePath(u".kept"_s)));
    give(u".kept\\one.jpg"_s);
    OrderJournal journal(test.files, folder);
    ASSERT_TRUE(journal.prepared());
    EXPECT_TRUE(test.files.folderExists(folder.filePath(u".kept"_s)));
    ASSERT_TRUE(journal.sendingBegins(Sender::Ftp, true));
    EXPECT_FALSE(test.files.folderExists(folder.filePath(u".kept"_s)));
}

TEST_F(AJournal, triesAgainWhatCouldNotBeWritten) {
    ASSERT_TRUE(test.files.removeTree(u"C:\\none\\order"_path));
    const OrderFolder gone(u"C:\\none\\order"_path);
    OrderJournal journal(test.files, gone);
    EXPECT_FALSE(journal.take(printPath));
    ASSERT_TRUE(test.files.makeFolder(u"C:\\none"_path));
    ASSERT_TRUE(test.files.makeFolder(gone.path()));
    EXPECT_TRUE(journal.take(printPath));
    EXPECT_EQ(take(ReadOrderState(test.files, gone)).filesInHand.size(), 1);
}

TEST_F(AJournal, tellsBySenderAndSheetHowAnOrderIsSentAgain) {
    struct Case {
        const char* what;
        std::optional<Way> way;
        QStringList files;
        bool ftpSetUp;
        bool httpSetUp;
        std::optional<Sender> made;
        Sender resend;
    };
    const QString jpp = u"!105_1234.jpp"_s;
    const QString jpg = u"!105_1234.jpg"_s;
    const Case cases[] = {
        {"nothing known", {}, {u"a.jpp"_s}, true, true, {}, Sender::Ftp},
        {"a sheet for FTP", {}, {jpp}, true, true, Sender::Ftp, Sender::Ftp},
        {"a sheet for HTTP", {}, {jpg}, true, true, Sender::Http, Sender::Http},
        {"a station's", Way::Station, {jpp, jpg}, true, true, Sender::Ftp, Sender::Ftp},
        {"the state counts", Way::Http, {jpp}, true, true, Sender::Http, Sender::Http},
        {"HTTP is not set up", Way::Http, {jpg}, true, false, Sender::Http, Sender::Ftp},
        {"FTP is not set up", Way::Ftp, {jpp}, false, true, Sender::Ftp, Sender::Http},
        {"nothing is set up", Way::Http, {jpg}, false, false, Sender::Http, Sender::Http},
    };
    for (const Case& one : cases) {
        ASSERT_TRUE(test.files.removeTree(u"C:\\case\\order"_path));
        const OrderFolder order(u"C:\\case\\order"_path);
        ASSERT_TRUE(test.files.makeFolder(u"C:\\case"_path) && test.files.makeFolder(order.path()));
        for (const QString& name : one.files)
            ASSERT_TRUE(test.files.writeWhole(order.filePath(name), "x"));
        if (one.way) {
            OrderState state;
            state.way = *one.way;
            ASSERT_TRUE(WriteOrderState(test.files, order, state));
        }
        SessionState session;
        session.Careful = true;
        ClientProfile& profile = session.profile;
        profile.FtpServer = profile.FtpUser = profile.FtpPassword = one.ftpSetUp ? u"set"_s : QString();
        profile.HttpHost = one.httpSetUp ? u"http://lab"_s : QString();
        EXPECT_EQ(SenderMadeFor(test.files, order), one.made) << one.what;
        EXPECT_EQ(SenderForResend(session, order, test.files), one.resend) << one.what;
    }
}

} // namespace
} // namespace lumora
