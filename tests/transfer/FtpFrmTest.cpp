#include "support/FakeLab.h"
#include "support/FtpFrmRig.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

const QString uploaded = u"הקבצים הועלו בהצלחה"_s;
const QString notAll = u"לא כל הקבצים הועלו"_s;

class FtpFrmTest : public ::testing::Test {
protected:
    FtpFrmTest() { lab.folders[u"zalamim234"_s]; }

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

struct EndState {
    const char* name;
    void (*arrange)(FakeLab& lab, FtpFrmRig& rig);
    bool success;
    const char* attempt; // what Label34 says in the end
    int puts;
};

void PrintTo(const EndState& state, std::ostream* out) {
    *out << state.name;
}

constexpr auto none = "";
constexpr auto second = "נסיון שני לקבצים שלא עלו";
constexpr auto third = "נסיון שלישי לקבצים שלא עלו";
constexpr auto fourth = "נסיון רביעי ואחרון להעלות קבצים שלא עלו";

void backAt(FakeLab& lab, FtpFrmRig& rig, const char* attempt) {
    lab.onConnect = [&lab, &rig, attempt](int) {
        lab.deadConnects = rig.page().Label34.text == QString::fromUtf8(attempt) ? 0 : FakeLab::always;
    };
}

class EndStates : public FtpFrmTest, public ::testing::WithParamInterface<EndState> {};

} // namespace

TEST_P(EndStates, AreTheOnesThatTheCustomerIsTold) {
    GetParam().arrange(lab, rig);
    const auto before = rig.localFiles();
    rig.send();
    FtpFrm& page = rig.page();
    EXPECT_EQ(page.AllDone, GetParam().success ? 1 : 0);
    EXPECT_EQ(page.Label3.text, GetParam().success ? uploaded : notAll);
    EXPECT_EQ(page.Label34.text, QString::fromUtf8(GetParam().attempt));
    EXPECT_EQ(page.Picture6.visible, !GetParam().success);
    EXPECT_EQ(page.Picture2.visible, GetParam().success);
    EXPECT_EQ(page.Command10.visible, !GetParam().success);
    EXPECT_TRUE(page.Command28.visible);
    EXPECT_FALSE(page.Command12.enabled);
    EXPECT_EQ(page.pageSize, FtpBoard::PageSize::Full);
    EXPECT_EQ(lab.urls.size(), GetParam().success ? 3 : 0);
    EXPECT_EQ(lab.puts.size(), GetParam().puts);
    if (GetParam().success) {
        EXPECT_EQ(page.caption, uploaded);
        expectArrived();
    } else {
        EXPECT_EQ(page.Label33.text, u"10"_s);
        EXPECT_FALSE(page.Label2.text.isEmpty());
        EXPECT_FALSE(page.sending);
    }
    const auto after = rig.localFiles();
    for (const auto& [name, bytes] : before)
        EXPECT_EQ(after.at(name), bytes) << name.toStdString();
}

