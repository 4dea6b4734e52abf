#include "transfer/ftp/FtpSender.h"
#include "order/OrderFolder.h"
#include "order/OrderState.h"
#include "support/FakeLab.h"
#include "support/RecordedSending.h"
#include "support/TestPlatform.h"
#include "transfer/delivery/StoppableLine.h"

#include <gtest/gtest.h>

#include <condition_variable>
#include <mutex>

namespace lumora {

namespace {

using enum SendingMoment;

const QString base = u"zalamim234"_s;
const DrivePath folder = u"C:\\order^1"_path;

// The FTP sender over a lab that has the folder of the orders, with an order of three files.
struct Line {
    Line() {
        lab.folders[base];
        profile.FtpServer = u"192.0.2.10"_s;
        profile.FtpFolder2 = base;
        transfer.OrderFolder = folder;
        transfer.ShemTikiya = u"order^1"_s;
        (void)test.files.makeFolder(folder);
        for (const auto& [name, content] : whole())
            EXPECT_TRUE(test.files.writeWhole(path(name), content));
        order(names());
        sender.session.takeSettings();
    }

    static QStringList names() { return {u"log.txt"_s, u"01a.jpp"_s, u"02b.jpp"_s}; }
    // The files of the order by name.
    static FakeLab::Folder whole() {
        FakeLab::Folder files;
        for (const QString& name : names())
            files[name] = name.toLatin1().repeated(50);
        return files;
    }
    static DrivePath path(const QString& name) { return folder / name; }
    void order(const QStringList& leaves) {
        sender.clearLists();
        for (const QString& leaf : leaves)
            sender.lists.List3.append(path(leaf).text());
        sender.beginOrder();
    }
    FakeLab::Folder& remote() { return lab.folders[base + u"/order^1"_s]; }
    void walk() {
        sender.session.FtpOpenInternet();
        sender.session.FtpConnectServer();
        sender.session.EnterFolderTK1();
        sender.session.EnterFolderTK2();
    }

