#include "DetailsPageTest.h"

#include "common/DrivePath.h"
#include "session/Workspace.h"

namespace lumora {
namespace {

class nnnTest : public DetailsPageTest {
protected:
    // A print order as far as the terms.
    nnn& atTerms(int tile) {
        nnn& page = start();
        page.Image1_Click(tile);
        page.Text2_Change(u"Dana Levi"_s);
        page.Text3_Change(u"03-1234567"_s);
        page.Command12_Click();
        page.Option1_Click(0);
        page.Option3_Click(1);
        if (page.step() == nnn::Step::Border) {
            page.Image13_MouseDown(9);
            page.Command6_Click();
        }
        return page;
    }
};

TEST_F(nnnTest, APrintOrderGoesStepByStepToThePictures) {
    nnn& page = start();
    const nnnControls& shown = page.controls();
    EXPECT_EQ(state.shemot.Girsa, u"4.00");
    EXPECT_TRUE(shown.Image1[6].visible);
    EXPECT_FALSE(shown.Image1[3].visible);
    state.transfer.HazmanaP = 1;
    state.transfer.Mefurak = Travel::Pieces;
    page.Image1_Click(0);
    EXPECT_EQ(page.step(), nnn::Step::Details);
    EXPECT_FALSE(shown.Image1[0].visible);
    EXPECT_EQ(shown.StepLine.text, u"שלב 1 מתוך 4");
    EXPECT_EQ(state.Optint, OrderKind::Print);
    EXPECT_EQ(state.shemot.ser, u"1234");
    EXPECT_EQ(state.shemot.TimeOfJob, u"2026_11_21_KUP_1234^");
    EXPECT_EQ(state.transfer.HazmanaP, 0);
    EXPECT_EQ(state.transfer.Mefurak, Travel::Whole);
    EXPECT_TRUE(machine.files.folderExists(u"C:\\2000lumora\\zmany\\tempred"_path));
    EXPECT_FALSE(machine.files.folderExists(u"C:\\vedron"_path)) << "made before the pictures";

    page.Text2_Change(u" Dana Levi"_s);
    page.Text3_Change(u"03-1234567"_s);
    page.Check2_Click(true);
    page.Command12_Click();
    EXPECT_EQ(page.step(), nnn::Step::Options);
    EXPECT_FALSE(shown.Option1[2].visible) << "the third quick size is empty";
    page.Option1_Click(1);
    EXPECT_EQ(shown.Combo1.text, u"13/18");
    page.Combo1_Click(4);
    EXPECT_EQ(state.shemot.ppr, u"20/30");
    EXPECT_FALSE(shown.Option1[1].checked);
    page.Option3_Click(0);
    EXPECT_EQ(page.step(), nnn::Step::Border);
    EXPECT_FALSE(shown.Command6.visible);
    page.Image13_MouseDown(2);
    EXPECT_TRUE(shown.Command6.visible);
    page.Command6_Click();
    EXPECT_EQ(page.step(), nnn::Step::Terms);
    EXPECT_EQ(state.shemot.FillFit, u"FIL");
    EXPECT_EQ(shown.Choice.text, u"20/30 · מט · מסגרת BB1");

    page.Command3_Click();
    EXPECT_EQ(chain.front(), &page);
    EXPECT_TRUE(machine.dialogs.messages.value(0).contains(u"מסכים לתנאי שימוש"));
    page.Check1_Click(true);
    page.Command3_Click();
    ASSERT_EQ(chain.front()->id(), PageId::kyoskNew);
    EXPECT_EQ(chain.find(PageId::nnn), nullptr);
    EXPECT_EQ(state.shemot.n1, u"Dana Levi");
    EXPECT_EQ(state.shemot.Bord, u"BB1");
    EXPECT_EQ(state.shemot.maat, u"מט");
    EXPECT_EQ(state.MisparHazmana, u"100");
    EXPECT_TRUE(machine.files.folderExists(u"C:\\vedron"_path));
    EXPECT_TRUE(machine.files.fileExists(u"C:\\2000lumora\\!!000\\mana.txt"_path));
    EXPECT_TRUE(machine.files.fileExists(customerStore));
}

TEST_F(nnnTest, AsksForBorderAndFitByKindOfOrderAndSwitches) {
    const struct {
        int tile;
        int gvulMuzag;
        bool fitMuzag;
        QList<nnn::Step> steps; // behind the paper kind
        QString bord;
    } cases[] = {
        {0, 1, false, {nnn::Step::Border, nnn::Step::Terms}, "WB"},
        {0, 1, true, {nnn::Step::Border, nnn::Step::Fit}, "WB"},
        {0, 0, true, {nnn::Step::Fit}, "NB"},
        {2, 0, false, {nnn::Step::Terms}, "NB"},
        {1, 1, true, {nnn::Step::Terms}, "NB"},
    };
    for (const auto& c : cases) {
        deployment.GvulMuzag = static_cast<std::int16_t>(c.gvulMuzag);
        deployment.FitMuzag = c.fitMuzag;
        nnn& page = start();
        page.Image1_Click(c.tile);
        EXPECT_EQ(state.ModulRezef, c.tile == 2);
        page.Text2_Change(u"Dana"_s);
        page.Command12_Click();
        page.Option1_Click(0);
        page.Option3_Click(1);
        QList<nnn::Step> steps = {page.step()};
        if (page.step() == nnn::Step::Border) {
            page.Image13_MouseDown(9);
            page.Command6_Click();
            steps += page.step();
        }
        EXPECT_EQ(steps, c.steps) << c.tile << c.gvulMuzag << c.fitMuzag;
        EXPECT_EQ(state.shemot.Bord, c.bord);
        if (page.step() == nnn::Step::Fit) {
            page.Option4_Click();
            EXPECT_EQ(state.shemot.FillFit, u"FIT");
            page.Command4_Click();
            EXPECT_EQ(page.step(), nnn::Step::Fit);
            page.Option5_Click();
            EXPECT_EQ(state.shemot.FillFit, u"FIL");
        }
        QList<nnn::Step> back;
        while (page.step() != nnn::Step::Menu) {
            page.Command4_Click();
            back.prepend(page.step());
        }
        EXPECT_EQ(back.mid(0, 3), QList({nnn::Step::Menu, nnn::Step::Details, nnn::Step::Options}));
        chain.unload(PageId::nnn);
    }
}

TEST_F(nnnTest, ATileForgetsTheChoicesOfTheOrderBefore) {
    nnn& page = atTerms(0);
    const nnnControls& shown = page.controls();
    page.Check1_Click(true);
    page.Command2_Click();
    EXPECT_EQ(page.step(), nnn::Step::Menu);
    page.Image1_Click(6);
    EXPECT_EQ(state.Optint, OrderKind::Album);
    EXPECT_EQ(page.step(), nnn::Step::Album);
    page.Image1_Click(0);
    EXPECT_FALSE(page.album().controls().Pic4Alboom.visible);
    EXPECT_EQ(state.Optint, OrderKind::Print);
    EXPECT_TRUE(state.shemot.Bord.isEmpty());
    EXPECT_EQ(state.shemot.ppr + state.shemot.maat, u"******");
    EXPECT_FALSE(shown.Option1[0].checked || shown.Option3[1].checked || shown.Image13[9].checked ||
                 shown.Check1.checked);
    EXPECT_EQ(shown.Combo1.text, u"גדלים נוספים");
    EXPECT_EQ(shown.Text2.text, u"Dana Levi") << "what was typed stays";
    page.Command12_Click();
    page.Option3_Click(0);
    page.Image13_MouseDown(0);
    page.Command6_Click();
    page.Check1_Click(true);
    page.Command3_Click();
    EXPECT_EQ(machine.dialogs.messages.last(), u"לא בחרת גודל נייר");
    EXPECT_EQ(page.step(), nnn::Step::Options);
    EXPECT_TRUE(shown.Command8.visible);
    EXPECT_FALSE(shown.Command8.enabled) << "no size yet";
    page.Option1_Click(0);
    EXPECT_TRUE(shown.Command8.enabled);
    page.Command8_Click();
    EXPECT_EQ(page.step(), nnn::Step::Border);
}

TEST_F(nnnTest, ChecksTheDetailsBeforeTheOptions) {
    nnn& page = start();
    state.MishloachHabaita = true;
    page.Image1_Click(0);
    EXPECT_TRUE(page.controls().Text4.visible);
    page.Command12_Click();
    EXPECT_EQ(machine.dialogs.messages.last(), u"נא להקליד שם ושם שפחה");
    EXPECT_EQ(page.focus().control, u"Text2");
    page.Text2_Change(u"Dana"_s);
    const int focused = page.focus().request;
    page.Command12_Click();
    EXPECT_EQ(machine.dialogs.messages.last(), u"בקשת שנשלח את התמונות עד הבית\nנא להקליד כתובת דואר");
    EXPECT_EQ(page.focus().control, u"Text4");
    EXPECT_GT(page.focus().request, focused);
    page.Text4_Change(u"Haifa"_s);
    page.Command12_Click();
    EXPECT_EQ(page.step(), nnn::Step::Options);
    EXPECT_TRUE(machine.files.fileExists(customerStore));
}

TEST_F(nnnTest, TakesTheDetailsFromMemory) {
    nnn& page = start();
    const nnnControls& shown = page.controls();
    page.Image1_Click(0);
    page.Command10_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList({"לא נמצאו פרטים בזיכרון נא הקלד פרטים"}));
    EXPECT_EQ(page.step(), nnn::Step::Details);
    ASSERT_TRUE(machine.files.writeWhole(customerStore, "0\r\n\"Dana\"\r\n\"03-1\"\r\n0\r\n0\r\n").ok());
    page.Command10_Click();
    EXPECT_EQ(shown.Text2.text + shown.Text3.text, u"Dana03-1");
    EXPECT_EQ(page.step(), nnn::Step::Options);
    EXPECT_FALSE(shown.Command12.enabled);
    page.Command4_Click();
    EXPECT_TRUE(shown.Command12.enabled);
    page.Command10_Click();
    page.Text2_Change(u"Dan"_s);
    EXPECT_TRUE(shown.Command12.enabled);
}

TEST_F(nnnTest, ForgetsTheDetailsOfACustomerWhoDidNotAskToBeRemembered) {
    nnn& page = atTerms(1);
    EXPECT_TRUE(machine.files.fileExists(customerStore));
    page.Check1_Click(true);
    page.Command3_Click();
    EXPECT_EQ(chain.front()->id(), PageId::kyoskNew) << "the quick order goes to the pictures too";
    EXPECT_EQ(state.Optint, OrderKind::EditedPrint);
    EXPECT_FALSE(machine.files.fileExists(customerStore));
}

TEST_F(nnnTest, StaysWithAReasonWhenTheWorkspaceCannotBeMade) {
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\2000lumora"_path, "in the way").ok());
    nnn& page = start();
    page.Image1_Click(0);
    EXPECT_EQ(page.step(), nnn::Step::Menu);
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages[0].contains(u"2000lumora"));
}

