#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "support/FakeWebLab.h"
#include "support/RecordedSending.h"
#include "support/UploadFormRig.h"

#include <gtest/gtest.h>

#include <functional>
#include <optional>

namespace lumora {
namespace {

const QString threeAttempts = u"לאחר שלוש נסיונות המחשב לא הצליח להעלות את כל ההזמנה"_s;

struct UploadFormTest : ::testing::Test {
    FakeWebLab lab;
    UploadFormRig rig{lab};
};

TEST_F(UploadFormTest, EachFaultEndsInItsPhase) {
    const QString log = UploadFormRig::log();
    const QString first = UploadFormRig::first();
    const QString third = UploadFormRig::third();
    struct Case {
        const char* fault;
        int deadPosts = 0;
        int deadCalls = 0;
        QStringList lost = {}; // at an upload for each time that a name stands here
        int posted = 15;       // in all attempts
        LineStep reason = LineStep::Confirm;
        bool done = false;
        int carefully = -1; // posted in all attempts with Careful, where that differs
        bool carefullyDone = false;
    };
    const Case cases[] = {
        {.fault = "nobody answers",
         .deadPosts = FakeLab::always,
         .deadCalls = FakeLab::always,
         .reason = LineStep::Put,
         .carefully = 0},
        {.fault = "no line to the list", .deadCalls = FakeLab::always, .reason = LineStep::List, .carefully = 0},
        {.fault = "four files lost, and no list has their number",
         .lost = {log, first, UploadFormRig::second(), third},
         .posted = 14,
         .carefully = 9,
         .carefullyDone = true},
        // The two that it still lacks give the number of a list that there is.
        {.fault = "lost once and twice", .lost = {first, first, third}, .posted = 8, .done = true},
        // The load's check takes three calls, that of an attempt three. No list has the number of five. Careful: the
        // log alone is posted until it is there.
        {.fault = "back at the third attempt",
         .deadPosts = 2,
         .deadCalls = 6,
         .reason = LineStep::List,
         .carefully = 7,
         .carefullyDone = true},
    };
    for (const bool careful : {false, true}) {
        for (const auto& c : cases) {
            SCOPED_TRACE(std::string(c.fault) + (careful ? ", careful" : ""));
            const bool done = c.done || (careful && c.carefullyDone);
            FakeWebLab faulty;
            UploadFormRig other(faulty);
            other.state.Careful = careful;
            faulty.deadPosts = c.deadPosts;
            faulty.deadCalls = c.deadCalls;
            for (const QString& name : c.lost)
                ++faulty.losses[name];
            UploadForm& page = other.send();
            EXPECT_EQ(page.phase(), done ? SendingPhase::Success : SendingPhase::NotAll);
            EXPECT_EQ(page.controls().Image5.visible, !done);
            EXPECT_EQ(page.controls().Label1.text, done ? QString() : threeAttempts);
            EXPECT_EQ(faulty.reports.size(), done ? 2 : 0);
            EXPECT_EQ(other.localFiles().size(), 5u);
            EXPECT_EQ(faulty.posted.size(), careful && c.carefully >= 0 ? c.carefully : c.posted);
            if (done) {
                EXPECT_EQ(faulty.uploads.at(UploadFormRig::name()), other.localFiles());
                continue;
            }
            EXPECT_TRUE(page.controls().Label4Reason.visible);
            EXPECT_EQ(page.controls().Label4Reason.text,
                      LineTroubleText(other.state, careful && c.carefully == 0 ? LineStep::List : c.reason, {},
                                      other.localFiles().rbegin()->first));
        }
    }
}

TEST_F(UploadFormTest, CarefullyNothingIsPostedBeforeItIsKept) {
    for (const int postsBefore : {0, 1, 2}) { // the disk is full
        FakeWebLab other;
        UploadFormRig full(other);
        full.state.Careful = true;
        full.keepsState(postsBefore > 0);
        other.onPost = [&](const QString&) { full.keepsState(other.posted.size() != postsBefore); };
        UploadForm& page = full.send();
        EXPECT_EQ(page.phase(), SendingPhase::NotAll);
        EXPECT_EQ(other.posted.size(), postsBefore);
        EXPECT_TRUE(page.controls().Label4Reason.text.contains(u"לפנות מקום בדיסק"_s));
        full.keepsState(true);
        page.Image5_Click();
        full.countDown();
        EXPECT_EQ(page.phase(), SendingPhase::Success);
    }
}

TEST_F(UploadFormTest, AFileThatADeadProgramHadInHandIsSentAgainAndTheListOfBrokenFilesIsNot) {
    for (const auto sending : {Sending::NewOrder, Sending::Resend}) {
        for (const auto& [careful, refused] : {std::pair(true, 0), std::pair(false, 0), std::pair(false, 1)}) {
            FakeWebLab other;
            UploadFormRig dead(other);
            dead.state.Careful = careful;
            other.refusals[UploadFormRig::first()] = refused;
            dead.state.transfer.SugMishloah = sending;
            dead.write(u"Kashloo.txt"_s, "C:\\a.jpp\r\n");
            const OrderFolder order(UploadFormRig::folder());
            const QString path = order.filePath(UploadFormRig::first()).text();
            ASSERT_TRUE(OrderJournal(dead.test.files, order).take(path));
            auto sent = dead.localFiles();
            sent.erase(u"Kashloo.txt"_s);
            other.uploads[UploadFormRig::name()] = sent;
            other.uploads[UploadFormRig::name()][UploadFormRig::first()].chop(5);
            OrderState meanwhile;
            other.onPost = [&](const QString&) { meanwhile = take(ReadOrderState(dead.test.files, order)); };
            EXPECT_EQ(dead.send().phase(), SendingPhase::Success);
            EXPECT_EQ(other.posted, QStringList(1 + refused, UploadFormRig::first()));
            EXPECT_EQ(meanwhile.filesInHand, QStringList(path));
            EXPECT_EQ(meanwhile.phase, OrderState::Phase::Sending);
            EXPECT_EQ(other.uploads[UploadFormRig::name()], sent);
            const OrderState after = take(ReadOrderState(dead.test.files, order));
            EXPECT_TRUE(after.filesInHand.isEmpty());
            EXPECT_EQ(after.phase, OrderState::Phase::Reported);
        }
    }
}

TEST_F(UploadFormTest, CarefullyAFileArrivesInItsLength) {
    const QString first = UploadFormRig::first();
    const QString second = UploadFormRig::second();
    struct Case {
        const char* fault;
        std::function<void(FakeWebLab&)> arrange;
        SendingPhase end;
        int posted;
        bool whole;
        bool byNameOnly = false;
        int asked = 1;                                // for the length of the second file
        SendingPhase builtIn = SendingPhase::Success; // with five posts
    };
    using enum SendingPhase;
    const QByteArray all = (QStringList(UploadFormRig::name()) +
                            rig.test.files.names(UploadFormRig::folder(), u"*.*"_s) + QStringList(u"total:5"_s))
                               .join(u"~~"_s)
                               .toLatin1();
    const auto strike = [&](std::map<QString, int> FakeWebLab::*fault, int times, bool tellsLengths) {
        return [=](FakeWebLab& faulty) {
            (faulty.*fault)[first] = times;
            faulty.tellsNoLength = !tellsLengths;
        };
    };
    const Case cases[] = {
        {"half of a file stored, once", strike(&FakeWebLab::halves, 1, true), Success, 6, true},
        {"no HEAD, half of a file stored", strike(&FakeWebLab::halves, 1, false), Success, 5, false, true},
        {"an answer lost", strike(&FakeWebLab::lostAnswers, 1, true), Success, 5, true},
        {"no HEAD, an answer lost", strike(&FakeWebLab::lostAnswers, 1, false), Success, 6, true, true},
        {"no HEAD, half of a file stored and answered with 500",
         [&](FakeWebLab& faulty) {
             strike(&FakeWebLab::halves, 1, false)(faulty);
             faulty.refusals[first] = 1;
         },
         Success, 6, true, true},
        {"HEAD: 404", [](FakeWebLab& faulty) { faulty.knowsNoHead = true; }, Success, 5, true, true},
        {"listed, and HEAD finds nothing",
         [&](FakeWebLab& faulty) {
             faulty.losses[first] = 1;
             faulty.onPost = [&](const QString&) {
                 if (faulty.posted.size() == 5)
                     faulty.listInstead = all;
             };
         },
         Success, 6, true},
        {"no HEAD, each answer lost", strike(&FakeWebLab::lostAnswers, FakeLab::always, false), NotAll, 7, true, true,
         0},
        {"a file that was proven is lost, and half of it stored",
         [&](FakeWebLab& faulty) {
             faulty.halves[first] = 1;
             faulty.onPost = [&](const QString& name) {
                 if (name == first && faulty.posted.count(first) == 2) {
                     faulty.uploads[UploadFormRig::name()].erase(second);
                     faulty.halves[second] = 1;
                 }
             };
         },
         NotAll, 7, false, false, 2},
    };
    for (const bool careful : {true, false}) {
        for (const auto& c : cases) {
            SCOPED_TRACE(std::string(c.fault) + (careful ? ", careful" : ""));
            FakeWebLab other;
            UploadFormRig cut(other);
            cut.state.Careful = careful;
            c.arrange(other);
            EXPECT_EQ(cut.send().phase(), careful ? c.end : c.builtIn);
            EXPECT_EQ(other.posted.size(), careful ? c.posted : 5);
            if (careful) {
                EXPECT_EQ(other.uploads[UploadFormRig::name()] == cut.localFiles(), c.whole);
                EXPECT_EQ(other.urls.filter(u"/uploads/"_s).filter(second).size(), c.asked)
                    << "a file that is proven is not asked for again";
            }
            if (careful && c.end == Success) {
                EXPECT_EQ(take(ReadOrderState(cut.test.files, OrderFolder(UploadFormRig::folder()))).provenByNameOnly,
                          c.byNameOnly);
            }
        }
    }
}

// The folder on the server bears the order's name: whose is it?
TEST_F(UploadFormTest, CarefullyNothingIsPostedIntoTheFolderOfAnotherOrder) {
    const QString log = UploadFormRig::log();
    const QString name = UploadFormRig::name();
    struct Case {
        const char* what;
        FakeLab::Folder there;
        bool ours;
        bool postedInto = false; // by this order, as its state says
    };
    const Case cases[] = {
        {"its own log, and a stray", {{log, "the order"}, {u"x.jpp"_s, "x"}}, true},
        {"another log", {{log, "no order"}}, false},
        {"half of its log, which it has not posted", {{log, "the or"}}, false},
        {"names, and no log", {{UploadFormRig::first(), "another's"}}, false},
        {"names, and posted into by this order", {{UploadFormRig::first(), "x"}}, true, true},
    };
    for (const Case& each : cases) {
        for (const auto& [careful, basketKept] : {std::pair(true, true), {true, false}, {false, true}}) {
            SCOPED_TRACE(std::string(each.what) + (careful ? ", careful" : "") + (basketKept ? ", basket kept" : ""));
            FakeWebLab other;
            UploadFormRig order(other);
            order.state.Careful = careful;
            order.chain.registerPage(PageId::Form2, [] { return std::make_unique<Page>(PageId::Form2); });
            order.state.shemot.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
            order.write(u"picture.jpg"_s, "a picture of the basket");
            OrderJournal journal(order.test.files, OrderFolder(UploadFormRig::folder()));
            const QString line = u"021015GNB"_s + UploadFormRig::local(u"picture.jpg"_s).text();
            ASSERT_TRUE(journal.begin(order.state, OrderState::Way::Http, QStringList(basketKept ? 1 : 0, line)));
            ASSERT_TRUE(journal.prepared());
            ASSERT_TRUE(!each.postedInto || journal.sendingBegins(Sender::Http, true));
            other.uploads = {{u"2026_11_21_KUP_1234^106"_s, {}}, {name, each.there}};
            order.start();
            order.countDown();
            if (each.ours || !careful) {
                EXPECT_EQ(order.page().phase(), SendingPhase::Success);
                continue;
            }
            EXPECT_EQ(other.posted, QStringList());
            EXPECT_EQ(other.uploads[name], each.there);
            if (!basketKept) {
                EXPECT_EQ(order.page().phase(), SendingPhase::CallLab);
                EXPECT_TRUE(order.page().controls().Label4Reason.text.contains(u"הזמנה אחרת"_s));
                EXPECT_TRUE(order.page().controls().Label1.text.isEmpty()) << "there were no three attempts";
                continue;
            }
            EXPECT_EQ(order.chain.front()->id(), PageId::Form2);
            EXPECT_EQ(order.state.MisparHazmana, u"107"_s);
            EXPECT_EQ(order.state.handOver.replaced, UploadFormRig::folder());
            EXPECT_TRUE(order.test.dialogs.messages.value(0).contains(u"105"_s));
        }
    }
}

// No server makes a folder for one order alone: two orders of one name may both have found none.
TEST_F(UploadFormTest, CarefullyTheLogGoesFirstAndTheRestOnlyWhereItStaysThere) {
    const QString log = UploadFormRig::log();
    const QString name = UploadFormRig::name();
    const QString other = u"091015GNB0000_03ZZZZ.jpp"_s;
    struct Case {
        const char* what;
        std::function<void(FakeWebLab&)> arrange;
        SendingPhase end;
        int posted;
    };
    using enum SendingPhase;
    const auto behind = [&](int post, const QString& file) {
        return [=](FakeWebLab& faulty) {
            faulty.onFetch = [=, &faulty] {
                if (faulty.posted.size() == post)
                    faulty.uploads[name][file] = "another's";
            };
        };
    };
    const auto page = [&](int status) { return [=](FakeWebLab& faulty) { faulty.pages[log] = {"the log", status}; }; };
    const auto times = [&](std::map<QString, int> FakeWebLab::*fault, int count) {
        return [=](FakeWebLab& faulty) { (faulty.*fault)[log] = count; };
    };
    const Case cases[] = {
        {"nobody else", [](FakeWebLab&) {}, Success, 5},
        {"another log behind it", behind(1, log), CallLab, 1},
        {"another's print beside it", behind(1, other), CallLab, 1},
        {"another log behind the last file", behind(5, log), CallLab, 5},
        {"half of it stored, once", times(&FakeWebLab::halves, 1), Success, 6},
        {"half of it stored, and cut", times(&FakeWebLab::cuts, 1), Success, 6},
        {"its answer lost", times(&FakeWebLab::lostAnswers, 1), Success, 5},
        {"never stored", times(&FakeWebLab::losses, FakeLab::always), NotAll, 6},
        {"not given out", page(403), Success, 5},
        {"answered with a fault", page(500), NotAll, 1},
    };
    for (const Case& each : cases) {
        SCOPED_TRACE(each.what);
        FakeWebLab faulty;
        UploadFormRig order(faulty);
        order.state.Careful = true;
        each.arrange(faulty);
        EXPECT_EQ(order.send().phase(), each.end);
        EXPECT_EQ(faulty.posted.value(0), log);
        EXPECT_EQ(faulty.posted.size(), each.posted);
        EXPECT_EQ(faulty.uploads[name] == order.localFiles(), each.end == Success);
        const OrderState kept = take(ReadOrderState(order.test.files, OrderFolder(UploadFormRig::folder())));
        EXPECT_EQ(kept.folderMadeByUs, each.end == Success);
        EXPECT_EQ(faulty.reports.isEmpty(), each.end != Success);
    }
}

TEST_F(UploadFormTest, AnErrorPageDoesNotTellWhoseAFolderIs) {
    const QString script = u"listfileb.php"_s;
    const struct {
        const char* what;
        QString address;
        WebAnswer page;
        std::optional<bool> folder; // what the same page tells of another name
        SendingPhase end = SendingPhase::NotAll;
    } cases[] = {
        {"the script's own answer", script, {"folder not found"}, false, SendingPhase::Success},
        {"no script", script, {"404 Not Found", 404}, std::nullopt},
        {"a short page", script, {"<html>You are not logged in"}, true},
        {"a long text", script, {"You are not logged in. Please log in to go on."}, true},
        {"a list with the word", script, {"a~~notes.jpp~~total:2"}, true},
        {"a log that is not given out", UploadFormRig::log(), {"no order", 500}, false},
    };
    for (const auto& each : cases) {
        SCOPED_TRACE(each.what);
        FakeWebLab other;
        UploadFormRig order(other);
        order.state.Careful = true;
        other.pages[each.address] = each.page;
        const FakeLab::Folder there{{UploadFormRig::log(), "no order"}};
        const bool free = each.end == SendingPhase::Success;
        if (!free)
            other.uploads[UploadFormRig::name()] = there;
        RecordedSending told;
        EXPECT_EQ(HttpSender(order.state, order.test.platform, told).hasFolder(u"2026_11_21_KUP_1234^106"_s),
                  each.folder);
        if (free)
            other.pages.clear();
        EXPECT_EQ(order.send().phase(), each.end);
        EXPECT_EQ(other.posted.isEmpty(), !free);
        EXPECT_TRUE(free || other.uploads[UploadFormRig::name()] == there);
    }
}

TEST_F(UploadFormTest, TheLabsCheckByNamesLeavesWhatIsToBeSent) {
    rig.state.Careful = true;
    lab.uploads[UploadFormRig::name()] = rig.localFiles();
    lab.uploads[UploadFormRig::name()][UploadFormRig::first()].chop(5);
    rig.start().Command7_Click();
    EXPECT_EQ(rig.page().controls().TxtWeb.text, u"1"_s);
    EXPECT_EQ(rig.page().controls().Label12.text, u"1"_s);
    rig.page().Command10_Click();
    rig.countDown();
    EXPECT_TRUE(hasArrived(rig.page().phase()));
    EXPECT_EQ(lab.uploads[UploadFormRig::name()], rig.localFiles());
}

TEST_F(UploadFormTest, AStopTakesEffectAtOnceAndTheSendingGoesOnFromThere) {
    for (const auto phase : {SendingPhase::Preparing, SendingPhase::Sending, SendingPhase::Checking}) {
        for (const bool inPost : {false, true}) {
            if (inPost && phase != SendingPhase::Sending)
                continue;
            FakeWebLab other;
            UploadFormRig stopped(other);
            OrderJournal journal(stopped.test.files, OrderFolder(UploadFormRig::folder()));
            ASSERT_TRUE(journal.begin(stopped.state, OrderState::Way::Http, {u"a line of the basket"_s}));
            ASSERT_TRUE(journal.prepared());
            int pressedAt = 0;
            const auto press = [&] {
                if (pressedAt > 0 || !stopped.chain.find(PageId::UploadForm) || stopped.page().phase() != phase)
                    return;
                pressedAt = stopped.test.pump.count;
                stopped.page().Command15_Click();
            };
            if (inPost)
                other.onPost = [&](const QString&) { press(); };
            else
                stopped.test.pump.onPump = press;
            stopped.send();
            EXPECT_EQ(stopped.page().phase(), SendingPhase::Stopped);
            EXPECT_EQ(other.aborts, 1);
            EXPECT_EQ(take(ReadOrderState(stopped.test.files, OrderFolder(UploadFormRig::folder()))).items.isEmpty(),
                      !other.posted.isEmpty());
            EXPECT_LT(stopped.test.pump.count - pressedAt, 20);
            EXPECT_EQ(other.reports, QStringList());
            stopped.page().Command10_Click();
            stopped.countDown();
            EXPECT_TRUE(hasArrived(stopped.page().phase()));
            EXPECT_EQ(other.uploads[UploadFormRig::name()], stopped.localFiles());
            EXPECT_EQ(other.posted.size(), inPost ? 6 : 5);
        }
    }
}

TEST_F(UploadFormTest, CarefullyASilentServerEndsTheSending) {
    for (const bool standsStill : {true, false}) {
        FakeWebLab silent;
        UploadFormRig rigged(silent);
        rigged.state.Careful = true;
        silent.deadConnectKind = Failure::Kind::TimedOut;
        silent.deadPosts = standsStill ? 0 : FakeLab::always;
        silent.onPost = [&](const QString&) {
            for (int i = 0; standsStill && i < 31; ++i) {
                rigged.test.clock.ran += std::chrono::seconds(10);
                rigged.page().Timer4Line_Tick();
            }
        };
        UploadForm& page = rigged.send();
        EXPECT_EQ(page.phase(), SendingPhase::NotAll);
        EXPECT_EQ(silent.posted.size(), standsStill ? 1 : 2);
        EXPECT_EQ(silent.aborts, standsStill ? 1 : 0);
        EXPECT_TRUE(page.controls().Label4Reason.text.contains(u"איטי מדי"_s));
        EXPECT_EQ(page.controls().Label1.text, QString()) << "there were no three attempts";
        silent.deadPosts = 0;
        silent.onPost = {};
        page.Image5_Click();
        rigged.countDown();
        EXPECT_EQ(page.phase(), SendingPhase::Success);
        EXPECT_EQ(silent.uploads[UploadFormRig::name()], rigged.localFiles());
    }
}

TEST_F(UploadFormTest, AnOrderThatLacksAPictureOfItsLogArrivesAndIsReportedOnceWhereTheCustomerWantsThat) {
    const QStringList lines(4, u"021015GNBC:\\pics\\aabb.jpg"_s);
    rig.state.shemot.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
    rig.write(UploadFormRig::log(),
              OrderLog::of(rig.state, OrderLog::Layout::Plain, lines, {}, rig.test.clock.time).write());
    rig.state.Careful = true;
    rig.state.transfer.leftOut = {{u"C:\\pics\\gone.jpg"_path}};
    rig.test.dialogs.answers = {true};
    EXPECT_EQ(rig.start().phase(), SendingPhase::Waiting) << "for the answer about the picture that was left out";
    rig.page().Command4Bli_Click();
    rig.countDown();
    EXPECT_EQ(rig.page().phase(), SendingPhase::AllThere);
    EXPECT_EQ(lab.uploads[UploadFormRig::name()], rig.localFiles());
    EXPECT_TRUE(rig.page().controls().Label4Do.text.contains(u"3 מתוך 4"_s));
    EXPECT_FALSE(rig.page().controls().Label4Count.visible) << "not the whole order went up";
    const OrderState kept = take(ReadOrderState(rig.test.files, OrderFolder(UploadFormRig::folder())));
    EXPECT_TRUE(kept.phase == OrderState::Phase::Reported && kept.fewerAgreed);
    rig.test.dialogs.answers = {true};
    rig.page().Command2_Click();
    EXPECT_EQ(rig.page().phase(), SendingPhase::AllThere);
    EXPECT_EQ(lab.reports.size(), 2);
}

TEST_F(UploadFormTest, TheWayBackToThePicturesEndsTheCheckAndLeavesNothingBehind) {
    for (const bool careful : {false, true}) {
        FakeWebLab other;
        UploadFormRig back(other);
        back.state.Careful = careful;
        back.registerBare({PageId::kyoskNew});
        back.state.handOver.basket = {u"021015GNBC:\\pics\\aabb.jpg"_s};
        back.state.transfer.leftOut = {{u"C:\\pics\\gone.jpg"_path}};
        other.onFetch = [&] { back.page().changeOrder_Click(), back.page().Command4Hazor_Click(); };
        back.chain.show(PageId::UploadForm);
        back.page().Form_Activate();
        EXPECT_EQ(back.chain.front()->id(), PageId::kyoskNew);
        EXPECT_EQ(other.urls.size(), 1);
        EXPECT_FALSE(back.test.files.folderExists(UploadFormRig::folder()));
    }
}

TEST_F(UploadFormTest, CarefullyAnOrderThatIsFoundThereIsReportedOnceByWhomeverItIsFound) {
    for (const auto sending : {Sending::NewOrder, Sending::Resend}) {
        for (const bool careful : {true, false}) {
            FakeWebLab other;
            UploadFormRig found(other);
            found.state.Careful = careful;
            found.state.transfer.SugMishloah = sending;
            other.uploads[UploadFormRig::name()] = found.localFiles();
            // Without a state a resend is one of an earlier version, which may have told the lab.
            ASSERT_TRUE(
                OrderJournal(found.test.files, OrderFolder(UploadFormRig::folder())).sendingBegins(Sender::Http, true));
            UploadForm& page = found.start();
            EXPECT_EQ(page.phase(), careful ? SendingPhase::Success : SendingPhase::AllThere);
            EXPECT_EQ(other.reports.size(), careful ? 2 : 0);
            page.Command2_Click();
            EXPECT_EQ(page.phase(), SendingPhase::AllThere);
            EXPECT_TRUE(page.controls().Label11.visible);
            EXPECT_FALSE(page.counting());
            EXPECT_EQ(other.reports.size(), careful ? 2 : 0);
            EXPECT_EQ(other.posted.size(), 0);
        }
    }
}

TEST_F(UploadFormTest, AnOrderThatArrivedBeforeIsOnlyReported) {
    ASSERT_TRUE(OrderJournal(rig.test.files, OrderFolder(UploadFormRig::folder())).arrived(true));
    EXPECT_EQ(rig.start().phase(), SendingPhase::Success);
    EXPECT_EQ(lab.reports.size(), 2);
    EXPECT_EQ(lab.urls.size(), 2) << "no list";
}

TEST_F(UploadFormTest, AFileThatNeverCameToTheLineIsNotLaidToTheServer) {
    const QString quoted = u"311015GNB0003_03\".jpp"_s; // its header would end at the quote
    rig.write(quoted, "x");
    UploadForm& page = rig.send();
    EXPECT_EQ(page.look().sign, SendingSign::Bad);
    EXPECT_EQ(page.controls().Label12.text, u"1"_s);
    EXPECT_EQ(page.controls().Label4Reason.text, LineTroubleText(rig.state, LineStep::File, {}, quoted));
    EXPECT_EQ(lab.posted.size(), 5);
}

TEST_F(UploadFormTest, AnOldListPassesForNothingAndIsNotSent) {
    rig.write(UploadFormRig::list(),
              UploadFormRig::name().toLatin1() + "~~!105_1234.jpg~~" + UploadFormRig::first().toLatin1() + "~~total:2");
    lab.refusesLists = true;
    UploadForm& page = rig.send();
    EXPECT_EQ(page.look().sign, SendingSign::Bad);
    EXPECT_EQ(page.lists().List4Kvazim.count(), 5);
    EXPECT_FALSE(lab.posted.contains(UploadFormRig::list()));
    EXPECT_FALSE(rig.test.files.fileExists(UploadFormRig::folder() / UploadFormRig::list()));
}

TEST_F(UploadFormTest, AListThatCanNotBeKeptIsATroubleOfThisComputer) {
    rig.makeFolder(UploadFormRig::folder() / UploadFormRig::list()); // where the list should be stored
    UploadForm& page = rig.send();
    EXPECT_EQ(page.look().sign, SendingSign::Bad);
    EXPECT_EQ(page.controls().Label4Reason.text, LineTroubleText(rig.state, LineStep::KeepList, {}));
    std::filesystem::remove(rig.host(UploadFormRig::folder() / UploadFormRig::list()));
    page.Image5_Click();
    EXPECT_TRUE(hasArrived(page.phase()));
}

TEST_F(UploadFormTest, NothingMoreIsSentOnceThePageIsLeft) {
    lab.onPost = [&](const QString&) { rig.page().Image3_Click(); };
    rig.send();
    EXPECT_EQ(lab.posted.size(), 1);
    EXPECT_TRUE(rig.chain.hasEnded());
}

TEST(HttpSender, BelievesAListOnlyOfTheOrdersFolderAndWithATotal) {
    FakeWebLab lab;
    UploadFormRig rig{lab};
    RecordedSending told;
    HttpSender sender(rig.state, rig.test.platform, told);
    sender.BuildOrderFileList();
    lab.uploads[UploadFormRig::name()]; // the folder stands
    lab.listInstead = UploadFormRig::name().toLatin1() + "~~021015GNB0000_03AABB.jpp~~!105_1234.jpg";
    EXPECT_EQ(sender.CheckOrderOnServer(0), ServerVerdict::NotVerified);
    EXPECT_EQ(told.number(SendingMoment::Missing), 3) << "what is named counts all the same";
    sender.lists.List4Kvazim.clear();
    EXPECT_EQ(sender.CheckOrderOnServer(0), ServerVerdict::OtherFolder);
    sender.lists.List4Kvazim.append(u"C:\\elsewhere\\a.jpp"_s);
    EXPECT_EQ(sender.CheckOrderOnServer(0), ServerVerdict::OtherFolder);
}

} // namespace
} // namespace lumora
