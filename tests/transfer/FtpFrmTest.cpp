#include "imaging/files/PictureFile.h"
#include "order/OrderFolder.h"
#include "order/OrderJournal.h"
#include "order/OrderLog.h"
#include "order/OrderState.h"
#include "order/PrintFile.h"
#include "order/UnfinishedOrders.h"
#include "platform/media/MediaFolders.h"
#include "session/Workspace.h"
#include "support/FtpFrmRig.h"
#include "transfer/delivery/OrderFiles.h"
#include "transfer/slip/OrderSlip.h"

#include <QTest>

#include <gtest/gtest.h>

#include <fstream>
#include <functional>

namespace lumora {

namespace {

using Line = FtpFrmLine;
class FtpFrmTest : public ::testing::Test, protected Line {};

} // namespace

TEST(FtpFrm, NamesWhatWasLeftOutAndCarefullyWaitsForTheAnswer) {
    enum class Way { On, Back, Resend, ByHand };
    for (const auto& [careful, way] :
         {std::pair(false, Way::On), {true, Way::On}, {true, Way::Back}, {true, Way::Resend}, {true, Way::ByHand}}) {
        Line line;
        SessionState& state = line.rig.state;
        state.Careful = careful;
        state.EnglishTips = 1;
        OrderLog log;
        log.Hazmana = FtpFrmRig::name();
        log.shemot.n1 = u"Иван"_s;
        log.shemot.TotalPics = 15;
        log.failed = {u"C:\\a.jpg"_s, u"C:\\b.jpg"_s};
        line.rig.write(FtpFrmRig::log(), log.write());
        state.shemot = state.handOver.details = log.shemot;
        state.transfer.leftOut = {{u"C:\\a.jpg"_path}, {u"C:\\b.jpg"_path}};
        state.handOver.basket = {u"1 1015GNBC:\\a.jpg"_s};
        if (way == Way::Resend) {
            line.rig.takeUpAgain({FtpFrmRig::log(), FtpFrmRig::first(), FtpFrmRig::second()});
            state.transfer.leftOut.clear();
        }
        line.rig.chain.registerPage(PageId::kyoskNew, [] { return std::make_unique<Page>(PageId::kyoskNew); });
        FtpFrm& page = line.rig.start();
        const LeftOutControls& shown = page.controls().leftOut;
        const bool asks = way != Way::Resend;
        const SendingPhase end = asks ? SendingPhase::Success : SendingPhase::PartThere;
        EXPECT_EQ(shown.Pic4Hasserot.visible, asks);
        EXPECT_EQ(page.counting(), !careful || !asks) << "the count runs on behind the box";
        EXPECT_TRUE(page.controls().Picture2Lines.contains(u" Total pictures 13"_s)) << "15 were chosen";
        page.Image5_Click();
        EXPECT_EQ(page.phase(), careful && asks ? SendingPhase::Waiting : end);
        EXPECT_EQ(shown.Command4Hazor.visible, careful && asks) << "no way back once it is sent";
        if (way == Way::Back) {
            page.Command4Hazor_Click();
            EXPECT_EQ(line.rig.chain.front()->id(), PageId::kyoskNew);
            EXPECT_EQ(state.shemot.n1, log.shemot.n1) << "not as the log has it";
            EXPECT_TRUE(state.handOver.back && !line.rig.test.files.folderExists(FtpFrmRig::folder()));
            continue;
        }
        if (way == Way::ByHand) {
            line.rig.test.pump.onPump = [&] { page.Command4Hazor_Click(); };
            page.cmdInternetOpen_Click();
            line.rig.test.pump.onPump = nullptr;
            ASSERT_EQ(line.rig.chain.front()->id(), PageId::FtpFrm) << "not in the middle of a step";
            page.File1_Click(0);
            page.Command3_Click();
            EXPECT_FALSE(shown.Command4Hazor.visible);
        }
        page.Command4Bli_Click();
        EXPECT_FALSE(shown.Pic4Hasserot.visible);
        EXPECT_EQ(page.counting(), careful && asks);
        line.rig.countDown();
        EXPECT_EQ(page.phase(), end);
        EXPECT_EQ(shown.Label4Kartis.text, u"2 pictures that you chose are not in the order."_s);
        EXPECT_FALSE(page.controls().Label4Do.text.contains(u"whole order has"_s));
    }
}

// What the customer reads at each end; which end it is, the rules of the sender decide.
TEST(FtpFrm, EndsAsTheCustomerIsTold) {
    const struct {
        SendingPhase end;
        void (*arrange)(Line&);
        QString status;
    } cases[] = {
        {SendingPhase::Success, [](Line&) {}, u"הקבצים הועלו בהצלחה"_s},
        {SendingPhase::Stopped,
         [](Line& line) {
             for (const QString& name : FtpFrmRig::names())
                 line.remote()[name] = "there";
             line.rig.test.pump.onPump = [&] {
                 if (line.rig.page().phase() == SendingPhase::Checking)
                     line.rig.page().Command15_Click();
             };
         },
         u"5 קבצים שהועלו בהצלחה "_s},
        {SendingPhase::NotAll, [](Line& line) { line.lab.refusesFolders = true; }, u"לא כל הקבצים הועלו"_s},
        {SendingPhase::AllThere, [](Line& line) { line.remote()[u"stranger.jpp"_s] = "x"; },
         u"6 קבצים שהועלו בהצלחה "_s},
        {SendingPhase::Unclear, [](Line& line) { line.rig.takeUpAgain(QStringList(2, FtpFrmRig::first())); },
         u"2 קבצים שהועלו בהצלחה "_s},
        {SendingPhase::Stopped,
         [](Line& line) { line.lab.onPut = [&](const QString&) { line.rig.page().Command15_Click(); }; },
         u" סיים להעלות קובץ1"_s},
    };
    for (const auto& each : cases) {
        SCOPED_TRACE(static_cast<int>(each.end));
        Line line;
        each.arrange(line);
        line.rig.send();
        FtpFrm& page = line.rig.page();
        const FtpFrmControls& shown = page.controls();
        const bool success = each.end == SendingPhase::Success;
        EXPECT_EQ(page.phase(), each.end);
        EXPECT_EQ(shown.Label3.text, each.status);
        EXPECT_EQ(shown.Picture6.visible, each.end == SendingPhase::NotAll);
        const int files = each.end == SendingPhase::Unclear ? 3 : 5; // as many as the failure tells of
        EXPECT_TRUE(shown.Label4Counts.text.endsWith(u" %1 קבצים"_s.arg(files)));
        EXPECT_EQ(shown.Label34.visible && shown.Label34.text.startsWith(u"נסיון רביעי"_s),
                  each.end == SendingPhase::NotAll);
        EXPECT_EQ(shown.Command10.visible, !hasArrived(each.end));
        EXPECT_EQ(line.lab.urls.size(), success ? 3 : 0);
        EXPECT_EQ(line.rig.test.dialogs.messages.size(), each.end == SendingPhase::Stopped ? 2 : 0);
        EXPECT_EQ(shown.Label4Do.text.contains(u"2 מתוך 3"_s), each.end == SendingPhase::Unclear);
        // "Close", "do not close": what has ended stays so.
        page.Image3_Click();
        EXPECT_EQ(line.rig.chain.hasEnded(), hasArrived(each.end));
        EXPECT_EQ(shown.Picture7.visible, !hasArrived(each.end));
        page.Command14_Click();
        EXPECT_EQ(page.phase(), each.end);
        if (hasArrived(each.end))
            continue;
        page.Command28_Click();
        EXPECT_EQ(line.rig.chain.front()->id(), PageId::hatchala) << "every end leads to a new order";
        EXPECT_EQ(line.rig.chain.find(PageId::FtpFrm), nullptr);
    }
}

TEST_F(FtpFrmTest, ThanksByNameAndSaysWhenTheCardMayGo) {
    namespace fs = std::filesystem;
    const QTemporaryDir media;
    const fs::path card = fs::path(media.path().toStdString()) / "EOS.card";
    Cards cards([&] {
        return std::make_unique<MediaFolders>(std::vector{toHostPath(media.path())},
                                              [](const HostPath& path) { return path.extension() == ".card"; });
    });
    TestPlatform& test = rig.test;
    const Platform platform = test.with(test.dialogs, cards, lab);
    const auto wait = [](const auto& done) { return QTest::qWaitFor(done, 30000); };
    for (const auto sending : {Sending::Resend, Sending::NewOrder}) {
        fs::create_directories(card);
        std::ofstream(card / "1.jpg") << "picture";
        rig.chain.registerPage(PageId::FtpFrm,
                               [&] { return std::make_unique<FtpFrm>(rig.state, platform, rig.chain); });
        rig.state.transfer.SugMishloah = sending;
        rig.start().showPrints();
        const FtpFrmControls& shown = rig.page().controls();
        EXPECT_FALSE(shown.thanks.visible || shown.cardMayGo.visible);
        rig.countDown();
        EXPECT_TRUE(shown.thanks.visible && shown.nextSteps.visible);
        EXPECT_EQ(shown.thanks.text, u"תודה, \u2068דנה\u2069!"_s);
        EXPECT_EQ(shown.shortNumber.text, u"105"_s);
        const Cards::Watch watch(cards);
        const auto isCounted = [&] { return !cards.all().empty() && cards.all().front().summary; };
        EXPECT_TRUE(wait(isCounted) && shown.cardMayGo.visible == (sending == Sending::NewOrder));
        fs::remove_all(card);
        EXPECT_TRUE(wait([&] { return !shown.cardMayGo.visible; }));
        rig.chain.unload(PageId::FtpFrm);
        QCoreApplication::processEvents();
        remote().clear();
    }
}

TEST_F(FtpFrmTest, ShowsTheFirstPrintsInTheOrderOfTheBasketAndLeavesOutWhatIsNoPicture) {
    rig.state.profile.JppChunks = 56;
    const auto print = [&](int index, PictureSize size) {
        const QByteArray jpeg = take(encodeJpeg(Bitmap(size.width, size.height, Qt::red), 80));
        rig.write(u"011015GNB%1_03AA.jpp"_s.arg(index, 4, 10, QChar(u'0')),
                  take(packPrintFile(jpeg, PrintFileShape::of(rig.state.profile), QByteArray(40, ' '))));
    };
    for (int i = 9; i > 1; --i)
        print(i, {i * 100, 100});
    FtpFrm& page = rig.start();
    page.showPrints();
    ASSERT_TRUE(QTest::qWaitFor([&] { return !page.prints().empty(); }, 30000));
    std::vector<int> heights;
    for (const Bitmap& made : page.prints()) {
        EXPECT_EQ(made.width(), 480);
        heights.push_back(made.height());
    }
    EXPECT_EQ(heights, (std::vector{240, 160, 120})) << "of the first five files two are no pictures";
}

TEST(FtpFrm, LeadsBackToThePicturesUntilTheSendingBegins) {
    for (const int ticks : {0, 1, 15}) {
        for (const auto sending : {Sending::NewOrder, Sending::Resend}) {
            Line line;
            SessionState& state = line.rig.state;
            state.handOver.basket = {u"1 1015GNBC:\\a.jpg"_s};
            state.handOver.details.n1 = u"Иван"_s;
            state.handOver.takenUp = FtpFrmRig::folder();
            const QString corrected = u"C;]a.jpg"_s;
            const DrivePath kept = KeptWorkFolder(OrderFolder(FtpFrmRig::folder()), WorkspacePaths::tempred(state));
            line.rig.makeFolder(kept);
            line.rig.PageRig::write(kept / corrected, "x");
            if (sending == Sending::Resend)
                line.rig.takeUpAgain({FtpFrmRig::log(), FtpFrmRig::first()});
            line.rig.registerBare({PageId::kyoskNew});
            FtpFrm& page = line.rig.start();
            for (int i = 0; i < ticks; ++i)
                page.Timer1_Tick();
            if (ticks == 1)
                page.Command23_Click();
            const bool may = ticks < 15 && sending == Sending::NewOrder;
            EXPECT_EQ(page.controls().changeOrder.visible, may);
            page.changeOrder_Click();
            EXPECT_EQ(line.rig.chain.front()->id(), may ? PageId::kyoskNew : PageId::FtpFrm);
            EXPECT_EQ(state.handOver.back, may);
            EXPECT_EQ(line.rig.test.files.folderExists(FtpFrmRig::folder()), !may);
            EXPECT_EQ(state.shemot.n1 == u"Иван"_s, may) << "not as the log has it";
            EXPECT_EQ(line.rig.test.files.fileExists(WorkspacePaths::tempred(state) / corrected), may)
                << "what another run has made of a picture";
        }
    }
}

TEST(FtpFrm, PrintsASlipAndTellsTheCustomerOnceTheQueueHasIt) {
    for (const bool takes : {true, false}) {
        Line line;
        SessionState& state = line.rig.state;
        RecordedPrinter& printer = line.rig.test.printer;
        state.kiosk.printer = u"slips"_s;
        FtpFrm& page = line.rig.start();
        const SendingPage& shown = page;
        page.showPrints();
        EXPECT_TRUE(shown.slipCode().isNull());
        page.Image5_Click();
        ASSERT_EQ(printer.papers.size(), 1);
        EXPECT_EQ(printer.papers[0].first, u"slips");
        EXPECT_TRUE(printer.papers[0].second.startsWith("%PDF"));
        EXPECT_FALSE(page.controls().slip.visible || shown.slipCode().isNull());
        printer.whenDone(takes ? Result<void>() : Failure{Failure::Kind::Refused, u"no such queue"_s});
        EXPECT_EQ(page.controls().slip.visible, takes);
        EXPECT_EQ(state.slipTrouble, takes ? u""_s : u"no such queue"_s);
        EXPECT_EQ(OrderSlip::codeOf(state), FtpFrmRig::name() + u"\n13\n03-1234567"_s) << "no name";
        state.shemot.n2 = u"***"_s;
        EXPECT_EQ(OrderSlip::codeOf(state), FtpFrmRig::name() + u"\n13\n"_s) << "the session's mark for none";
        line.rig.chain.unload(PageId::FtpFrm);
        printer.whenDone({});
    }
}

TEST_F(FtpFrmTest, SendsAfterTheFifteenthSecondAndOnlyOnce) {
    EXPECT_TRUE(OrderJournal(rig.test.files, OrderFolder(FtpFrmRig::folder())).prepared());
    const auto isHeld = [this] { return take(ReadOrderState(rig.test.files, OrderFolder(FtpFrmRig::folder()))).held; };
    FtpFrm& page = rig.start();
    page.Command23_Click();
    EXPECT_FALSE(page.counting());
    EXPECT_TRUE(isHeld()) << "it is not sent by itself";
    page.Command23_Click();
    EXPECT_TRUE(page.counting());
    EXPECT_FALSE(isHeld());
    for (int tick = 0; tick < 14; ++tick)
        page.Timer1_Tick();
    EXPECT_EQ(page.controls().Label20.text, u"1"_s);
    EXPECT_TRUE(lab.puts.isEmpty());
    page.Timer1_Tick();
    EXPECT_EQ(lab.puts, FtpFrmRig::names());
    page.Timer1_Tick();
    page.Command12_Click();
    page.Command10_Click();
    EXPECT_EQ(lab.urls.size(), 3);
}

// The window's own close knows nothing of the pass that runs below it.
TEST(FtpFrm, EndsAtOnceWhenTheProgramOrThePageGoesInTheMiddle) {
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

TEST_F(FtpFrmTest, TakesTheLinesOfAResendAndForgetsTheCustomerBefore) {
    rig.chain.show(PageId::MoogMeret);
    rig.state.shemot.Mail = u"other@example.com"_s;
    (void)rig.test.files.writeWhole(FtpFrmRig::local(FtpFrmRig::log()), "\"Shemot.n1\",\"Dana\"\r\n");
    rig.takeUpAgain({FtpFrmRig::log(), FtpFrmRig::second()});
    FtpFrm& page = rig.start();
    EXPECT_EQ(rig.chain.find(PageId::MoogMeret), nullptr);
    EXPECT_EQ(page.controls().Label7.text, u"2"_s);
    EXPECT_EQ(rig.state.shemot.Mail, QString());
    EXPECT_EQ(rig.state.shemot.n1, u"Dana"_s);
    EXPECT_EQ(page.controls().Label21.text, u"11"_s);
    EXPECT_TRUE(rig.state.handOver.lines.isEmpty());
    rig.countDown();
    EXPECT_EQ(page.phase(), SendingPhase::Success);
    EXPECT_EQ(lab.puts, (QStringList{FtpFrmRig::log(), FtpFrmRig::second(), FtpFrmRig::proof()}));
}

TEST_F(FtpFrmTest, SendsTheFirstSheetAndThePiecesOfAnOrderInPieces) {
    rig.state.transfer.Mefurak = Travel::Pieces;
    rig.write(u"a_001_002.prk"_s, "1");
    rig.write(u"a_002_002.prk"_s, "2");
    EXPECT_EQ(FtpOrderFiles(rig.test.files, OrderFolder(FtpFrmRig::folder()), {}, true).last(),
              FtpFrmRig::local({}).text())
        << "without a sheet the folder itself, whose put fails";
    rig.send();
    EXPECT_EQ(lab.puts, (QStringList{FtpFrmRig::log(), FtpFrmRig::sheet(), u"a_001_002.prk"_s, u"a_002_002.prk"_s,
                                     FtpFrmRig::proof()}));
    EXPECT_EQ(rig.page().controls().PicInProgKatanWidth, FtpFrmControls::Pic4ProgWidth);
    EXPECT_EQ(rig.page().phase(), SendingPhase::Success);
    EXPECT_EQ(take(ReadOrderState(rig.test.files, OrderFolder(FtpFrmRig::folder()))).phase, OrderState::Phase::Sending)
        << "by its name it is no order in pieces, and its pictures were not sent";
}

TEST_F(FtpFrmTest, AKeptSessionTellsItsWayInBytesAndAllOfThemOnlyOnceTheyHaveArrived) {
    rig.state.transfer.keptFtpSession = true;
    rig.write(FtpFrmRig::first(), QByteArray(3'000'000, 'x'));
    rig.write(FtpFrmRig::second(), QByteArray(1'000'000, 'x'));
    QMap<QString, int> shares;
    QString atTheEnd;
    lab.onPut = [&](const QString& name) {
        shares[name] = rig.page().controls().percent;
        atTheEnd = rig.page().controls().Label4Bytes.visible ? rig.page().controls().Label4Bytes.text : QString();
    };
    int most = 0;
    rig.start();
    QObject::connect(&rig.page(), &Page::changed, &rig.page(), [&] {
        if (rig.page().phase() <= SendingPhase::Checking)
            most = std::max(most, rig.page().controls().percent);
    });
    rig.countDown();
    EXPECT_EQ(most, 99);
    EXPECT_EQ(shares[FtpFrmRig::log()], 0);
    EXPECT_EQ(shares[FtpFrmRig::second()], 74);
    EXPECT_EQ(shares[FtpFrmRig::proof()], 99);
    EXPECT_TRUE(atTheEnd.startsWith(u"4.0 "_s)) << atTheEnd.toStdString();
    EXPECT_TRUE(rig.page().controls().percent == 100 && !rig.page().controls().Label4Bytes.visible);
}

TEST_F(FtpFrmTest, SendsAChainOfOrdersAndDropsWhatIsThere) {
    rig.state.transfer.SugMishloah = Sending::Chain;
    FtpFrm& page = rig.start();
    EXPECT_FALSE(page.counting());
    remote()[FtpFrmRig::first()] = rig.localFiles().at(FtpFrmRig::first());
    page.takeChain({FtpFrmRig::name(), u"none^1"_s});
    rig.state.transfer.ShemTikiya = u"own^2"_s;
    page.ListRezefFiles_Click(1);
    page.Command25_Click();
    EXPECT_EQ(rig.state.transfer.ShemTikiya, u"own^2"_s) << "another order was only looked for";
    page.Command19_Click();
    EXPECT_EQ(page.controls().Label3.text, u"  סיים  "_s);
    EXPECT_EQ(page.controls().Label4siem.text, u"2 / 2"_s);
    EXPECT_EQ(lab.puts.size(), 3);
    ASSERT_EQ(lab.urls.size(), 3) << "the report of the order that arrived";
    EXPECT_TRUE(lab.urls.at(1).endsWith(u"padd.asp"_s));
}

TEST_F(FtpFrmTest, ShowsTheLabAreaAndTheDeliveryNoteWhereTheyAreWanted) {
    FtpFrmRig home(lab);
    home.state.KodMishloach = u"HOM"_s;
    home.state.shemot.n3 = u"Herzl 1"_s;
    rig.state.OperatorArea = false;
    for (FtpFrmRig* each : {&rig, &home}) {
        FtpFrm& page = each->start();
        page.Command24_Click();
        EXPECT_EQ(page.controls().Frame2.visible, each == &home) << "the lab's hidden area";
        EXPECT_EQ(page.controls().Label15.visible, each == &home) << "the delivery note";
    }
    EXPECT_EQ(home.page().controls().Label4Ktovet.text, u"Herzl 1"_s);
}

} // namespace lumora