TEST_F(nnnTest, StaysWithAReasonWhenTheCounterFolderCannotBeMade) {
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\vedron"_path, "in the way").ok());
    nnn& page = atTerms(0);
    page.Check1_Click(true);
    page.Command3_Click();
    EXPECT_EQ(chain.front(), &page);
    EXPECT_EQ(page.step(), nnn::Step::Terms);
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages[0].contains(u"vedron"));
    ASSERT_TRUE(machine.files.removeFile(u"C:\\vedron"_path).ok());
    page.Command3_Click();
    EXPECT_EQ(chain.front()->id(), PageId::kyoskNew);
}

TEST_F(nnnTest, TheOtherTilesDoWhatTheySay) {
    nnn* page = &start();
    machine.volume.fails = true;
    page->Image1_Click(3);
    EXPECT_EQ(machine.dialogs.messages, QStringList({"Error getting volume information."}));
    EXPECT_EQ(page->step(), nnn::Step::Menu);
    EXPECT_EQ(state.Optint, OrderKind::NotChosen);
    EXPECT_EQ(state.shemot.TimeOfJob, u"2026_11_21_KUP_^");
    machine.volume.fails = false;
    machine.dialogs.messages.clear();

    page->Image1_Click(8);
    EXPECT_EQ(page->controls().Command10.text, u"Details from memory");
    EXPECT_EQ(page->controls().Combo1.text, u"More Sizes");
    page->Image1_Click(4);
    EXPECT_EQ(state.Optint, OrderKind::Mail);
    EXPECT_TRUE(machine.files.fileExists(u"C:\\2000lumora\\!!000\\mana.txt"_path));
    EXPECT_EQ(chain.front()->id(), PageId::MoogMeret);
    EXPECT_EQ(chain.find(PageId::nnn), nullptr);
    chain.unload(PageId::MoogMeret);

    page = &start();
    page->Image1_Click(9);
    ASSERT_EQ(chain.front()->id(), PageId::Havharot);
    EXPECT_EQ(chain.find(PageId::nnn), nullptr);
    auto& plain = static_cast<Havharot&>(*chain.front());
    EXPECT_FALSE(plain.controls().Command2.visible);
    plain.Command3_Click();
    EXPECT_EQ(machine.shell.webPages, QStringList({"mailto:"}));
    plain.Command1_Click();
    EXPECT_EQ(chain.front()->id(), PageId::hatchala) << "never a program without a page";

    page = &start();
    page->Image1_Click(7);
    EXPECT_EQ(state.Optint, OrderKind::Restart);
    EXPECT_EQ(chain.front()->id(), PageId::hatchala);
    page = &start();
    page->Image1_Click(5);
    EXPECT_TRUE(chain.hasEnded());
}

