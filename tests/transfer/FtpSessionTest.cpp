#include "transfer/FtpSession.h"
#include "support/FakeLab.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {

namespace {

class FtpSessionTest : public ::testing::Test {
protected:
    FtpSessionTest() {
        lab.folders[QStringLiteral("zalamim234")];
        state.profile.FtpServer = QStringLiteral("192.0.2.10");
        state.profile.FtpFolder2 = QStringLiteral("zalamim234");
        state.transfer.OrderFolder = QStringLiteral("C:\\2000lumora\\!!000\\order^1");
        session.takeSettings();
    }

    void walk() {
        session.FtpOpenInternet();
        session.FtpConnectServer();
        session.EnterFolderTK1();
        session.EnterFolderTK2();
    }

    FakeLab lab;
    TestPlatform test{lab};
    SessionState state;
    FtpBoard board;
    FtpDesk desk{board, state, test.platform, [] {}};
    FtpSession session{desk};
};

} // namespace

TEST_F(FtpSessionTest, TellsAfterFourRefusedOpensWithTheNumberFive) {
    lab.deadOpens = FakeLab::always;
    session.FtpOpenInternet();
    EXPECT_FALSE(session.hOpen);
    EXPECT_EQ(test.dialogs.messages, QStringList(QStringLiteral("לא נוצר קשר אינטרנט לאחר מספר נסיונות5")));
    lab.deadOpens = 3;
    session.FtpOpenInternet();
    EXPECT_TRUE(session.hOpen);
    EXPECT_EQ(board.Label3.text, QStringLiteral("  קשר ראשוני 4"));
    EXPECT_EQ(test.dialogs.messages.size(), 1);
}

TEST_F(FtpSessionTest, TriesToConnectFiveTimesAndSaysWhatAFailureMeans) {
    lab.deadConnects = 4;
    walk();
    EXPECT_TRUE(session.bActiveSession);
    EXPECT_EQ(lab.connects, 5);
    session.FtpCloseConnection();
    lab.refusedLogins = FakeLab::always;
    walk();
    EXPECT_FALSE(session.bActiveSession);
    EXPECT_FALSE(session.FolderOk);
    EXPECT_TRUE(board.Label4Reason.text.contains(QStringLiteral("הסיסמה")));
    state.EnglishTips = 1;
    lab.refusedLogins = 0;
    lab.deadConnects = FakeLab::always;
    walk();
    EXPECT_TRUE(board.Label4Reason.text.startsWith(QStringLiteral("The server does not answer")));
}

TEST_F(FtpSessionTest, UsesActiveTransfersOnlyWhenPassiveIsCleared) {
    board.chkPassive.checked = true;
    walk();
    EXPECT_EQ(lab.lastChannel, Internet::DataChannel::Passive);
    session.FtpCloseConnection();
    board.chkPassive.checked = false;
    walk();
    EXPECT_EQ(lab.lastChannel, Internet::DataChannel::Active);
}

TEST_F(FtpSessionTest, WalksToTheLabsFolderWithOneLevelAndWithTwo) {
    walk();
    EXPECT_TRUE(session.FolderOk);
    EXPECT_TRUE(session.insideOrderBase());
    EXPECT_EQ(board.Label40.text, QStringLiteral("/zalamim234"));
    EXPECT_EQ(board.Label41.text, QStringLiteral("zalamim234"));
    session.FtpCloseConnection();

    lab.folders[QStringLiteral("first")];
    lab.folders[QStringLiteral("first/second")];
    state.profile.FtpFolder1 = QStringLiteral("first");
    state.profile.FtpFolder2 = QStringLiteral("second");
    EXPECT_FALSE(session.insideOrderBase());
    walk();
    EXPECT_TRUE(session.FolderOk);
    EXPECT_EQ(session.MikumBaSharat, QStringLiteral("first/second"));
    EXPECT_TRUE(session.insideOrderBase());

    state.profile.FtpFolder2 = QStringLiteral("third");
    session.FtpCloseConnection();
    walk();
    EXPECT_FALSE(session.FolderOk);
    EXPECT_EQ(session.ConnectFails, 0);
}