INSTANTIATE_TEST_SUITE_P(
    FtpFrm, EndStates,
    ::testing::Values(EndState{"clean", [](FakeLab&, FtpFrmRig&) {}, true, none, 5},
                      EndState{"login refused", [](FakeLab& lab, FtpFrmRig&) { lab.refusedLogins = FakeLab::always; },
                               false, fourth, 0},
                      EndState{"no folder can be made", [](FakeLab& lab, FtpFrmRig&) { lab.refusesFolders = true; },
                               false, fourth, 0},
                      EndState{"folder can't be entered", [](FakeLab& lab, FtpFrmRig&) { lab.refusesEntry = true; },
                               false, fourth, 0},
                      EndState{"folder from an earlier try",
                               [](FakeLab& lab, FtpFrmRig& rig) {
                                   lab.folders[FtpFrmRig::remoteFolder()][FtpFrmRig::first()] =
                                       rig.localFiles().at(FtpFrmRig::first());
                               },
                               true, none, 4},
                      EndState{"one put refused once",
                               [](FakeLab& lab, FtpFrmRig&) {
                                   lab.putFaults = {{FtpFrmRig::first(), 1, -1}};
                               },
                               true, second, 6},
                      EndState{"one put refused always",
                               [](FakeLab& lab, FtpFrmRig&) {
                                   lab.putFaults = {{FtpFrmRig::first(), FakeLab::always, -1}};
                               },
                               false, fourth, 8},
                      EndState{"cut in the middle of a file",
                               [](FakeLab& lab, FtpFrmRig&) {
                                   lab.putFaults = {{FtpFrmRig::first(), 1, 100}};
                               },
                               true, second, 6},
                      EndState{"cut, and the remains can't be deleted",
                               [](FakeLab& lab, FtpFrmRig&) {
                                   lab.putFaults = {{FtpFrmRig::first(), 1, 100}};
                                   lab.refusesDelete = true;
                               },
                               true, second, 6},
                      EndState{"cut in each attempt, remains stay",
                               [](FakeLab& lab, FtpFrmRig&) {
                                   lab.putFaults = {{FtpFrmRig::proof(), FakeLab::always, 100}};
                                   lab.refusesDelete = true;
                               },
                               false, fourth, 8},
                      EndState{"dots in the listing", [](FakeLab& lab, FtpFrmRig&) { lab.listsDots = true; }, true,
                               none, 5},
                      EndState{"server back at the second attempt",
                               [](FakeLab& lab, FtpFrmRig& rig) { backAt(lab, rig, second); }, true, second, 5},
                      EndState{"server back at the third attempt",
                               [](FakeLab& lab, FtpFrmRig& rig) { backAt(lab, rig, third); }, true, third, 5},
                      EndState{"server back at the fourth attempt",
                               [](FakeLab& lab, FtpFrmRig& rig) { backAt(lab, rig, fourth); }, true, fourth, 5}),
    [](const ::testing::TestParamInfo<EndState>& each) {
        QString name = QString::fromLatin1(each.param.name);
        name.remove(u',').remove(u'\'');
        return name.replace(u' ', u'_').toStdString();
    });