    FakeLab lab;
    TestPlatform test{lab};
    SessionState state;
    ClientProfile& profile = state.profile;
    TransferState& transfer = state.transfer;
    RecordedSending told;
    FtpSender sender{state, test.platform, told};
};

struct FtpSenderTest : ::testing::Test, Line {
    FtpSession& session = sender.session;
    FtpLists& lists = sender.lists;
};

} // namespace

TEST_F(FtpSenderTest, TellsAfterFourRefusedOpensWithTheNumberFive) {
    lab.deadOpens = FakeLab::always;
    session.FtpOpenInternet();
    session.FtpOpenInternet();
    EXPECT_FALSE(session.hOpen);
    EXPECT_EQ(told.number(SendingMoment::NoInternet), 5);
    EXPECT_EQ(told.count(SendingMoment::NoInternet), 1) << "once a pass";
    lab.deadOpens = 3;
    session.FtpOpenInternet();
    EXPECT_TRUE(session.hOpen);
    EXPECT_EQ(told.number(Opening), 4);
}

TEST_F(FtpSenderTest, TriesToConnectFiveTimes) {
    lab.deadConnects = 4;
    walk();
    EXPECT_TRUE(session.bActiveSession);
    EXPECT_EQ(lab.connects, 5);
    EXPECT_EQ(lab.lastChannel, Internet::DataChannel::Passive);
    session.FtpCloseConnection();
    session.passive = false;
    lab.refusedLogins = FakeLab::always;
    walk();
    EXPECT_EQ(lab.lastChannel, Internet::DataChannel::Active);
    EXPECT_FALSE(session.bActiveSession || session.FolderOk);
    EXPECT_EQ(told.number(NotConnected), 5);
    EXPECT_EQ(told.troubles.back().failure.kind, Failure::Kind::Refused);
}

TEST_F(FtpSenderTest, WalksToTheLabsFolderWithOneLevelAndWithTwo) {
    walk();
    EXPECT_TRUE(session.FolderOk && session.insideOrderBase());
    EXPECT_EQ(told.folders, QStringList(u"2 /zalamim234 zalamim234"_s));
    session.FtpCloseConnection();

    lab.folders[u"first"_s];
    lab.folders[u"first/second"_s];
    profile.FtpFolder1 = u"first"_s;
    profile.FtpFolder2 = u"second"_s;
    EXPECT_FALSE(session.insideOrderBase());
    walk();
    EXPECT_TRUE(session.FolderOk && session.insideOrderBase());
    EXPECT_EQ(session.MikumBaSharat, u"first/second"_s);

    profile.FtpFolder2 = u"third"_s;
    session.FtpCloseConnection();
    walk();
    EXPECT_FALSE(session.FolderOk);
    EXPECT_EQ(told.count(FolderMissing), 0) << "a miss of the second level passes in silence";

    profile.FtpFolder1.clear();
    session.FtpCloseConnection();
    walk();
    EXPECT_EQ(session.ConnectFails, 1);
    EXPECT_EQ(told.count(FolderMissing), 1);
}

TEST_F(FtpSenderTest, MakesTheOrdersFolderOnceAndListsItAfterwards) {
    lists.List6.append(u"left over"_s);
    walk();
    EXPECT_TRUE(session.EnterOrderFolder());
    EXPECT_TRUE(lists.List6.isEmpty());
    session.FtpCloseConnection();
    walk();
    EXPECT_TRUE(session.EnterOrderFolder());
    EXPECT_EQ(lists.List6.items(), QStringList(QString())) << "an empty folder lists one empty name";
    remote()[u"a.jpp"_s] = "a";
    lab.failedListings = 1;
    session.ListRemoteHere();
    EXPECT_TRUE(session.colNames.isEmpty());
    EXPECT_FALSE(session.bActiveSession || session.hOpen);
}

TEST_F(FtpSenderTest, NotesAFailedPutWithHourAndMinuteAsTheyAre) {
    test.clock.time = QDateTime(QDate(2026, 11, 21), QTime(9, 5));
    walk();
    EXPECT_FALSE(session.FtpSendFile(u"C:\\none.jpp"_s));
    EXPECT_FALSE(session.FtpSendFile({}));
    EXPECT_EQ(lists.LogList.items(),
              (QStringList{u"95fail to up loadC:\\none.jpp"_s, u"95sendfile-no-image selected"_s}));
    EXPECT_EQ(lists.List7.items(), QStringList(u"C:\\none.jpp"_s));
    EXPECT_EQ(lists.List7.items(), lists.List4Broken.items());
    EXPECT_TRUE(lab.puts.isEmpty());
}

// The faults that a relay can make on a real line stand with the real server; here those of a server's own doing.
TEST(FtpSender, EachFaultEndsInItsPhase) {
    using enum SendingPhase;
    const auto puts = [](const FakeLab::PutFault& fault, bool refusesDelete = false) {
        return [=](Line& line) {
            line.lab.putFaults = {fault};
            line.lab.refusesDelete = refusesDelete;
        };
    };
    const auto order = [](const QStringList& names) { return [=](Line& line) { line.order(names); }; };
    const auto strangers = [=](Line& line) {
        line.remote() = {{u"x1"_s, "x"}, {u"x2"_s, "x"}};
        puts({u"01a.jpp"_s, FakeLab::always, -1})(line);
    };
    const struct {
        const char* name;
        std::function<void(Line&)> arrange;
        SendingPhase end;
        int attempts;
        qsizetype puts;
        qsizetype putsOfKept = puts; // where the session is kept
    } cases[] = {
        {"dots in the listing", [](Line& line) { line.lab.listsDots = true; }, Success, 1, 3},
        // The 60 tries end within the third attempt.
        {"nobody answers until the fourth attempt", [](Line& line) { line.lab.deadConnects = 60; }, Success, 4, 3},
        {"folder can't be entered", [](Line& line) { line.lab.refusesEntry = true; }, NotAll, 4, 0},
        {"timed out in the middle", puts({u"01a.jpp"_s, 1, 20, Failure::Kind::TimedOut}), Success, 2, 4},
        {"cut, and the remains can't be deleted", puts({u"01a.jpp"_s, 1, 20}, true), Success, 2, 4},
        {"cut in each attempt, remains stay", puts({u"02b.jpp"_s, FakeLab::always, 20}, true), NotAll, 4, 6},
        {"the folder of a local file itself", order({u"01a.jpp"_s, QString()}), NotAll, 4, 1},
        {"strangers and a file that never arrives", strangers, Unclear, 4, 6},
        {"one name twice in the order", order({u"01a.jpp"_s, u"01a.jpp"_s, u"02b.jpp"_s}), Unclear, 1, 2, 3},
        {"an empty order", order({}), NoOrder, 1, 0},
    };
    for (const auto& each : cases) {
        for (const bool kept : {false, true}) {
            SCOPED_TRACE(std::string(each.name) + (kept ? ", kept" : ""));
            Line line;
            line.transfer.keptFtpSession = kept;
            each.arrange(line);
            EXPECT_EQ(line.sender.RunAttempts(), each.end);
            EXPECT_EQ(line.told.number(AttemptBegins), each.attempts);
            EXPECT_EQ(line.lab.puts.size(), kept ? each.putsOfKept : each.puts);
            EXPECT_TRUE(each.end != Success || line.remote() == Line::whole());
        }
    }
}

TEST(FtpSender, AKeptSessionServesAPassUntilAFaultBeginsAnother) {
    const QStringList names{u"1"_s, u"2"_s, u"3"_s, u"4"_s, u"5"_s, u"6"_s};
    // Sessions of the first pass, and attempts.
    const auto sessions = [&](const std::function<void(Line&)>& arrange) {
        Line line;
        line.transfer.keptFtpSession = true;
        FakeLab::Folder all;
        for (const QString& name : names) {
            all[name] = name.toLatin1().repeated(350);
            EXPECT_TRUE(line.test.files.writeWhole(Line::path(name), all[name]));
        }
        line.order(names);
        int ofPass = 0;
        line.lab.onConnect = [&](int) { ofPass += line.told.count(CheckBegins) == 0; };
        arrange(line);
        EXPECT_EQ(line.sender.RunAttempts(), SendingPhase::Success);
        EXPECT_EQ(line.remote(), all);
        return std::pair(ofPass, line.told.number(AttemptBegins));
    };
    EXPECT_EQ(sessions([](Line&) {}), std::pair(1, 1));
    EXPECT_EQ(sessions([](Line& line) { line.lab.putFaults = {{u"4"_s, 1, 20}}; }), std::pair(2, 2));
    const auto endsBehindEachPut = [](Line& line) {
        line.lab.stores = [&](const QString&, const QByteArray& content) {
            ++line.lab.aborts;
            return content;
        };
    };
    EXPECT_EQ(sessions(endsBehindEachPut), std::pair(5, 2)) << "each file has its own once the second one has failed";
}

// An order that goes by three lines, and what is under way when they all put.
struct ByLines : Line {
    ByLines() {
        transfer.keptFtpSession = true;
        transfer.ftpLines = 3;
        for (const QString& name : names)
            EXPECT_TRUE(test.files.writeWhole(path(name), name.toLatin1().repeated(50)));
        order(names);
        lab.onPut = [this](const QString& name) { put(name); };
    }
    // The first and the last file wait for company, which must not come; the others until so many are under way as are
    // wanted.
    void put(const QString& name) {
        using namespace std::chrono_literals;
        std::unique_lock lock(mutex);
        under += name;
        most = std::max(most, under.size());
        change.notify_all();
        if (name == names.first() || name == names.last())
            EXPECT_FALSE(change.wait_for(lock, 30ms, [&] { return under.size() > 1; })) << name.toStdString();
        else
            EXPECT_TRUE(change.wait_for(lock, 30s, [&] { return most >= wanted; })) << name.toStdString();
        if (most == 3 && !std::exchange(met, true) && whenAllPut)
            whenAllPut();
        change.wait_for(lock, 10ms, [&] { return under.contains(names.last()); });
        under.removeAll(name);
    }
    OrderState kept() const {
        const Result<OrderState> read = ReadOrderState(test.files, OrderFolder(folder));
        return read ? *read : OrderState();
    }

