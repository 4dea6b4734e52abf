#include "support/FakeLab.h"
#include "support/FtpFrmRig.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>

namespace lumora {

namespace {

const QString uploaded = u"הקבצים הועלו בהצלחה"_s;
const QString notAll = u"לא כל הקבצים הועלו"_s;

// The sending page over a lab that has the folder of the orders.
struct Line {
    Line() { lab.folders[u"zalamim234"_s]; }

    FakeLab::Folder& remote() { return lab.folders[FtpFrmRig::remoteFolder()]; }

    // Every file of the order lies on the server as it lies here, and nothing else does.
    void expectArrived() {
        const auto local = rig.localFiles();
        for (const QString& name : FtpFrmRig::names()) {
            ASSERT_TRUE(local.contains(name)) << name.toStdString();
            EXPECT_EQ(remote()[name], local.at(name)) << name.toStdString();
        }
        EXPECT_EQ(remote().size(), FtpFrmRig::names().size());
    }

    FakeLab lab;
    FtpFrmRig rig{lab};
};

class FtpFrmTest : public ::testing::Test, protected Line {};

} // namespace

// The faults that a relay can make on a real line stand with the real server; here those of a server's own doing.
TEST(FtpFrm, EndsAsTheCustomerIsTold) {
    const QString second = u"נסיון שני לקבצים שלא עלו"_s;
    const QString fourth = u"נסיון רביעי ואחרון להעלות קבצים שלא עלו"_s;
    const struct {
        const char* name;
        std::function<void(FakeLab&)> arrange;
        bool success;
        QString attempt; // what Label34 says in the end
        int puts;
    } cases[] = {
        {"clean", [](FakeLab&) {}, true, {}, 5},
        {"dots in the listing", [](FakeLab& lab) { lab.listsDots = true; }, true, {}, 5},
        {"no folder can be made", [](FakeLab& lab) { lab.refusesFolders = true; }, false, fourth, 0},
        {"folder can't be entered", [](FakeLab& lab) { lab.refusesEntry = true; }, false, fourth, 0},
        {"cut, and the remains can't be deleted",
         [](FakeLab& lab) {
             lab.putFaults = {{FtpFrmRig::first(), 1, 100}};
             lab.refusesDelete = true;
         },
         true, second, 6},
        {"cut in each attempt, remains stay",
         [](FakeLab& lab) {
             lab.putFaults = {{FtpFrmRig::proof(), FakeLab::always, 100}};
             lab.refusesDelete = true;
         },
         false, fourth, 8},
    };
    for (const auto& each : cases) {
        SCOPED_TRACE(each.name);
        Line line;
        each.arrange(line.lab);
        const auto before = line.rig.localFiles();
        line.rig.send();
        FtpFrm& page = line.rig.page();
        EXPECT_EQ(page.AllDone, each.success ? 1 : 0);
        EXPECT_EQ(page.Label3.text, each.success ? uploaded : notAll);
        EXPECT_EQ(page.Label34.text, each.attempt);
        EXPECT_EQ(page.Picture6.visible, !each.success);
        EXPECT_EQ(page.Picture2.visible, each.success);
        EXPECT_EQ(page.Command10.visible, !each.success);
        EXPECT_TRUE(page.Command28.visible);
        EXPECT_FALSE(page.Command12.enabled);
        EXPECT_EQ(page.pageSize, FtpBoard::PageSize::Full);
        EXPECT_EQ(line.lab.urls.size(), each.success ? 3 : 0);
        EXPECT_EQ(line.lab.puts.size(), each.puts);
        if (each.success) {
            EXPECT_EQ(page.caption, uploaded);
            line.expectArrived();
        } else {
            EXPECT_EQ(page.Label33.text, u"10"_s);
            EXPECT_FALSE(page.Label2.text.isEmpty());
            EXPECT_FALSE(page.sending);
        }
        const auto after = line.rig.localFiles();
        for (const auto& [name, bytes] : before)
            EXPECT_EQ(after.at(name), bytes) << name.toStdString();
        page.Command28_Click();
        EXPECT_EQ(line.rig.chain.front()->id(), PageId::hatchala) << "both ends lead to a new order";
        EXPECT_EQ(line.rig.chain.find(PageId::FtpFrm), nullptr);
    }
}

TEST_F(FtpFrmTest, SendsAfterTheFifteenthSecondAndOnlyOnce) {
    FtpFrm& page = rig.start();
    EXPECT_TRUE(page.Timer1.running());
    for (int tick = 0; tick < 14; ++tick)
        page.Timer1_Tick();
    EXPECT_EQ(page.Label20.text, u"1"_s);
    EXPECT_TRUE(lab.puts.isEmpty());
    page.Timer1_Tick();
    EXPECT_EQ(lab.puts, FtpFrmRig::names());
    page.Timer1_Tick();
    page.Command12_Click();
    page.Command10_Click();
    EXPECT_EQ(lab.urls.size(), 3);
}

TEST_F(FtpFrmTest, CountdownStopsAndGoesOn) {
    FtpFrm& page = rig.start();
    page.Command23_Click();
    EXPECT_FALSE(page.Timer1.running());
    EXPECT_EQ(page.Command23.text, u"המשך"_s);
    page.Command23_Click();
    EXPECT_TRUE(page.Timer1.running());
    page.Image3_Click();
    EXPECT_TRUE(page.Picture7.visible);
    EXPECT_FALSE(page.Timer1.running());
    page.Command14_Click();
    EXPECT_TRUE(page.Timer1.running());
    EXPECT_FALSE(page.Picture7.visible);
    EXPECT_FALSE(rig.chain.hasEnded());
    page.Command16_Click();
    EXPECT_TRUE(rig.chain.hasEnded());
}

TEST_F(FtpFrmTest, SendsNoReportsWhenTheLabWantsNone) {
    rig.state.profile.ReportOn = 0;
    rig.send();
    EXPECT_EQ(rig.page().AllDone, 1);
    EXPECT_TRUE(lab.urls.isEmpty());
}

// A stop counts at every file, also at the last; what has arrived is not sent again.
TEST_F(FtpFrmTest, StopsAndGoesOnWhereItStopped) {
    for (const QString& stopAt : {FtpFrmRig::first(), FtpFrmRig::proof()}) {
        Line fresh;
        FakeLab& line = fresh.lab;
        FtpFrmRig& order = fresh.rig;
        line.onPut = [&](const QString& name) {
            if (name == stopAt)
                order.page().Command15_Click();
        };
        order.send();
        FtpFrm& page = order.page();
        const auto expected = FtpFrmRig::names().indexOf(stopAt) + 1;
        EXPECT_EQ(line.puts.size(), expected);
        EXPECT_EQ(page.AllDone, 0);
        ASSERT_EQ(order.test.dialogs.messages.size(), 2);
        EXPECT_EQ(order.test.dialogs.messages.first(), u" התהליך הופסק ביוזמת המשתמש "_s);
        EXPECT_EQ(page.pageSize, FtpBoard::PageSize::Full);
        EXPECT_TRUE(page.Command10.visible);
        EXPECT_TRUE(line.urls.isEmpty());
        line.onPut = {};
        page.Command10_Click();
        EXPECT_EQ(page.Label3.text, uploaded);
        EXPECT_EQ(line.puts, FtpFrmRig::names());
    }
}

TEST_F(FtpFrmTest, IgnoresStartControlsWhileFilesTravel) {
    bool pressed = false;
    lab.onPut = [&](const QString&) {
        FtpFrm& page = rig.page();
        EXPECT_TRUE(page.sending);
        for (auto start : {&FtpFrm::Command12_Click, &FtpFrm::Command10_Click, &FtpFrm::Image5_Click,
                           &FtpFrm::Command13_Click, &FtpFrm::Command1_Click, &FtpFrm::Command4_Click,
                           &FtpFrm::Command19_Click, &FtpFrm::Command28_Click, &FtpFrm::Command23_Click})
            (page.*start)();
        pressed = true;
    };
    rig.send();
    EXPECT_TRUE(pressed);
    EXPECT_EQ(lab.puts, FtpFrmRig::names());
    EXPECT_EQ(rig.page().AllDone, 1);
}

// The window's own close knows nothing of the pass that runs below it.
TEST(FtpFrm, EndsAtOnceWhenProgramOrPageGoInTheMiddle) {
    const std::function<void(FtpFrmRig&)> ways[] = {[](FtpFrmRig& order) { order.page().Command16_Click(); },
                                                    [](FtpFrmRig& order) { order.chain.endProgram(); },
                                                    [](FtpFrmRig& order) { order.chain.unload(PageId::FtpFrm); }};
    for (const auto& end : ways) {
        Line line;
        line.lab.onPut = [&](const QString& name) {
            if (name == FtpFrmRig::sheet())
                end(line.rig);
        };
        line.rig.send();
        EXPECT_EQ(line.rig.chain.hasEnded(), &end != &ways[2]);
        EXPECT_EQ(line.lab.puts.size(), 2);
        EXPECT_TRUE(line.lab.urls.isEmpty());
        EXPECT_TRUE(line.rig.test.dialogs.messages.isEmpty());
    }
}

// Nobody answers: a stop ends the tries, in a pass as in the check behind it.
TEST_F(FtpFrmTest, AStopDoesNotWaitForTheOtherTriesToReachTheServer) {
    for (const bool inCheck : {false, true}) {
        Line fresh;
        FakeLab& line = fresh.lab;
        FtpFrmRig& order = fresh.rig;
        line.deadConnects = FakeLab::always;
        int stoppedAt = 0;
        line.onConnect = [&](int number) {
            const bool now = inCheck ? !order.page().Label4Do.text.startsWith(u"ההזמנה"_s) : number == 2;
            if (stoppedAt == 0 && now) {
                stoppedAt = number;
                order.page().Command15_Click();
            }
        };
        order.send();
        FtpFrm& page = order.page();
        EXPECT_GT(stoppedAt, 0);
        EXPECT_EQ(line.connects, stoppedAt);
        EXPECT_EQ(order.test.dialogs.messages.size(), 2);
        EXPECT_TRUE(page.Label4Do.text.startsWith(u"השליחה נעצרה"_s));
        // "Close", "do not close": what was stopped stays so.
        page.Image3_Click();
        page.Command14_Click();
        EXPECT_FALSE(page.Timer1.running());
        line.deadConnects = 0;
        page.Command10_Click();
        EXPECT_EQ(page.Label3.text, uploaded);
    }
}

// The second half of a double press falls on the page that has just come up.
TEST_F(FtpFrmTest, IgnoresAStartBeforeTheOrderIsListed) {
    rig.test.pump.onPump = [&] {
        if (auto* page = static_cast<FtpFrm*>(rig.chain.find(PageId::FtpFrm)); page && page->List4Makor.isEmpty()) {
            page->Image5_Click();
            page->Command10_Click();
        }
    };
    rig.start();
    EXPECT_TRUE(rig.page().Timer1.running());
    EXPECT_TRUE(rig.test.dialogs.messages.isEmpty());
    EXPECT_TRUE(lab.puts.isEmpty());
}

// More names on the server than the order has files: no verdict, and all is looked at four times.
TEST_F(FtpFrmTest, GivesNoVerdictOnAFolderThatHoldsMore) {
    remote()[u"stranger.jpp"_s] = "x";
    rig.send();
    FtpFrm& page = rig.page();
    EXPECT_EQ(page.Label34.text, u"נסיון רביעי ואחרון להעלות קבצים שלא עלו"_s);
    EXPECT_FALSE(page.Picture6.visible);
    EXPECT_FALSE(page.Picture2.visible);
    EXPECT_EQ(page.AllDone, 0);
    EXPECT_EQ(page.pageSize, FtpBoard::PageSize::Full);
    EXPECT_EQ(page.Label3.text, u"6 קבצים שהועלו בהצלחה "_s);
    EXPECT_TRUE(rig.test.dialogs.messages.isEmpty());
    EXPECT_EQ(lab.puts.size(), 5);
}

TEST_F(FtpFrmTest, EndsInSilenceWhenANameStandsTwiceInTheOrder) {
    rig.takeUpAgain({FtpFrmRig::first(), FtpFrmRig::first()});
    rig.send();
    EXPECT_EQ(rig.page().NumToSend, 3);
    EXPECT_EQ(rig.page().AllDone, 0);
    EXPECT_FALSE(rig.page().Picture6.visible);
    EXPECT_EQ(rig.page().Label3.text, u"2 קבצים שהועלו בהצלחה "_s);
    EXPECT_TRUE(rig.page().Label4Do.text.contains(u"2 מתוך 3"_s));
    EXPECT_EQ(lab.puts.size(), 2);
}

TEST_F(FtpFrmTest, TakesTheLinesOfAResendAndForgetsTheCustomerBefore) {
    rig.chain.show(PageId::MoogMeret);
    rig.state.shemot.Mail = u"other@example.com"_s;
    (void)rig.test.files.writeWhole(FtpFrmRig::local(FtpFrmRig::log()), "\"Shemot.n1\",\"Dana\"\r\n");
    rig.takeUpAgain({FtpFrmRig::log(), FtpFrmRig::second()});
    FtpFrm& page = rig.start();
    EXPECT_EQ(rig.chain.find(PageId::MoogMeret), nullptr);
    EXPECT_EQ(page.Label7.text, u"2"_s);
    EXPECT_EQ(rig.state.shemot.Mail, QString());
    EXPECT_EQ(rig.state.shemot.n1, u"Dana"_s);
    EXPECT_EQ(page.Label21.text, u"11"_s);
    EXPECT_TRUE(rig.state.handOver.lines.isEmpty());
    rig.countDown();
    EXPECT_EQ(page.AllDone, 1);
    EXPECT_EQ(lab.puts, (QStringList{FtpFrmRig::log(), FtpFrmRig::second(), FtpFrmRig::proof()}));
}

// A program that ended with a broken put leaves kashloo.txt; the half file on the server is not taken for a sent one.
TEST_F(FtpFrmTest, AResendSendsWhatAnEarlierRunBroke) {
    lab.putFaults = {{FtpFrmRig::first(), FakeLab::always, 60}};
    lab.refusesDelete = true;
    rig.send();
    EXPECT_EQ(remote()[FtpFrmRig::first()].size(), 60);
    rig.chain.unload(PageId::FtpFrm);

    lab.putFaults.clear();
    lab.puts.clear();
    rig.takeUpAgain(FtpFrmRig::names().mid(0, 4));
    rig.send();
    EXPECT_EQ(rig.page().Label3.text, uploaded);
    EXPECT_EQ(lab.puts, QStringList(FtpFrmRig::first()));
    EXPECT_EQ(remote()[FtpFrmRig::first()], rig.localFiles().at(FtpFrmRig::first()));
    EXPECT_EQ(rig.localFiles().at(u"kashloo.txt"_s), QByteArray());
}

TEST_F(FtpFrmTest, WritesTheBrokenFilesOneALine) {
    lab.putFaults = {{FtpFrmRig::first(), FakeLab::always, 60}, {FtpFrmRig::second(), FakeLab::always, 60}};
    lab.refusesDelete = true;
    QByteArray seen;
    lab.onPut = [&](const QString& name) {
        if (name == FtpFrmRig::proof())
            seen = rig.localFiles().at(u"kashloo.txt"_s);
    };
    rig.send();
    EXPECT_EQ(seen,
              (FtpFrmRig::local(FtpFrmRig::first()) + u"\r\n"_s + FtpFrmRig::local(FtpFrmRig::second()) + u"\r\n"_s)
                  .toLatin1());
}

TEST_F(FtpFrmTest, DeletesTheRemainsOnlyInTheOrdersFolder) {
    lab.folders[u"zalamim234"_s][FtpFrmRig::first()] = "another's file";
    lab.putFaults = {{FtpFrmRig::first(), 1, 60}};
    int sinceCut = 0;
    lab.onConnect = [&](int) {
        // The folder can't be entered while the remains are looked for the first time.
        if (!lab.puts.contains(FtpFrmRig::proof()))
            return;
        lab.refusesEntry = ++sinceCut == 1;
    };
    rig.send();
    EXPECT_EQ(lab.folders[u"zalamim234"_s][FtpFrmRig::first()], QByteArray("another's file"));
    EXPECT_EQ(rig.page().Label3.text, uploaded);
    expectArrived();
}

TEST_F(FtpFrmTest, WithoutItsTextTheOrderSendsThePicturesAndSaysSo) {
    (void)rig.test.files.removeFile(FtpFrmRig::local(FtpFrmRig::log()));
    rig.send();
    EXPECT_EQ(lab.puts, FtpFrmRig::names().mid(1));
    EXPECT_TRUE(rig.page().Picture2Lines.contains(u"NO details"_s));
    EXPECT_EQ(rig.page().AllDone, 1);
}

TEST_F(FtpFrmTest, ListsNothingWithoutAnOrder) {
    for (const QString& folder : {QString(), u"***"_s}) {
        FtpFrmRig order(lab);
        order.state.transfer.OrderFolder = folder;
        FtpFrm& page = order.start();
        EXPECT_TRUE(page.List3.isEmpty());
        EXPECT_FALSE(page.Timer1.running());
        EXPECT_EQ(page.Label4Do.text, u"אין כאן הזמנה לשליחה."_s);
    }
}

TEST_F(FtpFrmTest, ShowsTwoBoxesWhenNoServerIsNamed) {
    rig.state.profile.FtpPassword.clear();
    FtpFrm& page = rig.start();
    EXPECT_TRUE(page.Command28.visible);
    EXPECT_EQ(rig.test.dialogs.messages.size(), 2);
    EXPECT_TRUE(rig.test.dialogs.messages.value(1).endsWith(u"  ש ל י ח ה    ח ו ז ר ת  "_s));
    EXPECT_FALSE(page.Timer1.running());
}

TEST_F(FtpFrmTest, SendsTheFirstSheetAndThePiecesOfAnOrderInPieces) {
    rig.state.transfer.Mefurak = Travel::Pieces;
    rig.write(u"a_001_002.prk"_s, "1");
    rig.write(u"a_002_002.prk"_s, "2");
    rig.send();
    EXPECT_EQ(lab.puts, (QStringList{FtpFrmRig::log(), FtpFrmRig::sheet(), u"a_001_002.prk"_s, u"a_002_002.prk"_s,
                                     FtpFrmRig::proof()}));
    EXPECT_EQ(rig.page().PicInProgKatanWidth, FtpBoard::Pic4ProgWidth);
    EXPECT_EQ(rig.page().AllDone, 1);
}

TEST_F(FtpFrmTest, WithoutASheetThePutOfTheFolderItselfFails) {
    rig.state.transfer.Mefurak = Travel::Pieces;
    (void)rig.test.files.removeFile(FtpFrmRig::local(FtpFrmRig::sheet()));
    rig.write(u"a_001_001.prk"_s, "1");
    FtpFrm& page = rig.start();
    EXPECT_EQ(page.List3.item(1), FtpFrmRig::folder() + u'\\');
    rig.countDown();
    EXPECT_EQ(page.Label3.text, notAll);
    EXPECT_EQ(page.Label4Missing.text, u"1"_s);
    EXPECT_TRUE(page.List7.contains(FtpFrmRig::folder() + u'\\'));
}

TEST_F(FtpFrmTest, AnEmptyFolderOnTheServerCountsAsOneFile) {
    remote();
    lab.putFaults = {{QString(), FakeLab::always, -1}};
    QStringList counts;
    QObject::connect(&rig.start(), &Page::changed, [&] {
        if (rig.page().Label3.text.endsWith(u" קבצים שהועלו בהצלחה "_s))
            counts += rig.page().Label3.text.left(1);
    });
    rig.countDown();
    EXPECT_TRUE(counts.contains(u"1"_s));
    EXPECT_EQ(rig.page().Label4Missing.text, u"5"_s);
}

TEST_F(FtpFrmTest, ClosesAtOnceWhenAllHasArrived) {
    rig.send();
    rig.page().Image3_Click();
    EXPECT_TRUE(rig.chain.hasEnded());
    EXPECT_FALSE(rig.page().Picture7.visible);
}

TEST_F(FtpFrmTest, ShowsTheDeliveryNoteForHomeOrdersAlone) {
    EXPECT_FALSE(rig.start().Label15.visible);
    FtpFrmRig home(lab);
    home.state.KodMishloach = u"HOM"_s;
    home.state.shemot.n3 = u"Herzl 1"_s;
    FtpFrm& page = home.start();
    EXPECT_TRUE(page.Label15.visible);
    EXPECT_EQ(page.Label4Ktovet.text, u"Herzl 1"_s);
}

TEST_F(FtpFrmTest, SpeaksNoHebrewOnAnEnglishPage) {
    rig.state.EnglishTips = 1;
    lab.putFaults = {{FtpFrmRig::first(), FakeLab::always, 60}};
    const auto hebrew = [](const QString& text) {
        return std::any_of(text.begin(), text.end(), [](QChar c) { return c.script() == QChar::Script_Hebrew; });
    };
    QStringList found;
    FtpFrm& page = rig.start();
    QObject::connect(&page, &Page::changed, [&] {
        for (const QString& text : {page.Label3.text, page.caption, page.Label4Do.text, page.Label4File.text,
                                    page.Label34.text, page.Label4Reason.text, page.Label2.text}) {
            if (hebrew(text) && !found.contains(text))
                found += text;
        }
    });
    rig.countDown();
    EXPECT_EQ(page.Label3.text, u"Not all the files were uploaded"_s);
    EXPECT_FALSE(remote().contains(FtpFrmRig::first())) << "what broke off is deleted";
    EXPECT_TRUE(found.isEmpty()) << found.join(u'\n').toStdString();
    for (const Caption* control : {&page.Command10, &page.Command28, &page.Picture7, &page.Label4Hamtana, &page.Label9})
        EXPECT_FALSE(hebrew(control->text)) << control->text.toStdString();
}

TEST_F(FtpFrmTest, SendsAChainOfOrdersAndDropsWhatIsThere) {
    rig.state.transfer.SugMishloah = Sending::Chain;
    FtpFrm& page = rig.start();
    EXPECT_FALSE(page.Timer1.running());
    remote()[FtpFrmRig::first()] = rig.localFiles().at(FtpFrmRig::first());
    page.ListRezefFiles.append(FtpFrmRig::name());
    page.ListRezefFiles.append(u"none^1"_s);
    page.Command19_Click();
    EXPECT_EQ(page.Label3.text, u"  סיים  "_s);
    EXPECT_EQ(page.Label4siem.text, u"2 / 2"_s);
    EXPECT_EQ(lab.puts.size(), 3);
    EXPECT_EQ(page.AllDone, 1);
    ASSERT_EQ(lab.urls.size(), 3);
    EXPECT_TRUE(lab.urls.at(1).endsWith(u"padd.asp"_s));
}

TEST_F(FtpFrmTest, TheOlderBulkPathSendsInRounds) {
    rig.takeUpAgain(FtpFrmRig::names().mid(0, 4));
    lab.putFaults = {{FtpFrmRig::first(), 1, -1}};
    FtpFrm& page = rig.start();
    page.Command2_Click();
    EXPECT_EQ(page.Label3.text, uploaded);
    EXPECT_EQ(page.Label4.text, u"1"_s);
    EXPECT_EQ(lab.puts.size(), 6);
    EXPECT_EQ(lab.urls.size(), 3);
}

TEST_F(FtpFrmTest, TheOlderBulkPathSendsNothingWhereNoListWasHandedOver) {
    FtpFrm& page = rig.start();
    const QStringList order = page.List3.items();
    page.Command2_Click();
    EXPECT_EQ(rig.test.dialogs.messages, QStringList(u"list3 is empty"_s));
    EXPECT_EQ(page.List3.items(), order);
    EXPECT_EQ(lab.urls.size(), 0) << "no report of an order that did not go";
}

TEST_F(FtpFrmTest, TheManualPanelPutsGetsAndDeletes) {
    FtpFrm& page = rig.start();
    page.Command3_Click();
    EXPECT_EQ(rig.test.dialogs.messages.last(), u"Not in session"_s);
    page.cmdInternetOpen_Click();
    page.Command3_Click();
    EXPECT_EQ(rig.test.dialogs.messages.last(), u"Please select a local file to put"_s);
    page.File1_Click(page.File1.names().indexOf(FtpFrmRig::first()));
    page.Command3_Click();
    page.Command5_Click();
    EXPECT_EQ(rig.test.dialogs.messages.last(), u"Please select the item to GET!"_s);
    page.List2_Click(page.List2.find(FtpFrmRig::first()));
    rig.write(FtpFrmRig::first(), "lost");
    page.Command5_Click();
    EXPECT_GT(rig.localFiles().at(FtpFrmRig::first()).size(), 100);
    page.Command6_Click();
    EXPECT_FALSE(lab.folders[QString()].contains(FtpFrmRig::first()));
    page.Command7_Click();
    EXPECT_TRUE(page.List2.contains(u"goop"_s));
    page.cmdClosehOpen_Click();
    page.Command7_Click();
    EXPECT_EQ(rig.test.dialogs.messages.last(), u"Not in session"_s);
}

} // namespace lumora