TEST_F(FtpFrmTest, CountsTheMissingFilesBesideTheNumberOfTheDesign) {
    lab.putFaults = {{FtpFrmRig::first(), FakeLab::always, -1}, {FtpFrmRig::second(), FakeLab::always, 50}};
    rig.send();
    EXPECT_EQ(rig.page().Label31.text, u"0"_s);
    EXPECT_EQ(rig.page().Label4Missing.text, u"2"_s);
    EXPECT_EQ(rig.page().Label12.text, u"5"_s);
    EXPECT_FALSE(remote().contains(FtpFrmRig::second()));
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

TEST_F(FtpFrmTest, TellsTheLabsSiteInThreeCallsInOrder) {
    rig.send();
    const QString site = u"http://192.0.2.10/"_s;
    EXPECT_EQ(lab.urls, (QStringList{site + u"aaaqamootreport/padd.aspc.txt"_s,
                                     site + u"aaaqamootreport/padd.asp?k1=tarvelmond&t1=2026_11_21_KUP_1234^105    "
                                            "10_15G_FIT_NB&t2=Notes: gift, \"big\" - &t3=Pratim: 03-1234567    דנה "
                                            "לוי&t4=Adress: &t5=Mail: dana@example.com&t8=Total_pics: 13"_s,
                                     site + u"aaasssppp/p.asp?t1=tarvelmond&t2=true"_s}));
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
        FakeLab line;
        line.folders[u"zalamim234"_s];
        FtpFrmRig order(line);
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

TEST_F(FtpFrmTest, EndsAtOnceWhenTheProgramIsClosedInTheMiddle) {
    lab.onPut = [&](const QString& name) {
        if (name == FtpFrmRig::sheet())
            rig.page().Command16_Click();
    };
    rig.send();
    EXPECT_TRUE(rig.chain.hasEnded());
    EXPECT_EQ(lab.puts.size(), 2);
    EXPECT_TRUE(rig.test.dialogs.messages.isEmpty());
}

// The window's own close knows nothing of the pass that runs below it.
TEST_F(FtpFrmTest, EndsAtOnceWhenTheWindowIsClosedOrThePageUnloadedInTheMiddle) {
    for (const bool closed : {true, false}) {
        FakeLab line;
        line.folders[u"zalamim234"_s];
        FtpFrmRig order(line);
        line.onPut = [&](const QString& name) {
            if (name != FtpFrmRig::sheet())
                return;
            if (closed)
                order.chain.endProgram();
            else
                order.chain.unload(PageId::FtpFrm);
        };
        order.send();
        EXPECT_EQ(line.puts.size(), 2);
        EXPECT_TRUE(line.urls.isEmpty());
        EXPECT_TRUE(order.test.dialogs.messages.isEmpty());
    }
}

// Nobody answers: a stop ends the tries, in a pass as in the check behind it.
TEST_F(FtpFrmTest, AStopDoesNotWaitForTheOtherTriesToReachTheServer) {
    for (const bool inCheck : {false, true}) {
        FakeLab line;
        line.folders[u"zalamim234"_s];
        FtpFrmRig order(line);
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
    EXPECT_EQ(page.Label34.text, QString::fromUtf8(fourth));
    EXPECT_FALSE(page.Picture6.visible);
    EXPECT_FALSE(page.Picture2.visible);
    EXPECT_EQ(page.AllDone, 0);
    EXPECT_EQ(page.pageSize, FtpBoard::PageSize::Full);
    EXPECT_EQ(page.Label3.text, u"6 קבצים שהועלו בהצלחה "_s);
    EXPECT_TRUE(rig.test.dialogs.messages.isEmpty());
    EXPECT_EQ(lab.puts.size(), 5);
}

TEST_F(FtpFrmTest, EndsInSilenceWhenANameStandsTwiceInTheOrder) {
    rig.state.transfer.SugMishloah = 1;
    rig.state.handOver.lines = {FtpFrmRig::local(FtpFrmRig::first()), FtpFrmRig::local(FtpFrmRig::first())};
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
    rig.state.transfer.SugMishloah = 1;
    rig.state.shemot.Mail = u"other@example.com"_s;
    (void)rig.test.files.writeWhole(FtpFrmRig::local(FtpFrmRig::log()), "\"Shemot.n1\",\"Dana\"\r\n");
    rig.state.handOver.lines = {FtpFrmRig::local(FtpFrmRig::log()), FtpFrmRig::local(FtpFrmRig::second())};
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
    rig.state.transfer.SugMishloah = 1;
    for (const QString& name : FtpFrmRig::names().mid(0, 4))
        rig.state.handOver.lines += FtpFrmRig::local(name);
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
    rig.state.transfer.Mefurak = 1;
    rig.write(u"a_001_002.prk"_s, "1");
    rig.write(u"a_002_002.prk"_s, "2");
    rig.send();
    EXPECT_EQ(lab.puts, (QStringList{FtpFrmRig::log(), FtpFrmRig::sheet(), u"a_001_002.prk"_s, u"a_002_002.prk"_s,
                                     FtpFrmRig::proof()}));
    EXPECT_EQ(rig.page().PicInProgKatanWidth, FtpBoard::Pic4ProgWidth);
    EXPECT_EQ(rig.page().AllDone, 1);
}

TEST_F(FtpFrmTest, WithoutASheetThePutOfTheFolderItselfFails) {
    rig.state.transfer.Mefurak = 1;
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

TEST_F(FtpFrmTest, BothEndStatesLeadToANewOrder) {
    rig.send();
    rig.page().Command28_Click();
    EXPECT_EQ(rig.chain.front()->id(), PageId::hatchala);
    EXPECT_EQ(rig.chain.find(PageId::FtpFrm), nullptr);
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
    EXPECT_TRUE(found.isEmpty()) << found.join(u'\n').toStdString();
    for (const Caption* control : {&page.Command10, &page.Command28, &page.Picture7, &page.Label4Hamtana, &page.Label9})
        EXPECT_FALSE(hebrew(control->text)) << control->text.toStdString();
}

TEST_F(FtpFrmTest, SendsAChainOfOrdersAndDropsWhatIsThere) {
    rig.state.transfer.SugMishloah = 2;
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
    rig.state.transfer.SugMishloah = 1;
    for (const QString& name : FtpFrmRig::names().mid(0, 4))
        rig.state.handOver.lines += FtpFrmRig::local(name);
    lab.putFaults = {{FtpFrmRig::first(), 1, -1}};
    FtpFrm& page = rig.start();
    page.Command2_Click();
    EXPECT_EQ(page.Label3.text, uploaded);
    EXPECT_EQ(page.Label4.text, u"1"_s);
    EXPECT_EQ(lab.puts.size(), 6);
    EXPECT_EQ(lab.urls.size(), 3);
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
