#include "start/hatchala.h"

#include "common/HostFile.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/ExampleOrder.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

// Gives what a settings host would: the bytes of one file, or nothing.
class SettingsSite : public NoInternet {
public:
    Result<void> download(const QString& url, const HostPath& target) override {
        urls += url;
        if (answer.isEmpty())
            return Failure{Failure::Kind::NotFound, u"404"_s};
        return writeWholeFile(target, answer);
    }
    QStringList urls;
    QByteArray answer;
};

class hatchalaTest : public ::testing::Test {
protected:
    hatchalaTest() {
        deployment.profile.Shops = {Shop{u"Haifa"_s, u"04-1"_s}, Shop{u"Yaffo"_s, u"03-2"_s}};
        chain.registerPage(PageId::hatchala,
                           [this] { return std::make_unique<hatchala>(state, machine.platform, chain, deployment); });
        chain.registerPage(PageId::nnn, [] { return std::make_unique<Page>(PageId::nnn); });
    }
    hatchala& start() {
        chain.show(PageId::hatchala);
        return static_cast<hatchala&>(*chain.front());
    }

    SettingsSite site;
    TestPlatform machine{site};
    SessionState state;
    Deployment deployment;
    PageChain chain{machine.pump};
};

TEST_F(hatchalaTest, OpensInHebrewWithTheProfileOfTheLab) {
    state.EnglishTips = 1;
    deployment.SugTzad = 60;
    deployment.profile.LabPhone = u"09-9"_s;
    deployment.profile.LabMail = u"lab@example.com"_s;
    state.handOver.kept = {u"104"_s, 2};
    hatchala& page = start();
    EXPECT_EQ(state.EnglishTips, 0);
    EXPECT_EQ(state.SugTzad, 60);
    EXPECT_EQ(page.controls().List1.items(), QStringList({"* Haifa", "* Yaffo"}));
    EXPECT_EQ(page.controls().Label4Tel.text + page.controls().Label1.text, u"09-9lab@example.com");
    EXPECT_TRUE(page.controls().Notice.visible && page.controls().Notice.text.contains(u"104 מוכנה"));
    EXPECT_TRUE(state.handOver.kept.number.isEmpty()) << "the line is for one customer";
    page.Check1_Click(true);
    EXPECT_EQ(page.controls().Notice.text, u"Order number 104 is ready and kept at this station. 2 pictures that you "
                                           "chose are not in the order.");
    page.Command4Ivrit_Click();
    EXPECT_TRUE(page.timers().Timer2.running() && page.timers().Timer5.running());
    EXPECT_FALSE(page.timers().Timer1.running() || page.timers().Timer3.running() || page.timers().Timer4.running());
}

TEST_F(hatchalaTest, SwitchesItsWordingAndKeepsTwoRows) {
    hatchala& page = start();
    page.Check1_Click(true);
    page.Check1_Click(true);
    EXPECT_EQ(page.controls().List1.items(), QStringList({"* Recieve by Postmail ", "* Get at stor "}));
    state.Careful = true;
    page.Check1_Click(true);
    EXPECT_EQ(page.controls().List1.items(), QStringList({"* Haifa", "* Yaffo"}))
        << "the shops that the rows stand for";
}

TEST_F(hatchalaTest, ThePressOnStartHandsOverOnce) {
    hatchala& page = start();
    page.Check1_Click(true);
    state.MishloachHabaita = true;
    state.shemot.Mail = u"earlier@example.com"_s;
    state.profile.FtpServer = u"changed in the panel"_s;
    page.Image1_MouseDown();
    page.Image1_MouseDown();
    page.Image1_Click();
    ASSERT_EQ(chain.front()->id(), PageId::nnn);
    EXPECT_EQ(chain.find(PageId::hatchala), nullptr);
    EXPECT_EQ(state.KodMishloach, u"KUP");
    EXPECT_EQ(state.KodMishloachMakor, u"KUP");
    EXPECT_FALSE(state.MishloachHabaita);
    EXPECT_TRUE(state.shemot.Mail.isEmpty());
    EXPECT_EQ(state.profile.FtpServer, u"192.0.2.10");
    EXPECT_EQ(state.EnglishTips, 1) << "only the next load of this page clears it";
    EXPECT_FALSE(page.timers().Timer2.running() || page.timers().Timer5.running());
}

