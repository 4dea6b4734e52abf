#include "order/UnfinishedOrders.h"

#include "order/OrderChoices.h"
#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "order/WaitingOrders.h"
#include "session/Workspace.h"
#include "support/ExampleOrder.h"
#include "support/Take.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using Phase = OrderState::Phase;
using Report = OrderState::Report;
using Way = OrderState::Way;

class OrdersOfAKiosk : public ::testing::Test {
protected:
    OrdersOfAKiosk() {
        session = exampleOrder();
        session.DiskRoot = test.drives.programRoot();
        session.Optint = OrderKind::Print;
        session.profile.HttpHost = session.profile.FtpServer = session.profile.FtpUser = session.profile.FtpPassword =
            u"set up"_s;
        std::filesystem::create_directories(*test.drives.toHost(orders));
    }

    OrderFolder give(const QString& leaf, const QStringList& files = {}) {
        const OrderFolder folder(orders / leaf);
        EXPECT_TRUE(test.files.makeFolder(folder.path()));
        for (const QString& file : files)
            EXPECT_TRUE(
                test.files.writeWhole(folder.filePath(file), file == print ? examplePrint(session.profile) : "x"));
        return folder;
    }
    OrderFolder give(const QString& leaf, const OrderState& state, const QStringList& files = {}) {
        const OrderFolder folder = give(leaf, files);
        EXPECT_TRUE(WriteOrderState(test.files, folder, state));
        return folder;
    }
    void giveLog(const OrderFolder& folder, const QStringList& items, const QStringList& failed) {
        const OrderLog log = OrderLog::of(session, OrderLog::Layout::Plain, items, failed, QDateTime());
        EXPECT_TRUE(test.files.writeWhole(folder.logPath(), log.write()));
    }
    OrderState inPhase(Phase phase, const QString& number = u"105"_s) const {
        OrderState state;
        state.phase = phase;
        state.number = number;
        state.serial = u"1234"_s;
        state.kind = OrderKind::Print;
        state.items = {u"1 1015GNBC:\\pics\\one.jpg"_s, u"1 1015GNBC:\\pics\\two.jpg"_s, u"1 1015GNBC:\\a.b"_s,
                       u"1 1015GNBC:\\pics\\gone.jpg"_s};
        state.choices = ChoicesOf(session);
        return state;
    }
    QStringList offered() const {
        QStringList names;
        for (const UnfinishedOrder& order : UnfinishedOrders(session, test.files))
            names += order.folder.name();
        return names;
    }

    TestPlatform test;
    SessionState session;
    const DrivePath orders = u"C:\\2000lumora\\!!000"_path;
    const QString name = u"2026_11_21_KUP_1234^105"_s;
    const QString print = u"1 1015GNB0000_016F6E65.jpp"_s; // of the first line
};

TEST_F(OrdersOfAKiosk, AreTidiedOfWhatAKillHasLeft) {
    give(u"2026_11_21_KUP_1234^101"_s); // claimed, and then killed
    give(u"not an order"_s);
    give(u"2026_11_21_KUP_1234^102"_s, {".log-there", "1 1015GNB0000_0161.jpp"});
    const QString lacking = u"2026_11_21_KUP_1234^107"_s, late = u"2026_11_20_KUP_1234^109"_s;
    const auto replace = [&](const QString& replaced, Phase phase, const QString& by, Phase phaseOfBy) {
        give(replaced, inPhase(phase, replaced.last(3)), {print});
        OrderState state = inPhase(phaseOfBy, by.last(3));
        state.replaces = replaced;
        return give(by, state, phaseOfBy == Phase::Prepared ? QStringList(print) : QStringList());
    };
    using enum OrderState::Phase;
    const OrderFolder anew = replace(u"2026_11_21_KUP_1234^103"_s, Prepared, u"2026_11_21_KUP_1234^104"_s, Prepared);
    giveLog(anew, inPhase(Prepared).items, {});
    // A picture failed: the replaced order holds its only print.
    giveLog(replace(lacking, Prepared, u"2026_11_21_KUP_1234^108"_s, Prepared), inPhase(Prepared).items,
            {u"C:\\pics\\gone.jpg"_s});
    replace(late, Sending, u"2026_11_20_KUP_1234^110"_s, Prepared);   // it was sent after all
    replace(name, Prepared, u"2026_11_21_KUP_1234^106"_s, Preparing); // not whole yet: the prints are kept
    TidyOrders(session, test.files);
    EXPECT_EQ(test.files.folders(orders),
              QStringList({late, "2026_11_20_KUP_1234^110", "2026_11_21_KUP_1234^102", "2026_11_21_KUP_1234^104", name,
                           "2026_11_21_KUP_1234^106", lacking, "2026_11_21_KUP_1234^108", "not an order"}));
    EXPECT_FALSE(test.files.fileExists(orders / u"2026_11_21_KUP_1234^102" / u".log-there"));
    EXPECT_EQ(take(ReadOrderState(test.files, anew)).replaces, QString()) << "its number may come again";
    EXPECT_EQ(ReplacementOf(session, test.files, OrderFolder(orders / name))->name(), u"2026_11_21_KUP_1234^106");
    give(name, inPhase(Phase::Sending));
    EXPECT_FALSE(ReplacementOf(session, test.files, OrderFolder(orders / name))) << "it was sent after all";
    give(name, inPhase(Phase::Prepared));
    EXPECT_EQ(offered(), QStringList({"2026_11_21_KUP_1234^108", "2026_11_21_KUP_1234^106", "2026_11_21_KUP_1234^104",
                                      "2026_11_20_KUP_1234^110", late}))
        << "the replaced one waits";
}