    const QStringList names{u"log.txt"_s, u"1"_s, u"2"_s, u"3"_s, u"4"_s, u"5"_s, u"6"_s, u"000.jpg"_s};
    std::function<void()> whenAllPut;
    std::mutex mutex;
    std::condition_variable change;
    QStringList under;
    qsizetype wanted = 3;
    qsizetype most = 0;
    bool met = false;
};

TEST(FtpSender, BetweenTheLogAndTheSmallPictureFilesGoByThreeLinesAndAllAreInHand) {
    ByLines line;
    QStringList inHand;
    line.whenAllPut = [&] { inHand = line.kept().filesInHand; };
    EXPECT_EQ(line.sender.RunAttempts(), SendingPhase::Success);
    EXPECT_TRUE(line.most == 3 && line.lab.connects == 3 && line.lab.puts.size() == line.names.size());
    EXPECT_EQ(inHand.size(), 3) << "a program that is killed now looks at each of them again";
    EXPECT_TRUE(line.kept().filesInHand.isEmpty());
}

TEST(FtpSender, AFaultOfALineCostsItsFileAndOneThatIsNotLetInCostsNothing) {
    const struct {
        const char* what;
        std::function<void(ByLines&)> arrange;
        qsizetype most;
        int failed; // puts
    } cases[] = {
        {"421", [](ByLines& line) { line.lab.onConnect = [&](int number) { line.lab.deadConnects = number > 1; }; }, 1,
         0},
        {"530", [](ByLines& line) { line.lab.onConnect = [&](int number) { line.lab.refusedLogins = number > 1; }; }, 1,
         0},
        {"a put is cut",
         [](ByLines& line) {
             line.lab.putFaults = {{u"4"_s, 1, 20}};
         },
         3, 1},
        {"each put is cut once",
         [](ByLines& line) {
             for (const QString& name : line.names)
                 line.lab.putFaults.push_back({name, 1, 20});
         },
         1, 8},
    };
    for (const auto& each : cases) {
        SCOPED_TRACE(each.what);
        ByLines line;
        line.wanted = each.most;
        each.arrange(line);
        EXPECT_EQ(line.sender.RunAttempts(), SendingPhase::Success);
        EXPECT_EQ(line.remote().size(), static_cast<std::size_t>(line.names.size()));
        EXPECT_EQ(line.most, each.most);
        EXPECT_EQ(line.sender.lists.List7.count(), each.failed);
        EXPECT_EQ(line.told.troubles.empty(), each.failed == 0);
        EXPECT_EQ(line.told.number(AttemptBegins), each.failed == 0 ? 1 : 2);
        EXPECT_TRUE(line.kept().filesInHand.isEmpty());
    }
}

TEST(FtpSender, AStopCutsEachLineAndWhatWasInHandIsSentAgain) {
    ByLines line;
    line.whenAllPut = [&] { line.sender.stopNow(); };
    EXPECT_EQ(line.sender.RunAttempts(), SendingPhase::Stopped);
    EXPECT_EQ(line.told.troubles.size(), 0u);
    EXPECT_EQ(line.sender.lists.List4Broken.count(), 3);
    EXPECT_EQ(line.lab.puts.size(), 4);
    line.sender.refill();
    EXPECT_EQ(line.sender.RunAttempts(), SendingPhase::Success);
    EXPECT_EQ(line.lab.puts.size(), 3 + line.names.size());
}

TEST_F(FtpSenderTest, AnEmptyFolderOnTheServerCountsAsOneFile) {
    remote();
    lab.putFaults = {{QString(), FakeLab::always, -1}};
    EXPECT_EQ(sender.RunAttempts(), SendingPhase::NotAll);
    EXPECT_EQ(told.number(Counted), 1);
    EXPECT_EQ(told.number(Incomplete), 3);
}

TEST_F(FtpSenderTest, ARefusedListingProvesNothingOnceAPutWasTried) {
    lab.putFaults = {{QString(), FakeLab::always, -1}};
    remote();
    lab.refusesEmptyListings = true;
    EXPECT_EQ(sender.RunAttempts(), SendingPhase::NotAll);
    EXPECT_EQ(told.troubles.back().step, LineStep::List);
    EXPECT_EQ(lists.List4Broken.count(), 1) << "the only put that was tried; its remains may stand there";
}

TEST_F(FtpSenderTest, DeletesTheRemainsOnlyInTheOrdersFolder) {
    lab.folders[base][u"01a.jpp"_s] = "another's file";
    lab.putFaults = {{u"01a.jpp"_s, 1, 20}};
    int sinceCut = 0;
    lab.onConnect = [&](int) {
        // The folder can't be entered while the remains are looked for the first time.
        if (lab.puts.contains(u"02b.jpp"_s))
            lab.refusesEntry = ++sinceCut == 1;
    };
    EXPECT_EQ(sender.RunAttempts(), SendingPhase::Success);
    EXPECT_EQ(lab.folders[base][u"01a.jpp"_s], QByteArray("another's file"));
    EXPECT_EQ(remote(), whole());
}

TEST_F(FtpSenderTest, AStopCutsTheFileInHandWhichCountsAsBrokenAndIsSentAgain) {
    for (const QString& stopAt : {names().first(), names().last()}) {
        Line line;
        line.lab.onPut = [&](const QString& name) {
            if (name == stopAt)
                line.sender.stopNow();
        };
        EXPECT_EQ(line.sender.RunAttempts(), SendingPhase::Stopped);
        EXPECT_EQ(line.told.count(Stopped), 1);
        EXPECT_EQ(line.told.troubles.size(), 0u) << "what a stop has cut is no trouble";
        EXPECT_EQ(line.lab.puts.size(), names().indexOf(stopAt) + 1);
        EXPECT_EQ(line.sender.lists.List4Broken.items(), QStringList(path(stopAt).text()));
        EXPECT_NE(line.remote(), whole());
        line.lab.onPut = {};
        line.sender.refill();
        EXPECT_EQ(line.sender.RunAttempts(), SendingPhase::Success);
        EXPECT_EQ(line.lab.puts.size(), names().size() + 1);
        EXPECT_EQ(line.remote(), whole());
    }
}

// Nobody answers: a stop ends the tries, in a pass as in the check behind it.
TEST_F(FtpSenderTest, AStopDoesNotWaitForTheOtherTriesToReachTheServer) {
    for (const SendingMoment in : {AttemptBegins, CheckBegins}) {
        Line line;
        line.lab.deadConnects = FakeLab::always;
        int stoppedAt = 0;
        line.lab.onConnect = [&](int number) {
            if (stoppedAt == 0 && line.told.count(in) > 0) {
                stoppedAt = number;
                line.sender.stopNow();
            }
        };
        EXPECT_EQ(line.sender.RunAttempts(), SendingPhase::Stopped);
        EXPECT_EQ(line.lab.connects, stoppedAt);
    }
}

TEST_F(FtpSenderTest, ARecheckThatDoesNotReachTheFolderSaysSo) {
    lists.List4Broken.append(path(u"01a.jpp"_s).text());
    lists.List6.append(u"01a.jpp"_s);
    lab.folders.erase(base);
    sender.check.RecheckBroken();
    EXPECT_EQ(told.count(OutsideFolder), 1);
}

TEST_F(FtpSenderTest, WhatAnEarlierSendingBrokeStaysInHandWhereThisOneIsOfOtherFiles) {
    const QByteArray first = path(names()[1]).text().toLatin1();
    const QByteArray second = path(names()[2]).text().toLatin1();
    ASSERT_TRUE(test.files.writeWhole(folder / u"kashloo.txt", first + "\r\n" + second + "\r\n"));
    order({names()[0], names()[2]});
    EXPECT_EQ(lists.List4Broken.items(), QStringList(QString::fromLatin1(second)));
    EXPECT_EQ(sender.RunAttempts(), SendingPhase::Success);
    EXPECT_EQ(session.journal()->state().filesInHand, QStringList(QString::fromLatin1(first)));
}

TEST_F(FtpSenderTest, ACallInsideACallLeavesTheOuterOneStoppable) {
    const StoppableLine outer(test.platform);
    { const StoppableLine inner(test.platform); }
    EXPECT_EQ(lab.pump, &test.pump);
}

TEST_F(FtpSenderTest, TheOlderBulkPathSendsInRounds) {
    lab.putFaults = {{u"01a.jpp"_s, 1, -1}};
    EXPECT_EQ(sender.runOlderRounds(), SendingPhase::Success);
    EXPECT_EQ(told.number(RoundFailed), 1);
    EXPECT_EQ(lab.puts.size(), 4);
}

} // namespace lumora