TEST_F(nnnTest, CleansTheHistoryOnceItIsAsked) {
    nnn& page = start();
    const nnnControls& shown = page.controls();
    page.Image1_Click(0);
    page.Command2_Click();
    const DrivePath order = u"C:\\2000lumora\\!!000\\order"_path;
    ASSERT_TRUE(machine.files.makeFolder(u"C:\\2000lumora\\!!000"_path).ok());
    ASSERT_TRUE(machine.files.makeFolder(order).ok());
    for (const char* name : {"!1.jpp", "a.jpp", "order.txt"})
        ASSERT_TRUE(machine.files.writeWhole(order / QString::fromLatin1(name), "x").ok());
    page.Command14_Click();
    EXPECT_TRUE(shown.Frame1.visible && shown.Command7.visible);
    page.Command7_Click();
    EXPECT_FALSE(shown.Frame1.visible);
    EXPECT_EQ(machine.dialogs.messages, QStringList({"ניקיון ההיסטוריה הושלם\nמדובר על קבצים הקשורים לתוכנה זו בלבד"}));
    EXPECT_EQ(machine.files.names(order, u"*"_s), QStringList({"!1.jpp", "order.txt"}));
}

TEST_F(nnnTest, ACouponSetsTheLimitOfTheSizeThatIsTaken) {
    nnn& page = start();
    page.Image1_Click(0);
    page.Option1_Click(0);
    EXPECT_FALSE(page.controls().Label4kpn.visible);
    page.CouponOrder(nnn::Coupon::Large);
    page.Option1_Click(1);
    EXPECT_EQ(state.coupon.MisparKoopon, 5);
    EXPECT_EQ(state.shemot.ppr, u"20/30");
    page.Option1_Click(0);
    EXPECT_EQ(page.controls().Label4kpn.text, u"350");
    page.Combo1_Click(4);
    EXPECT_EQ(state.coupon.MisparKoopon, 350) << "the list of all sizes sets no limit";
    chain.unload(PageId::nnn);
    deployment.HaKoopon = 1;
    start().Option1_Click(0);
    EXPECT_EQ(state.coupon.MisparKoopon, 220) << "a lab that takes coupons sells this one unless it says otherwise";
}

TEST_F(nnnTest, TheQuickCheckNeedsANameAlone) {
    nnn& page = start();
    page.Image1_Click(1);
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\2000lumora\\pratim3.txt"_path, "0\r\n").ok());
    page.QuickCheck();
    EXPECT_EQ(machine.dialogs.messages, QStringList({"אחד או יותר מהפרטים חסרים בדוק שוב בבקשה"}));
    page.Text2_Change(u" Dana "_s);
    page.QuickCheck();
    EXPECT_EQ(chain.front()->id(), PageId::kyoskNew);
    EXPECT_EQ(state.shemot.n1 + state.shemot.n2, u"DanaDana");
    EXPECT_EQ(state.shemot.ppr + state.shemot.maat + state.shemot.Bord + state.shemot.FillFit, u"10/15מבריקNBFIT");
    EXPECT_FALSE(machine.files.fileExists(u"C:\\2000lumora\\pratim3.txt"_path));
}

} // namespace
} // namespace lumora