TEST_F(hatchalaTest, TheOrderBeginsWhenTheCountdownEnds) {
    hatchala& page = start();
    for (int second = 0; second < 5; ++second)
        page.Timer4_Tick();
    EXPECT_EQ(page.controls().Label6.text, u"0");
    EXPECT_EQ(chain.front(), &page);
    page.Timer4_Tick();
    EXPECT_EQ(chain.front()->id(), PageId::nnn);
    EXPECT_EQ(state.KodMishloach, u"PIC");
}

TEST_F(hatchalaTest, OffersAnOrderThatWasNotFinished) {
    deployment.profile.JppChunks = 56;
    chain.registerPage(PageId::Form2, [] { return std::make_unique<Page>(PageId::Form2); });
    chain.registerPage(PageId::FtpFrm, [] { return std::make_unique<Page>(PageId::FtpFrm); });
    const DrivePath orders = u"C:\\2000lumora\\!!000"_path;
    const auto give = [&](const QString& number, OrderState order) {
        const OrderFolder folder(orders / (u"2026_11_21_KUP_1234^"_s + number));
        std::filesystem::create_directories(*machine.drives.toHost(folder.path()));
        order.number = number;
        order.kind = OrderKind::Print;
        EXPECT_TRUE(WriteOrderState(machine.files, folder, order));
        EXPECT_TRUE(machine.files.writeWhole(folder.filePath(u"1 1015GNB0000_016F6E65.jpp"_s),
                                             examplePrint(deployment.profile)));
        return folder;
    };
    OrderState preparing;
    preparing.items = {u"1 1015GNBC:\\pics\\one.jpg"_s, u"1 1015GNBC:\\pics\\gone.jpg"_s};
    OrderState sending;
    sending.phase = OrderState::Phase::Sending;
    sending.filesSent = 3;
    sending.filesInAll = 7;
    const OrderFolder newer = give(u"106"_s, preparing);
    const OrderFolder older = give(u"105"_s, sending);

    hatchala* page = &start();
    const auto& c = page->controls();
    EXPECT_TRUE(c.Pic4Hemshech.visible && c.Label4Od.visible);
    page->Check1_Click(true);
    EXPECT_EQ(c.Label4Hemshech.text, u"Order number 106: 1 of 2 pictures are prepared.");
    EXPECT_EQ(c.Label4Od.text, u"More orders that were not finished: 1");
    page->Image1_MouseDown();
    page->Image1_Click();
    for (int second = 0; second < 7; ++second)
        page->Timer4_Tick();
    ASSERT_EQ(chain.front(), page) << "nothing begins behind the panel";

    page->Command4Hemshech_Click();
    EXPECT_EQ(c.Label4Hemshech.text, u"1 of 2 pictures are no longer where they were.");
    EXPECT_EQ(c.Command4Hemshech.text, u"Go on without them");
    page->Command4Achar_Click(); // the card is being looked for
    EXPECT_EQ(c.Command4Hemshech.text, u"Go on");
    page->Command4Hemshech_Click();
    page->Command4Hemshech_Click();
    ASSERT_EQ(chain.front()->id(), PageId::Form2);
    EXPECT_EQ(state.handOver.takenUp, newer.path());
    chain.unload(PageId::Form2);

    page = &start();
    machine.dialogs.answers = {false, true};
    page->Command4Bitul_Click();
    EXPECT_TRUE(machine.files.folderExists(newer.path()));
    page->Command4Bitul_Click();
    EXPECT_FALSE(machine.files.folderExists(newer.path()));
    EXPECT_FALSE(page->controls().Label4Od.visible);
    EXPECT_TRUE(page->controls().Label4Hemshech.text.contains(u"3 מתוך 7"_s));
    page->Command4Hemshech_Click();
    ASSERT_EQ(chain.front()->id(), PageId::FtpFrm);
    EXPECT_EQ(state.transfer.OrderFolder, older.path());
    chain.unload(PageId::FtpFrm);

    page = &start();
    page->Command4Achar_Click();
    EXPECT_FALSE(page->controls().Pic4Hemshech.visible);
    page->Image1_MouseDown();
    ASSERT_EQ(chain.front()->id(), PageId::nnn);
    chain.unload(PageId::nnn);
    EXPECT_FALSE(start().controls().Pic4Hemshech.visible) << "later is for the whole run";
}

