#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "order/OrderState.h"
#include "support/FtpFrmRig.h"
#include "transfer/delivery/PreparedAgain.h"
#include "transfer/delivery/SilenceLimit.h"

#include <gtest/gtest.h>

#include <chrono>
#include <functional>

namespace lumora {

namespace {

// The sending page with the guards on or off. The order's log names its two pictures.
struct Guarded : FtpFrmLine {
    explicit Guarded(bool careful) {
        rig.state.Careful = careful;
        rig.state.shemot.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
        const QStringList items = {u"021015GNBC:\\pics\\aabb.jpg"_s, u"111015GNBC:\\pics\\aacc.jpg"_s};
        rig.write(FtpFrmRig::log(),
                  OrderLog::of(rig.state, OrderLog::Layout::Plain, items, {}, rig.test.clock.time).write());
    }
    void remove(const QString& leaf) { EXPECT_TRUE(rig.test.files.removeFile(FtpFrmRig::local(leaf))); }
    // The state that an earlier run left; with a basket the order was never sent.
    void keep(const QStringList& basket, bool folderMadeByUs) {
        EXPECT_TRUE(journal().begin(rig.state, OrderState::Way::Ftp, basket) && journal().prepared());
        EXPECT_TRUE(!folderMadeByUs || journal().sendingBegins(Sender::Ftp, true));
    }
    OrderJournal journal() const { return {rig.test.files, OrderFolder(FtpFrmRig::folder())}; }
    OrderState kept() const {
        const Result<OrderState> state = ReadOrderState(rig.test.files, OrderFolder(FtpFrmRig::folder()));
        return state ? *state : OrderState();
    }
};

} // namespace

TEST(FtpGuards, CarefullyAnOrderThatLacksPicturesLeavesOnlyAtTheCustomersWord) {
    struct Case {
        const char* what;
        std::function<void(Guarded&)> arrange;
        QList<bool> answers;
        SendingPhase phase;
        int messages;
        int questions;
    };
    const auto onePrint = [](Guarded& order) { order.remove(FtpFrmRig::second()); };
    const auto cut = [](Guarded& order) {
        order.keep({}, false);
        order.rig.write(FtpFrmRig::second(), "x");
    };
    const auto sheetAlone = [](Guarded& order) { order.rig.takeUpAgain({FtpFrmRig::log(), FtpFrmRig::sheet()}); };
    using enum SendingPhase;
    const Case cases[] = {
        {"whole", [](Guarded&) {}, {}, Countdown, 0, 0},
        {"the whole choice cancelled", sheetAlone, {}, Refused, 1, 0},
        {"a picture is gone, no", onePrint, {false}, Refused, 0, 1},
        {"a picture is gone, yes", onePrint, {true}, Countdown, 0, 1},
        {"a picture was cut, no", cut, {false}, Refused, 0, 1},
        {"a picture was cut, yes", cut, {true}, Countdown, 0, 1},
        {"no log tells", [](Guarded& order) { order.remove(FtpFrmRig::log()); }, {}, Countdown, 0, 0},
    };
    for (const Case& each : cases) {
        for (const bool careful : {true, false}) {
            SCOPED_TRACE(std::string(each.what) + (careful ? ", careful" : ""));
            Guarded order(careful);
            each.arrange(order);
            order.rig.test.dialogs.answers = each.answers;
            EXPECT_EQ(order.rig.start().phase(), careful ? each.phase : SendingPhase::Countdown);
            EXPECT_EQ(order.rig.test.dialogs.messages.size(), careful ? each.messages : 0);
            ASSERT_EQ(order.rig.test.dialogs.questions.size(), careful ? each.questions : 0);
            if (careful && each.questions > 0) {
                EXPECT_TRUE(order.rig.test.dialogs.questions[0].contains(u"2 תמונות, ורק 1"_s));
            }
            if (careful && each.phase == SendingPhase::Refused) {
                EXPECT_TRUE(
                    order.rig.page().whyItEnded().english.contains(each.questions > 0 ? u"only 1"_s : u"no picture"_s));
                order.rig.page().Command4_Click();
                EXPECT_TRUE(order.lab.puts.isEmpty()) << "no other button sends what was refused";
                order.rig.test.dialogs.answers = {true};
                order.rig.page().Command10_Click();
                EXPECT_EQ(order.rig.page().phase(),
                          each.questions > 0 ? SendingPhase::Countdown : SendingPhase::Refused);
            }
        }
    }
}

TEST(FtpGuards, ALimitOfSilenceCountsFilesAndBytes) {
    SessionState state;
    state.Careful = true;
    struct Step {
        int second;
        qint64 bytes;
    };
    struct Case {
        const char* what;
        std::vector<Step> steps; // each 20 seconds between two of them is told too, with the bytes of the one before
        bool over;
    };
    const Case cases[] = {
        {"nothing for five minutes", {{0, 0}, {299, 0}}, false},
        {"and a second more", {{0, 0}, {300, 0}}, true},
        {"slow", {{0, 0}, {300, 299'999}}, true},
        {"just fast enough", {{0, 0}, {300, 300'000}}, false},
        {"fast, then still", {{0, 0}, {100, 9'000'000}, {399, 9'000'000}}, false},
        {"fast, then still for long", {{0, 0}, {100, 9'000'000}, {420, 9'000'000}}, true},
        {"the program is held", {{0, 0}, {7200, 0}}, false},
        {"the program is held each time", {{0, 0}, {7200, 0}, {14400, 0}, {21600, 0}, {28800, 0}, {36000, 0}}, true},
    };
    for (const Case& each : cases) {
        SilenceLimit limit(state);
        limit.begin();
        int second = each.steps.front().second;
        qint64 bytes = 0;
        for (const Step& step : each.steps) {
            for (; step.second - second < 3600 && second < step.second; second += 20)
                limit.moved(bytes, std::chrono::seconds(second));
            second = step.second;
            bytes = step.bytes;
            limit.moved(bytes, std::chrono::seconds(second));
        }
        EXPECT_EQ(limit.over(), each.over) << each.what;
        limit.begin();
        EXPECT_FALSE(limit.over()) << each.what;
    }
    SilenceLimit limit(state);
    for (const bool timedOut : {true, false, true})
        limit.connectsTimedOut(timedOut);
    EXPECT_FALSE(limit.over());
    limit.connectsTimedOut(true);
    EXPECT_TRUE(limit.over());
    state.Careful = false;
    EXPECT_FALSE(limit.over());
}

TEST(FtpGuards, CarefullyAServerThatFallsSilentEndsTheSending) {
    // Nobody answers any more after the put of this name; empty: from the first connect on.
    const auto dead = [](const QString& after) {
        return [=](Guarded& order) {
            order.lab.deadConnectKind = Failure::Kind::TimedOut;
            order.lab.deadConnects = after.isEmpty() ? FakeLab::always : 0;
            order.lab.onPut = [=, &order](const QString& name) {
                order.lab.deadConnects = name == after ? FakeLab::always : 0;
            };
        };
    };
    const auto wait = [](Guarded& order) {
        for (int i = 0; i < 31; ++i) {
            order.rig.test.clock.ran += std::chrono::seconds(10);
            order.rig.test.clock.time = order.rig.test.clock.time.addSecs(-60);
            order.rig.page().Timer4Line_Tick();
        }
    };
    const auto inAPut = [=](Guarded& order) {
        order.lab.onPut = [=, &order](const QString& name) { name == FtpFrmRig::first() ? wait(order) : void(); };
    };
    const auto inTheCheck = [=](Guarded& order) {
        order.lab.onConnect = [=, &order](int number) { number == 6 ? wait(order) : void(); };
    };
    using enum SendingPhase;
    const struct {
        const char* what;
        std::function<void(Guarded&)> arrange;
        SendingPhase end, builtIn;
        int connects, inHand;
    } cases[] = {{"no file finds the server", dead({}), NotAll, NotAll, 2 * 5, 0},
                 {"a put stands still", inAPut, NotAll, Success, 3, 1},
                 {"the check does not find the server", dead(FtpFrmRig::proof()), Unclear, NotAll, 5 + 2 * 5, 0},
                 {"the check stands still", inTheCheck, Unclear, Success, 6, 0}};
    for (const auto& one : cases) {
        for (const bool careful : {true, false}) {
            SCOPED_TRACE(std::string(one.what) + (careful ? ", careful" : ""));
            Guarded order(careful);
            one.arrange(order);
            order.rig.send();
            const FtpFrmControls& shown = order.rig.page().controls();
            EXPECT_EQ(order.rig.page().phase(), careful ? one.end : one.builtIn);
            EXPECT_EQ((shown.Label2.text + shown.Label4Reason.text).contains(u"איטי מדי"_s), careful);
            EXPECT_TRUE(order.rig.test.dialogs.messages.isEmpty()) << "the customer has not stopped it";
            if (careful) {
                EXPECT_TRUE(shown.Label34.text.isEmpty()) << "the first attempt alone";
                EXPECT_EQ(order.lab.connects, one.connects);
                EXPECT_EQ(order.kept().filesInHand.size(), one.inHand);
            }
            order.lab.onPut = {};
            order.lab.onConnect = {};
            order.lab.deadConnects = 0;
            order.rig.page().Command10_Click();
            EXPECT_EQ(order.rig.page().phase(), Success);
            EXPECT_EQ(order.remote()[FtpFrmRig::first()], order.rig.localFiles()[FtpFrmRig::first()]);
        }
    }
}

TEST(FtpGuards, NothingIsPutBeforeItIsKept) {
    for (const int putsBefore : {0, 1}) { // the disk is full
        for (const bool careful : {true, false}) {
            SCOPED_TRACE(std::to_string(putsBefore) + (careful ? ", careful" : ""));
            Guarded order(careful);
            order.rig.keepsState(putsBefore > 0);
            order.lab.onPut = [&](const QString&) { order.rig.keepsState(false); };
            order.rig.send();
            FtpFrm& page = order.rig.page();
            EXPECT_EQ(page.phase(), careful ? SendingPhase::NotAll : SendingPhase::Success);
            EXPECT_EQ(order.rig.test.dialogs.messages.size(), careful ? 0 : 1) << "nothing goes on";
            EXPECT_EQ(order.lab.puts.size(), careful ? putsBefore : 5);
            EXPECT_EQ(page.controls().Label2.text.contains(u"לפנות מקום בדיסק"_s), careful);
            if (!careful)
                continue;
            order.lab.onPut = {};
            order.rig.keepsState(true);
            page.Command10_Click();
            EXPECT_EQ(page.phase(), SendingPhase::Success);
        }
    }
}

TEST(FtpGuards, AReportIsCutByAStopAndByTimeAndRepeatedByTheOperator) {
    const std::function<void(FtpFrm&)> ways[] = {[](FtpFrm& page) { page.Command15_Click(); },
                                                 [](FtpFrm& page) {
                                                     for (int second = 0; second < 120; ++second)
                                                         page.Timer4Report_Tick();
                                                 }};
    for (const auto& cut : ways) {
        Guarded order(true);
        order.lab.onFetch = [&] {
            EXPECT_EQ(order.rig.page().phase(), SendingPhase::Reporting);
            cut(order.rig.page());
        };
        order.rig.send();
        FtpFrm& page = order.rig.page();
        EXPECT_EQ(order.lab.urls.size(), 1) << "no further call";
        EXPECT_GE(order.lab.aborts, 1);
        EXPECT_EQ(order.kept().report, OrderState::Report::Begun);
        EXPECT_EQ(page.phase(), SendingPhase::Success);
        EXPECT_TRUE(page.reportUnknown() && page.mayReportAgain());
        order.lab.onFetch = {};
        page.Command4Dooach_Click();
        EXPECT_EQ(page.phase(), SendingPhase::Success);
        EXPECT_EQ(order.lab.urls.size(), 1 + 3);
        EXPECT_EQ(order.kept().report, OrderState::Report::Done);
        EXPECT_FALSE(page.reportUnknown());
    }
}

// Killed between the verdict and the report; meanwhile the lab has taken the files away.
TEST(FtpGuards, AnOrderThatArrivedBeforeIsOnlyReported) {
    for (const auto& [careful, agreed] : {std::pair(true, false), {true, true}, {false, false}, {false, true}}) {
        Guarded order(careful);
        order.keep({}, true);
        ASSERT_TRUE(agreed ? order.journal().arrivedAsAgreed() : order.journal().arrived(true));
        EXPECT_EQ(order.rig.start().phase(), careful && agreed ? SendingPhase::AllThere : SendingPhase::Success);
        EXPECT_EQ(order.lab.connects, 0);
        EXPECT_EQ(order.lab.urls.size(), 3);
        EXPECT_EQ(order.kept().phase, OrderState::Phase::Reported);
        EXPECT_EQ(order.rig.page().provenByNameOnly(), careful && !agreed);
    }
}

// The folder on the server bears the order's name: whose is it?
TEST(FtpGuards, CarefullyNothingIsPutIntoTheFolderOfAnotherOrder) {
    using Phase = OrderState::Phase;
    const QByteArray otherLog = "\"00\",\"00\"\r\n\"Shemot.n1\",\"Someone else\"\r\n";
    const auto askFor = [](Guarded& order) { EXPECT_TRUE(order.journal().folderIsAsked(Sender::Ftp)); };
    const auto postTo = [](Guarded& order) { EXPECT_TRUE(order.journal().folderIsAsked(Sender::Http)); };
    struct Case {
        const char* what;
        std::function<void(Guarded&)> arrange;
        bool ours;
    };
    const auto lies = [](const QString& name, const QByteArray& bytes) {
        return [=](Guarded& order) { order.remote() = {{name, bytes}}; };
    };
    const auto refused = [&](Guarded& order) {
        askFor(order);
        EXPECT_TRUE(order.journal().folderIsRefused());
    };
    const auto older = [](Guarded& order) {
        static_cast<void>(order.rig.test.files.removeFile(FtpFrmRig::local(u".order"_s)));
        order.rig.takeUpAgain(FtpFrmRig::names().mid(0, 4));
    };
    const auto unread = [](Guarded& order) { order.lab.refusesEmptyListings = true; };
    const auto askedAndUnread = [&](Guarded& order) {
        askFor(order);
        unread(order);
    };
    const auto ours = [](Guarded& order) {
        order.remote() = {{FtpFrmRig::first(), "of an earlier try"}};
        order.keep({}, true);
    };
    const auto hidden = [&](Guarded& order) {
        order.remote() = {{FtpFrmRig::log(), otherLog}};
        order.lab.hiddenFolder = FtpFrmRig::name();
    };
    const QByteArray ownLog = Guarded(true).rig.localFiles()[FtpFrmRig::log()];
    const Case cases[] = {
        {"nothing there", [](Guarded& order) { order.lab.folders.erase(FtpFrmRig::remoteFolder()); }, true},
        {"an empty folder", [](Guarded&) {}, false},
        {"an empty folder, and killed before the answer to its making", askFor, true},
        {"an empty folder, and its making refused", refused, false},
        {"an empty folder, and its log posted to the web server", postTo, false},
        {"an empty folder of an older version", older, true},
        {"a refused listing", unread, false},
        {"a refused listing, and killed before the answer to its making", askedAndUnread, true},
        {"its own log", lies(FtpFrmRig::log(), ownLog), true},
        {"its own log, under ASCII converted",
         [&](Guarded& order) {
             lies(FtpFrmRig::log(), ownLog)(order);
             order.lab.convertsText = true;
         },
         true},
        {"another log", lies(FtpFrmRig::log(), otherLog), false},
        {"names, and no log", lies(FtpFrmRig::first(), "another's"), false},
        {"made by this order", ours, true},
        {"another log, and no listing names the folder", hidden, false},
    };
    for (const Case& each : cases) {
        for (const bool careful : {true, false}) {
            for (const auto& [basketKept, pictureThere] : {std::pair(true, true), {true, false}, {false, true}}) {
                SCOPED_TRACE(std::string(each.what) + (careful ? ", careful" : "") +
                             (basketKept ? ", basket kept" : "") + (pictureThere ? "" : ", picture gone"));
                Guarded order(careful);
                order.rig.chain.registerPage(PageId::Form2, [] { return std::make_unique<Page>(PageId::Form2); });
                order.remote();
                if (basketKept)
                    order.keep({u"021015GNBC:\\pics\\aabb.jpg"_s}, false);
                EXPECT_TRUE(order.rig.test.files.makeFolder(DrivePath(u"C:\\pics"_s)));
                if (pictureThere) {
                    EXPECT_TRUE(order.rig.test.files.writeWhole(DrivePath(u"C:\\pics\\aabb.jpg"_s), "picture"));
                }
                each.arrange(order);
                // On the server the next number is another's too.
                order.lab.folders[u"zalamim234/2026_11_21_KUP_1234^106"_s];
                const auto before = order.lab.folders;
                order.rig.send();
                const bool sends = each.ours || !careful;
                EXPECT_EQ(order.lab.puts.isEmpty(), !sends);
                EXPECT_FALSE(order.rig.test.files.fileExists(FtpFrmRig::local(u".log-there"_s)));
                if (sends) {
                    EXPECT_GE(order.kept().phase, Phase::Sending);
                    continue;
                }
                EXPECT_EQ(order.lab.folders, before);
                if (!basketKept || !pictureThere) {
                    EXPECT_EQ(order.rig.page().phase(), SendingPhase::CallLab);
                    EXPECT_EQ(order.rig.page().controls().Label34.text, QString()) << "the first attempt alone";
                    EXPECT_TRUE(order.rig.page().controls().Label4Reason.text.contains(u"הזמנה אחרת"_s));
                    continue;
                }
                EXPECT_EQ(order.rig.chain.front()->id(), PageId::Form2);
                EXPECT_EQ(order.rig.state.MisparHazmana, u"107"_s);
                EXPECT_EQ(order.rig.state.handOver.lines.size(), 1);
                EXPECT_TRUE(order.rig.state.handOver.pressStart);
                EXPECT_EQ(order.rig.state.handOver.replaced, FtpFrmRig::folder());
                EXPECT_EQ(order.rig.test.dialogs.messages.size(), 1);
                EXPECT_TRUE(order.rig.test.dialogs.messages.value(0).contains(u"105"_s));
            }
        }
    }
}

TEST(FtpGuards, CarefullyNothingIsPutWhereTheOwnerOfAFolderIsNotKnown) {
    Guarded order(true);
    order.remote() = {{FtpFrmRig::first(), "another's"}};
    order.lab.unreadLine = u"?"_s;
    order.rig.send();
    EXPECT_TRUE(order.lab.puts.isEmpty());
    EXPECT_EQ(order.rig.page().phase(), SendingPhase::NotAll);
}

TEST(FtpGuards, AnOrderThatFindsNoOtherNumberLeavesTheSessionAsItWas) {
    Guarded order(true);
    order.keep({u"021015GNBC:\\pics\\aabb.jpg"_s}, false);
    SessionState& state = order.rig.state;
    state.Optint = OrderKind::Album;
    const OrderJournal journal = order.journal();
    PreparedAgain again(state, order.rig.test.platform, journal);
    EXPECT_FALSE(again.handOver([](const QString&) { return std::optional<bool>(); }));
    EXPECT_EQ(state.Optint, OrderKind::Album);
    EXPECT_EQ(state.MisparHazmana, u"105");
}

// Each put is answered well; what the server has stored is another matter.
TEST(FtpGuards, CarefullyAnOrderHasArrivedWhenEachNameAndEachLengthIsThere) {
    using Phase = OrderState::Phase;
    using Content = std::optional<QByteArray>;
    struct Case {
        const char* what;
        std::function<void(Guarded&)> arrange;
        SendingPhase end; // with the guards
        int putsMore;     // than the order has files
        bool reported;
        bool byNameOnly;
        SendingPhase builtIn;
        bool chosenPart = false; // the sending alone does not make the order whole
        bool fewerAgreed = false;
    };
    const auto onFirst = [](int times, const std::function<Content(const QByteArray&)>& change) {
        return [=](Guarded& order) {
            order.lab.stores = [=](const QString& name, const QByteArray& content) mutable -> Content {
                return name == FtpFrmRig::first() && times-- > 0 ? change(content) : Content(content);
            };
        };
    };
    const auto each = [](const std::function<QByteArray(QByteArray)>& change) {
        return [=](Guarded& order) {
            order.lab.stores = [=](const QString&, const QByteArray& content) { return Content(change(content)); };
        };
    };
    const auto half = [](const QByteArray& content) { return Content(content.left(content.size() / 2)); };
    const auto part = [](Guarded& order) {
        order.rig.takeUpAgain({FtpFrmRig::log(), FtpFrmRig::second()});
        order.rig.test.dialogs.answers = {true};
    };
    const auto partOfARest = [&](Guarded& order) {
        part(order);
        for (const QString& name : {FtpFrmRig::first(), FtpFrmRig::sheet()})
            order.remote()[name] = order.rig.localFiles()[name];
        order.keep({}, true);
    };
    const auto halfToldBySize = [=](Guarded& order) {
        onFirst(1, half)(order);
        order.lab.listsLengths = false;
    };
    const auto halfUntold = [=](Guarded& order) {
        onFirst(1, half)(order);
        order.lab.listsLengths = order.lab.tellsSize = false;
    };
    const auto oneCrMissing = [=](Guarded& order) {
        order.rig.write(FtpFrmRig::first(), QByteArray(500, 'x') + '\r');
        onFirst(1, [](const QByteArray& content) { return Content(content.chopped(1)); })(order);
    };
    // An earlier run was cut in the first file; whether that put was confirmed is not known, or was never kept.
    const auto cutInTheFirst = [](bool inHand) {
        return [=](Guarded& order) {
            order.keep({}, true);
            for (const auto& [name, bytes] : order.rig.localFiles())
                order.remote()[name] = name == FtpFrmRig::first() ? bytes.chopped(1) : bytes;
            order.lab.heldOpen = FtpFrmRig::first();
            EXPECT_TRUE(!inHand || order.journal().take(FtpFrmRig::local(FtpFrmRig::first()).text()));
        };
    };
    const int theFirstAndTheSharedName = 2 - static_cast<int>(FtpFrmRig::names().size());
    using enum SendingPhase;
    const Case cases[] = {
        {"whole", [](Guarded&) {}, Success, 0, true, false, Success},
        {"cut in the first file", cutInTheFirst(false), Success, theFirstAndTheSharedName, true, false, Success},
        {"cut in the first file, which is in hand", cutInTheFirst(true), Success, theFirstAndTheSharedName, true, false,
         Success},
        {"half of a file, once", onFirst(1, half), Success, 1, true, false, Success},
        {"half of a file, once, and SIZE alone tells it", halfToldBySize, Success, 1, true, false, Success},
        {"the one CR of a picture is missing", oneCrMissing, Success, 1, true, false, Success},
        {"half of a file, and nothing tells lengths", halfUntold, Success, 0, true, true, Success},
        {"CR dropped", each([](QByteArray content) { return content.replace("\r", ""); }), CallLab, -4, false, false,
         Success},
        {"bare LF to CR LF, which the log has none of", each([](QByteArray content) {
             return content.replace("\r\n", "\1").replace("\n", "\r\n").replace("\1", "\r\n");
         }),
         CallLab, 0, false, false, Success},
        {"a chosen part of an order that is not there", part, PartThere, -2, false, false, Success, true},
        {"fewer than the log names, as agreed",
         [](Guarded& order) {
             order.remove(FtpFrmRig::second());
             order.rig.test.dialogs.answers = {true};
         },
         AllThere, -1, true, false, Success, false, true},
        {"a chosen part that makes the order whole", partOfARest, Success, -2, true, false, AllThere, true},
        {"a chosen part, and a put of the rest was never confirmed",
         [&](Guarded& order) {
             partOfARest(order);
             EXPECT_TRUE(order.journal().take(FtpFrmRig::local(FtpFrmRig::first()).text()));
         },
         PartThere, -2, false, false, AllThere, true},
        {"a line of the listing can't be read", [](Guarded& order) { order.lab.unreadLine = u"?"_s; }, Unclear, 0,
         false, false, NotAll},
    };
    for (const Case& one : cases) {
        for (const bool careful : {true, false}) {
            SCOPED_TRACE(std::string(one.what) + (careful ? ", careful" : ""));
            Guarded order(careful);
            one.arrange(order);
            order.rig.send();
            EXPECT_EQ(order.rig.page().phase(), careful ? one.end : one.builtIn);
            EXPECT_EQ(order.kept().fewerAgreed, one.fewerAgreed);
            if (!careful) {
                EXPECT_EQ(order.kept().phase == Phase::Reported, hasArrived(one.builtIn) && !one.chosenPart);
                continue;
            }
            EXPECT_EQ(order.kept().sentBefore,
                      one.chosenPart && one.end == PartThere && order.kept().filesInHand.isEmpty())
                << "not offered as unfinished";
            EXPECT_EQ(order.lab.puts.size(), FtpFrmRig::names().size() + one.putsMore);
            EXPECT_EQ(order.lab.urls.size(), one.reported ? 3 : 0);
            EXPECT_TRUE(!one.reported || order.lab.urls[0] == order.rig.state.profile.ReportUrl + u"c.txt"_s);
            EXPECT_TRUE(one.end != Success || one.putsMore > 0 || order.rig.page().controls().Label34.text.isEmpty())
                << "the first attempt alone";
            EXPECT_EQ(order.kept().phase == Phase::Reported, one.reported);
            EXPECT_EQ(order.kept().provenByNameOnly, one.byNameOnly);
            EXPECT_LE(order.lab.sizesAsked, 30);
            if (one.end == Success && !one.byNameOnly) {
                for (const auto& [name, bytes] : order.rig.localFiles()) {
                    EXPECT_TRUE(name == u"kashloo.txt"_s || order.remote()[name] == bytes) << name.toStdString();
                }
            }
            if (one.end == CallLab) {
                EXPECT_TRUE(order.rig.page().lists().LogList.items().last().contains(u"Type = I"_s));
                EXPECT_TRUE(order.rig.page().controls().Label4Reason.text.contains(u"משנה את הקבצים"_s));
                EXPECT_EQ(order.rig.page().controls().Label34.text, QString()) << "the first attempt alone";
            }
        }
    }
}

} // namespace lumora