TEST_F(OrdersOfAKiosk, GoOnWhereSomethingIsLeftToDo) {
    const struct {
        Phase phase;
        Way way;
        Report report;
        bool withPrint;
        bool offered;
        bool OrderState::*flag = nullptr;
    } cases[] = {
        {Phase::Preparing, Way::Ftp, Report::NotYet, false, true},
        {Phase::Preparing, Way::Station, Report::NotYet, true, true},
        {Phase::Prepared, Way::Ftp, Report::NotYet, true, true},
        {Phase::Prepared, Way::Http, Report::NotYet, true, true},
        {Phase::Prepared, Way::Station, Report::NotYet, true, false},
        {Phase::Prepared, Way::Ftp, Report::NotYet, false, false}, // its print files were cleaned away
        {Phase::Sending, Way::Mail, Report::NotYet, true, false},
        {Phase::Sending, Way::Ftp, Report::NotYet, true, true},
        {Phase::Sending, Way::Ftp, Report::NotYet, false, true, &OrderState::fewerAgreed}, // the lab is to be told
        {Phase::Sending, Way::Ftp, Report::NotYet, true, false, &OrderState::sentBefore},
        {Phase::Arrived, Way::Http, Report::NotYet, false, true}, // the lab alone is to be told
        {Phase::Arrived, Way::Http, Report::NotYet, true, false, &OrderState::sentBefore}, // the lab may have been told
        {Phase::Arrived, Way::Ftp, Report::Begun, true, false},
        {Phase::Reported, Way::Ftp, Report::Done, true, false},
    };
    for (const auto& c : cases) {
        OrderState state = inPhase(c.phase);
        state.way = c.way;
        state.report = c.report;
        if (c.flag)
            state.*c.flag = true;
        const OrderFolder folder = give(name, state, c.withPrint ? QStringList(print) : QStringList());
        EXPECT_EQ(offered(), c.offered ? QStringList(name) : QStringList()) << (&c - cases);
        ASSERT_TRUE(ThrowAwayOrder(test.files, folder));
    }
    const OrderFolder damaged = give(name, {print, u".order"_s});
    EXPECT_EQ(offered(), QStringList(name)) << "its state can't be read";
    ASSERT_TRUE(ThrowAwayOrder(test.files, damaged));
    session.profile.FtpUser.clear();
    const OrderFolder noServer = give(name, inPhase(Phase::Sending), {print});
    EXPECT_TRUE(offered().isEmpty()) << "there is no server to go on with";
    ASSERT_TRUE(ThrowAwayOrder(test.files, noServer));
    give(name, {print, u".order"_s}); // damaged
    give(u"2026_11_20_KUP_1234^9"_s, inPhase(Phase::Preparing, u"9"_s));
    give(u"2026_11_21_KUP_1234^99"_s, inPhase(Phase::Preparing, u"99"_s));
    give(u"2026_11_21_KUP_1234^100"_s, inPhase(Phase::Preparing, u"100"_s));
    EXPECT_EQ(offered(), QStringList({"2026_11_21_KUP_1234^100", "2026_11_21_KUP_1234^99", "2026_11_20_KUP_1234^9"}));
}