TEST_F(hatchalaTest, OffersAnOrderOnAKioskToWhoKnowsItsTelephoneAndForAWhile) {
    deployment.kiosk.on = true;
    chain.registerPage(PageId::Form2, [] { return std::make_unique<Page>(PageId::Form2); });
    const auto give = [&](const QString& number, OrderState::Phase phase) {
        const OrderFolder folder(u"C:\\2000lumora\\!!000"_path / (u"2026_11_21_KUP_1234^"_s + number));
        std::filesystem::create_directories(*machine.drives.toHost(folder.path()));
        OrderState order;
        order.phase = phase;
        order.number = number;
        order.kind = OrderKind::Print;
        order.items = {u"1 1015GNBC:\\pics\\one.jpg"_s};
        order.choices = {{u"Shemot.n2"_s, u"03-1234"_s + number}};
        EXPECT_TRUE(WriteOrderState(machine.files, folder, order));
        EXPECT_TRUE(machine.files.writeWhole(folder.filePath(u"1 1015GNB0000_016F6E65.jpp"_s), "print"));
        return folder;
    };
    std::filesystem::create_directories(*machine.drives.toHost(u"C:\\pics"_path));
    EXPECT_TRUE(machine.files.writeWhole(u"C:\\pics\\one.jpg"_path, "picture"));
    hatchala* page = nullptr;
    const auto again = [&]() -> const hatchalaControls& {
        chain.unload(chain.front()->id());
        page = static_cast<hatchala*>(chain.front());
        return page->controls();
    };
    const auto type = [&](std::initializer_list<int> digits) {
        for (const int digit : digits)
            page->Command4Sifra_Click(digit);
    };
    const auto isThere = [&](const OrderFolder& order) { return machine.files.folderExists(order.path()); };
    const OrderFolder preparing = give(u"105"_s, OrderState::Phase::Preparing);
    const OrderFolder prepared = give(u"106"_s, OrderState::Phase::Prepared);

    page = &start();
    const hatchalaControls* c = &page->controls();
    EXPECT_FALSE(c->Image3.visible || c->Command4Hemshech.visible || page->isUntouched());
    page->Command4Hemshech_Click();
    page->Command4Bitul_Click();
    type({1, 0});
    page->Command4Mehak_Click();
    EXPECT_EQ(c->Label4Sfarot.text, u"1 _ _");
    type({0, 5});
    EXPECT_TRUE(c->Label4Hemshech.text.contains(u"105"_s)) << "not the newest, but the one of these digits";
    page->Command4Hemshech_Click();
    ASSERT_EQ(chain.front()->id(), PageId::Form2) << c->Label4Hemshech.text.toStdString();

    c = &again();
    type({1, 0, 7, 1, 0, 8});
    EXPECT_TRUE(c->Label4Od.visible && c->Pic4Hemshech.visible);
    type({1, 0, 9});
    EXPECT_FALSE(c->Pic4Hemshech.visible) << "nobody tries on";
    EXPECT_TRUE(again().Pic4Hemshech.visible && isThere(preparing)) << "whose it is may come next";
    page->leftAlone();
    EXPECT_FALSE(again().Pic4Hemshech.visible || isThere(preparing));
    EXPECT_TRUE(isThere(prepared) && page->isUntouched());
    state.staff = true;
    page->setTexts();
    EXPECT_TRUE(page->controls().Label4Hemshech.text.contains(u"106"_s)) << "the staff decides";
}

