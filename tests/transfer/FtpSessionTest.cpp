#include "transfer/ftp/FtpSession.h"
#include "support/FakeLab.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {

namespace {

class FtpSessionTest : public ::testing::Test {
protected:
    FtpSessionTest() {
        lab.folders[u"zalamim234"_s];
        state.profile.FtpServer = u"192.0.2.10"_s;
        state.profile.FtpFolder2 = u"zalamim234"_s;
        state.transfer.OrderFolder = u"C:\\2000lumora\\!!000\\order^1"_s;
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
    EXPECT_EQ(test.dialogs.messages, QStringList(u"לא נוצר קשר אינטרנט לאחר מספר נסיונות5"_s));
    lab.deadOpens = 3;
    session.FtpOpenInternet();
    EXPECT_TRUE(session.hOpen);
    EXPECT_EQ(board.Label3.text, u"  קשר ראשוני 4"_s);
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
    EXPECT_TRUE(board.Label4Reason.text.contains(u"הסיסמה"_s));
    state.EnglishTips = 1;
    lab.refusedLogins = 0;
    lab.deadConnects = FakeLab::always;
    walk();
    EXPECT_TRUE(board.Label4Reason.text.startsWith(u"The server does not answer"_s));
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
    EXPECT_EQ(board.Label40.text, u"/zalamim234"_s);
    EXPECT_EQ(board.Label41.text, u"zalamim234"_s);
    session.FtpCloseConnection();

    lab.folders[u"first"_s];
    lab.folders[u"first/second"_s];
    state.profile.FtpFolder1 = u"first"_s;
    state.profile.FtpFolder2 = u"second"_s;
    EXPECT_FALSE(session.insideOrderBase());
    walk();
    EXPECT_TRUE(session.FolderOk);
    EXPECT_EQ(session.MikumBaSharat, u"first/second"_s);
    EXPECT_TRUE(session.insideOrderBase());

    state.profile.FtpFolder2 = u"third"_s;
    session.FtpCloseConnection();
    walk();
    EXPECT_FALSE(session.FolderOk);
    EXPECT_EQ(session.ConnectFails, 0);
}

TEST_F(FtpSessionTest, CountsTheFailedLookUpsOfTheOnlyFolder) {
    lab.folders.erase(u"zalamim234"_s);
    walk();
    EXPECT_FALSE(session.FolderOk);
    EXPECT_EQ(session.ConnectFails, 1);
    EXPECT_EQ(board.Label3.text, u"תקשורת נכשלה מנסה שוב להתקשר"_s);
}

TEST_F(FtpSessionTest, TellsAMissingSessionOnceInAPass) {
    board.List1.append(u"zalamim234"_s);
    session.EnterFolderTK2();
    session.EnterFolderTK2();
    EXPECT_EQ(test.dialogs.messages, QStringList(u"No in session!"_s));
}

TEST_F(FtpSessionTest, MakesTheOrdersFolderOnceAndListsItAfterwards) {
    board.List6.append(u"left over"_s);
    walk();
    EXPECT_TRUE(session.EnterOrderFolder());
    EXPECT_TRUE(board.List6.isEmpty());
    EXPECT_EQ(state.transfer.ShemTikiya, u"order^1"_s);
    session.FtpCloseConnection();
    lab.folders[u"zalamim234/order^1"_s][u"a.jpp"_s] = "a";
    walk();
    EXPECT_TRUE(session.EnterOrderFolder());
    EXPECT_EQ(board.List6.items(), QStringList(u"a.jpp"_s));
    session.FtpCloseConnection();
    lab.refusesEntry = true;
    walk();
    EXPECT_FALSE(session.EnterOrderFolder());
    EXPECT_FALSE(session.inOrderFolder());
}

TEST_F(FtpSessionTest, ListsOneEmptyNameForAnEmptyFolderAndNoneWhenTheLineIsCut) {
    lab.folders[u"zalamim234/order^1"_s];
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
    EXPECT_FALSE(session.FtpSendFile(u"C:\\none.jpp"_s));
    EXPECT_EQ(board.LogList.items(), QStringList(u"95fail to up loadC:\\none.jpp"_s));
    EXPECT_EQ(board.List7.items(), board.List4Broken.items());
    EXPECT_FALSE(session.FtpSendFile({}));
    EXPECT_EQ(board.LogList.items().last(), u"95sendfile-no-image selected"_s);
    EXPECT_TRUE(lab.puts.isEmpty());
}

TEST_F(FtpSessionTest, AsksBeforeItClosesInTheRicherErrorRoutine) {
    walk();
    session.FtpFatalErrorAsk({Failure::Kind::Refused, {}}, u"FtpPutFile"_s);
    EXPECT_TRUE(session.bActiveSession);
    ASSERT_EQ(test.dialogs.questions.size(), 1);
    EXPECT_TRUE(test.dialogs.questions.first().startsWith(u"FtpPutFile Err: 12003 Extd Err: "_s));
    test.dialogs.answers = {true};
    session.FtpFatalErrorAsk({Failure::Kind::Refused, {}}, u"FtpPutFile"_s);
    EXPECT_FALSE(session.bActiveSession);
}

} // namespace lumora