TEST_F(OrdersOfAKiosk, WaitOldestFirstAndPauseLongerBehindEachTry) {
    OrderState givenUp = inPhase(Phase::Sending);
    givenUp.givenUp = true;
    give(u"2026_11_21_KUP_1234^104"_s, inPhase(Phase::Preparing), {print});
    give(u"2026_11_21_KUP_1234^103"_s, givenUp, {print});
    give(u"2026_11_21_KUP_1234^102"_s, inPhase(Phase::Sending), {print});
    const OrderFolder lacking = give(u"2026_11_21_KUP_1234^101"_s, inPhase(Phase::Prepared), {print});
    giveLog(lacking, {}, {u"C:\\pics\\gone.jpg"_s});
    OrderState nobodyCame = inPhase(Phase::Prepared);
    nobodyCame.lapsed = true;
    const OrderFolder lapsed = give(u"2026_11_21_KUP_1234^100"_s, nobodyCame, {print});
    giveLog(lapsed, {}, {u"C:\\pics\\gone.jpg"_s});
    OrderState held = inPhase(Phase::Prepared);
    held.held = true;
    const OrderFolder stopped = give(u"2026_11_21_KUP_1234^105"_s, held, {print});
    const auto waiting = [this](bool on, bool careful, bool kiosk) {
        session.Waiting = on;
        session.Careful = careful;
        session.kiosk.on = kiosk;
        QString numbers;
        for (const CountedOrder& one : OrdersThatWait(session, test.platform))
            numbers += one.order.folder.name().last(3) + QLatin1StringView(one.byItself ? " " : "? ");
        return numbers.toStdString();
    };
    EXPECT_EQ(waiting(false, false, false), "");
    EXPECT_EQ(waiting(true, false, false), "100 101 102 ");
    EXPECT_EQ(waiting(true, true, false), "102 ") << "the customer is to answer about the pictures left out";
    EXPECT_EQ(waiting(false, true, true), "100? ") << "on a kiosk nobody but the staff would know";
    EXPECT_EQ(waiting(true, true, true), "100? 102 ");
    EXPECT_TRUE(OrderJournal(test.files, stopped).lapsed());
    EXPECT_EQ(waiting(true, false, true), "100 101 102 105? ") << "its customer has stopped it";

    waiting(true, true, true);
    using std::chrono::minutes;
    std::optional<WaitingOrders> rule(std::in_place, session, test.platform);
    rule->refresh();
    const auto pauses = [&](minutes pause) {
        test.clock.ran += pause - std::chrono::milliseconds(1);
        const bool early = rule->due().has_value();
        test.clock.ran += std::chrono::milliseconds(1);
        rule->refresh(); // another visit to the start page changes nothing
        return !early && rule->due();
    };
    for (const int pause : {1, 2, 5, 15, 60, 60}) {
        ASSERT_TRUE(pauses(minutes(pause))) << pause;
        rule->ended(rule->due()->folder, {});
    }
    rule.emplace(session, test.platform); // the program was killed
    rule->refresh();
    EXPECT_TRUE(pauses(minutes(60)));
}