TEST_F(hatchalaTest, AsksForTheShopWhereTheLabWantsIt) {
    deployment.DeliveryChoiceMode = 1;
    deployment.profile.LabPhone = u"09-9"_s;
    QString seenByTheDetails;
    chain.registerPage(PageId::nnn, [&] {
        seenByTheDetails = state.profile.LabPhone;
        return std::make_unique<Page>(PageId::nnn);
    });
    const struct {
        int row;
        QString code;
        QString phone;
        QString seen; // the first shop's number comes behind the hand-over
    } cases[] = {{0, "SOK", "04-1", "09-9"}, {1, "OSK", "03-2", "03-2"}};
    for (const auto& c : cases) {
        hatchala& page = start();
        page.Image1_MouseDown();
        ASSERT_EQ(chain.front(), &page);
        page.Image1_Click();
        EXPECT_TRUE(page.controls().Picture1.visible);
        EXPECT_EQ(state.KodMishloach, u"KUP");
        page.List1_Click(c.row);
        ASSERT_EQ(chain.front()->id(), PageId::nnn);
        EXPECT_EQ(state.KodMishloach, c.code);
        EXPECT_EQ(state.KodMishloachMakor, c.code);
        EXPECT_EQ(state.profile.LabPhone, c.phone);
        EXPECT_EQ(seenByTheDetails, c.seen);
        chain.unload(PageId::nnn);
    }
}

TEST_F(hatchalaTest, CarefullyAndOnAKioskAPageOfTheSiteThatNothingShowsIsTold) {
    hatchala& page = start();
    machine.shell.opens = false;
    for (const auto& [careful, kiosk, told] : {std::tuple(false, false, 0), {true, false, 1}, {false, true, 2}}) {
        deployment.Careful = careful;
        deployment.kiosk.on = kiosk;
        page.Image11_Click();
        EXPECT_EQ(machine.dialogs.messages.size(), told);
    }
}

TEST_F(hatchalaTest, TheAdvertisingPictureComesFromTheSiteOrTheInstallationAndMoves) {
    hatchala& page = start();
    page.Timer2_Tick();
    EXPECT_FALSE(page.timers().Timer2.running()) << "no picture on the disk";
    std::filesystem::create_directories(machine.drives.dataFolder() / "lumora" / "zmany");
    site.answer = "picture";
    page.Timer1_Tick();
    EXPECT_EQ(site.urls, QStringList({"http://www.lumora.example//ad01.jpg"}));
    EXPECT_EQ(page.controls().Picture4, state.profile.AdFile1);
    EXPECT_TRUE(page.timers().Timer2.running());
    page.Timer2_Tick();
    EXPECT_EQ(page.motion().Picture4Width(), 264);
    EXPECT_EQ(page.timers().Timer2.interval(), 30);

    std::filesystem::remove_all(machine.drives.dataFolder() / "2000lumora");
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\2000lumora"_path, "a file in the way").ok());
    ASSERT_TRUE(machine.files.removeFile(state.profile.AdFile1).ok());
    chain.unload(PageId::hatchala);
    hatchala& withoutFolder = start();
    withoutFolder.Timer1_Tick();
    EXPECT_EQ(withoutFolder.controls().Picture4, DrivePath());
    ASSERT_TRUE(machine.files.writeWhole(state.profile.AdFile1, "picture").ok());
    withoutFolder.Timer1_Tick();
    EXPECT_EQ(withoutFolder.controls().Picture4, state.profile.AdFile1) << "placed by an installation";
    EXPECT_EQ(site.urls.size(), 1) << "nothing is fetched then";
}

} // namespace
} // namespace lumora