TEST_F(FtpSessionTest, CountsTheFailedLookUpsOfTheOnlyFolder) {
    lab.folders.erase(QStringLiteral("zalamim234"));
    walk();
    EXPECT_FALSE(session.FolderOk);
    EXPECT_EQ(session.ConnectFails, 1);
    EXPECT_EQ(board.Label3.text, QStringLiteral("תקשורת נכשלה מנסה שוב להתקשר"));
}

TEST_F(FtpSessionTest, TellsAMissingSessionOnceInAPass) {
    board.List1.append(QStringLiteral("zalamim234"));
    session.EnterFolderTK2();
    session.EnterFolderTK2();
    EXPECT_EQ(test.dialogs.messages, QStringList(QStringLiteral("No in session!")));
}

TEST_F(FtpSessionTest, MakesTheOrdersFolderOnceAndListsItAfterwards) {
    board.List6.append(QStringLiteral("left over"));
    walk();
    EXPECT_TRUE(session.EnterOrderFolder());
    EXPECT_TRUE(board.List6.isEmpty());
    EXPECT_EQ(state.transfer.ShemTikiya, QStringLiteral("order^1"));
    session.FtpCloseConnection();
    lab.folders[QStringLiteral("zalamim234/order^1")][QStringLiteral("a.jpp")] = "a";
    walk();
    EXPECT_TRUE(session.EnterOrderFolder());
    EXPECT_EQ(board.List6.items(), QStringList(QStringLiteral("a.jpp")));
    session.FtpCloseConnection();
    lab.refusesEntry = true;
    walk();
    EXPECT_FALSE(session.EnterOrderFolder());
    EXPECT_FALSE(session.inOrderFolder());
}

TEST_F(FtpSessionTest, ListsOneEmptyNameForAnEmptyFolderAndNoneWhenTheLineIsCut) {
    lab.folders[QStringLiteral("zalamim234/order^1")];
    walk();
    EXPECT_TRUE(session.EnterOrderFolder());
    EXPECT_EQ(board.List6.items(), QStringList(QString()));
    lab.failedListings = 1;
    session.ListRemoteHere();
    EXPECT_TRUE(session.colNames.isEmpty());
    EXPECT_FALSE(session.bActiveSession);
    EXPECT_FALSE(session.hOpen);
}

TEST_F(FtpSessionTest, NotesAFailedPutWithHourAndMinuteAsTheyAre) {
    test.clock.time = QDateTime(QDate(2026, 11, 21), QTime(9, 5));
    walk();
    EXPECT_FALSE(session.FtpSendFile(QStringLiteral("C:\\none.jpp")));
    EXPECT_EQ(board.LogList.items(), QStringList(QStringLiteral("95fail to up loadC:\\none.jpp")));
    EXPECT_EQ(board.List7.items(), board.List4Broken.items());
    EXPECT_FALSE(session.FtpSendFile({}));
    EXPECT_EQ(board.LogList.items().last(), QStringLiteral("95sendfile-no-image selected"));
    EXPECT_TRUE(lab.puts.isEmpty());
}

TEST_F(FtpSessionTest, AsksBeforeItClosesInTheRicherErrorRoutine) {
    walk();
    session.FtpFatalErrorAsk({Failure::Kind::Refused, {}}, QStringLiteral("FtpPutFile"));
    EXPECT_TRUE(session.bActiveSession);
    ASSERT_EQ(test.dialogs.questions.size(), 1);
    EXPECT_TRUE(test.dialogs.questions.first().startsWith(QStringLiteral("FtpPutFile Err: 12003 Extd Err: ")));
    test.dialogs.answers = {true};
    session.FtpFatalErrorAsk({Failure::Kind::Refused, {}}, QStringLiteral("FtpPutFile"));
    EXPECT_FALSE(session.bActiveSession);
}

} // namespace lumora