TEST_F(OrdersOfAKiosk, TellHowFarTheyCameAndAreTakenUpWithAllThatWasChosen) {
    std::filesystem::create_directories(*test.drives.toHost(u"C:\\pics"_path));
    ASSERT_TRUE(test.files.writeWhole(u"C:\\pics\\two.jpg"_path, "x"));
    session.transfer.leftOut = {{u"C:\\pics\\three.Jpg"_path, LeftOut::Why::NoJpeg}, {u"C:\\pics\\gone.jpg"_path}};
    give(name, inPhase(Phase::Preparing), {print});
    const QList<UnfinishedOrder> found = UnfinishedOrders(session, test.files);
    ASSERT_EQ(found.size(), 1);
    EXPECT_EQ(found[0].pictures, 3) << "a name that is too short has no print";
    EXPECT_EQ(found[0].prepared, 1) << "its own picture may be gone";
    EXPECT_EQ(found[0].gone, 1);
    UnfinishedOrder swapped = found[0];
    const int gone = GonePictures(session, test.files, swapped);
    swapped.state.marks = QStringList(swapped.state.items.size(), u"1 of another picture"_s);
    EXPECT_EQ(GonePictures(session, test.files, swapped), gone + 1) << "another card is in the drive";
    session.profile.JppChunks = 40;
    EXPECT_EQ(UnfinishedOrders(session, test.files)[0].gone, 2) << "a print of another shape is made again";

    SessionState next;
    next.DiskRoot = session.DiskRoot;
    EXPECT_EQ(TakeUpOrder(found[0], next, test.files), Outcome::PlainTakenUp);
    EXPECT_EQ(next.handOver.lines, found[0].state.items);
    EXPECT_EQ(next.handOver.takenUp, orders / name);
    EXPECT_TRUE(next.handOver.pressStart);
    EXPECT_EQ(ChoicesOf(next), ChoicesOf(session));

    UnfinishedOrder order = found[0];
    order.state.kind = OrderKind::EditedPrint;
    EXPECT_EQ(TakeUpOrder(order, next, test.files), Outcome::EditedTakenUp);
    for (const Way way : {Way::Ftp, Way::Http}) {
        OrderState state = inPhase(way == Way::Http ? Phase::Sending : Phase::Prepared);
        state.way = way;
        const OrderFolder folder = give(name + u'P', state);
        giveLog(folder, {}, {u"C:\\pics\\caf?.jpg"_s, u"C:\\pics\\gone.jpg"_s});
        SessionState sending;
        sending.transfer.SugMishloah = Sending::Resend;
        sending.transfer.leftOut = {{u"C:\\of another order.jpg"_path}};
        EXPECT_EQ(TakeUpOrder({folder, take(ReadOrderState(test.files, folder))}, sending, test.files),
                  way == Way::Http ? Outcome::SendingTakenUpByHttp : Outcome::SendingTakenUpByFtp);
        EXPECT_EQ(sending.transfer.OrderFolder, folder.path());
        EXPECT_EQ(sending.transfer.ShemTikiya, name + u'P');
        EXPECT_EQ(sending.transfer.HazmanaP, 1);
        EXPECT_EQ(sending.transfer.Mefurak, Travel::Pieces);
        EXPECT_EQ(sending.transfer.SugMishloah, Sending::NewOrder);
        EXPECT_EQ(sending.MisparHazmana, u"105");
        EXPECT_EQ(sending.shemot.n1, u"Dana Levi") << "what the report says is known until it is sent";
        EXPECT_TRUE(sending.handOver.lines.isEmpty());
        EXPECT_TRUE(sending.handOver.basket.isEmpty()) << "the only print of a picture that is gone";
        QList<LeftOut::Why> reasons;
        for (const LeftOut& picture : sending.transfer.leftOut)
            reasons += picture.why;
        EXPECT_EQ(reasons, QList({LeftOut::Why::NoJpeg, LeftOut::Why::Name, LeftOut::Why::NotTold}));
        EXPECT_EQ(sending.transfer.leftOutAsked, way == Way::Http) << "its sending had begun";
    }
}

TEST_F(OrdersOfAKiosk, LeadBackToTheirPicturesAfterARestart) {
    std::filesystem::create_directories(*test.drives.toHost(u"C:\\pics"_path));
    for (const Phase phase : {Phase::Preparing, Phase::Prepared}) {
        OrderState order = inPhase(phase);
        order.items.removeLast();
        order.items += u"2 1015GNBC:\\2000lumora\\zmany\\door\\0123456789ab\\k\\a.jpg"_s;
        for (const QString& path : {order.items[0], order.items[1], order.items[3]}) {
            std::filesystem::create_directories(*test.drives.toHost(DrivePath(path.mid(9)).folder()));
            ASSERT_TRUE(test.files.writeWhole(DrivePath(path.mid(9)), "x"));
        }
        session.shemot.Mail = u"dana@gmail.com"_s;
        session.shemot.Hearot = u"a - gift - Haifa"_s;
        session.BranchChoice = u"Haifa"_s;
        session.coupon.MisparKoopon = 3;
        order.choices = ChoicesOf(session);
        SessionState next;
        next.DiskRoot = session.DiskRoot;
        TakeUpOrder({give(name, order, {print}), order}, next, test.files);
        const HandOver& back = next.handOver;
        EXPECT_EQ(back.basket, order.items);
        EXPECT_EQ(back.pictures, QStringList({u"C:\\pics\\one.jpg"_s, u"C:\\pics\\two.jpg"_s, order.items[3].mid(9)}));
        EXPECT_EQ(back.closing.Text1 + u'|' + back.closing.Combo1 + u'|' + back.closing.Text2,
                  u"dana|gmail.com|a - gift");
        EXPECT_FALSE(back.closing.promptStands);
        EXPECT_EQ(back.details.n1, u"Dana Levi");
        EXPECT_EQ(back.doorFolder.text(), u"C:\\2000lumora\\zmany\\door\\0123456789ab");
        EXPECT_EQ(next.coupon.MisparKoopon, 3);
    }
}

} // namespace
} // namespace lumora
