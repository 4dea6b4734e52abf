#include "DetailsPageTest.h"

#include "order/OrderFolder.h"
#include "order/OrderState.h"

#include <functional>
#include <optional>

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
    state.transfer.HazmanaP = 1;
    state.transfer.Mefurak = Travel::Pieces;
    page.Image1_Click(0);
    EXPECT_EQ(shown.stepShare, 0);
    EXPECT_EQ(state.Optint, OrderKind::Print);
    EXPECT_EQ(state.shemot.ser, u"1234");
    EXPECT_EQ(state.shemot.TimeOfJob, u"2026_11_21_KUP_1234^");
    EXPECT_EQ(state.transfer.HazmanaP, 0);
    EXPECT_EQ(state.transfer.Mefurak, Travel::Whole);
    EXPECT_TRUE(machine.files.folderExists(u"C:\\2000lumora\\zmany\\tempred"_path));

    page.Text2_Change(u" Dana Levi"_s);
    page.Text3_Change(u"03-1234567"_s);
    page.Check2_Click(true);
    page.Command12_Click();
    EXPECT_FALSE(shown.Option1[2].visible) << "the third quick size is empty";
    page.Option1_Click(1);
    EXPECT_EQ(shown.Combo1.text, u"13/18");
    page.Combo1_Click(4);
    EXPECT_FALSE(shown.Option1[1].checked);
    page.Option3_Click(0);
    EXPECT_FALSE(shown.Command6.visible);
    page.Image13_MouseDown(2);
    page.Command6_Click();
    EXPECT_EQ(shown.Choice.text, u"20/30 · מט · מסגרת BB1: לבנה, קו שחור דק");
    page.Command3_Click();
    EXPECT_EQ(chain.front(), &page) << "the terms were not agreed to";
    EXPECT_EQ(machine.dialogs.messages.size(), 1);

    // The folder of the counter is made before the pictures.
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\vedron"_path, "in the way").ok());
    page.Check1_Click(true);
    page.Command4Anglit_Click();
    EXPECT_EQ(shown.Choice.text, u"20/30 · Matte · Border BB1: white, thin black line");
    page.Command4Ivrit_Click(); // with all that was typed and chosen
    page.Command3_Click();
    EXPECT_EQ(page.step(), nnn::Step::Terms);
    EXPECT_TRUE(machine.dialogs.messages.last().contains(u"vedron"));
    ASSERT_TRUE(machine.files.removeFile(u"C:\\vedron"_path).ok());
    page.Command3_Click();
    ASSERT_EQ(chain.front()->id(), PageId::kyoskNew);
    EXPECT_EQ(chain.find(PageId::nnn), nullptr);
    const OrderDetails& details = state.shemot;
    EXPECT_EQ(QStringList({details.n1, details.ppr, details.maat, details.Bord, details.FillFit, state.MisparHazmana}),
              QStringList({"Dana Levi", "20/30", "מט", "BB1", "FIL", "100"}));
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
            page.Option5_Click();
            EXPECT_EQ(state.shemot.FillFit, u"FIL");
        }
        for (const nnn::Step back : {nnn::Step::Options, nnn::Step::Details, nnn::Step::Menu}) {
            while (page.step() > back)
                page.Command4_Click();
            EXPECT_EQ(page.step(), back);
        }
        chain.unload(PageId::nnn);
    }
}

TEST_F(nnnTest, ThePicturesLeadToWhatWasChosenAndBack) {
    for (const bool cancels : {false, true}) {
        LoadDefaultProfile(state, deployment);
        chain.show(PageId::kyoskNew);
        Page* pictures = chain.front();
        state.Optint = OrderKind::Print;
        OrderDetails& order = state.shemot;
        order.n1 = u"Dana Levi"_s;
        order.n2 = u"03-1"_s;
        order.FillFit = u"FIT"_s;
        order.Bord = u"WB"_s;
        order.ppr = u"20/30"_s;
        order.maat = u"Matte"_s;
        order.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
        state.MisparHazmana = u"123"_s;
        makeFolder(customerStore.folder());
        write(customerStore, "of the customer");
        ASSERT_TRUE(chain.follow(PageId::kyoskNew, Outcome::DetailsWanted));
        auto& page = static_cast<nnn&>(*chain.front());
        const nnnControls& shown = page.controls();
        EXPECT_EQ(page.step(), nnn::Step::Options);
        EXPECT_TRUE(shown.Combo1.text == u"20/30" && shown.Option3[0].checked && shown.Option4.checked);
        EXPECT_EQ(shown.Picture16, 9);
        page.Command4_Click();
        EXPECT_EQ(shown.Text2.text + shown.Text3.text, u"Dana Levi03-1");
        EXPECT_FALSE(shown.Command4.visible || shown.Check2.visible);
        page.Text3_Change(u"03-2"_s);
        page.Command12_Click();
        page.Option1_Click(0);
        page.Option3_Click(1);
        page.Image13_MouseDown(0);
        page.Command6_Click();
        EXPECT_EQ(shown.Check1.visible, page.step() != nnn::Step::Terms) << "the terms were agreed to";
        cancels ? page.Command2_Click() : page.Command3_Click();
        ASSERT_EQ(chain.front(), pictures);
        EXPECT_EQ(chain.find(PageId::nnn), nullptr);
        EXPECT_EQ(QStringList({order.n2, order.ppr, order.maat, order.Bord, order.TimeOfJob, state.MisparHazmana}),
                  QStringList({cancels ? "03-1" : "03-2", cancels ? "20/30" : "10/15", cancels ? "Matte" : "מבריק",
                               cancels ? "WB" : "NB", "2026_11_21_KUP_1234^", "123"}));
        EXPECT_EQ(read(customerStore), "of the customer");
        chain.unload(PageId::kyoskNew);
    }
}

TEST_F(nnnTest, ATileForgetsTheChoicesOfTheOrderBefore) {
    nnn& page = atTerms(0);
    const nnnControls& shown = page.controls();
    page.Check1_Click(true);
    page.Command2_Click();
    page.Image1_Click(6);
    EXPECT_EQ(page.step(), nnn::Step::Album);
    page.Image1_Click(0);
    EXPECT_EQ(state.Optint, OrderKind::Print);
    EXPECT_EQ(state.shemot.ppr + state.shemot.maat + state.shemot.Bord, u"******");
    EXPECT_FALSE(shown.Option1[0].checked || shown.Option3[1].checked || shown.Image13[9].checked ||
                 shown.Check1.checked || page.album().controls().Pic4Alboom.visible);
    EXPECT_EQ(shown.Text2.text, u"Dana Levi") << "what was typed stays";
    page.Command12_Click();
    page.Option3_Click(0);
    page.Image13_MouseDown(0);
    page.Command6_Click();
    page.Check1_Click(true);
    page.Command3_Click();
    EXPECT_EQ(page.step(), nnn::Step::Options) << "no size yet";
}

TEST_F(nnnTest, ChecksTheDetailsBeforeTheOptions) {
    for (const bool careful : {false, true}) {
        chain.unload(PageId::kyoskNew);
        deployment.Careful = careful;
        machine.dialogs.answers.clear();
        nnn& page = start();
        state.MishloachHabaita = true;
        page.Image1_Click(0);
        const std::pair<const char*, std::function<void()>> missing[] = {
            {"Text2", [&] { page.Text2_Change(u"Dana"_s); }}, {"Text4", [&] { page.Text4_Change(u"Haifa"_s); }}};
        for (const auto& [box, fill] : missing) {
            const int focused = page.focus().request;
            page.Command12_Click();
            EXPECT_EQ(page.focus().control, QLatin1String(box));
            EXPECT_GT(page.focus().request, focused);
            fill();
        }
        EXPECT_EQ(machine.dialogs.messages.size(), 2);
        page.Text3_Change(u"052-7654321-12"_s);
        page.Command12_Click();
        EXPECT_EQ(page.step(), state.Careful ? nnn::Step::Details : nnn::Step::Options);
        EXPECT_EQ(page.focus().control, state.Careful ? u"Text3"_s : u"Text4"_s);
        machine.dialogs.answers = {true};
        page.Command12_Click();
        EXPECT_EQ(page.step(), nnn::Step::Options);
        EXPECT_EQ(machine.files.fileExists(customerStore), !state.Careful);
        // The page's end forgets them, unless the customer asked to be remembered.
        page.Text3_Change(u"03-1"_s);
        ASSERT_TRUE(machine.files.writeWhole(customerStore, "of an earlier customer").ok());
        page.Option1_Click(0);
        page.Option3_Click(1);
        page.Image13_MouseDown(9);
        page.Command6_Click();
        page.Check1_Click(true);
        page.Command3_Click();
        EXPECT_FALSE(machine.files.fileExists(customerStore));
    }
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

    makeFolder(u"C:\\2000lumora\\!!000\\mana.txt"_s); // can't be written, which is told and holds nobody up
    page->Image1_Click(4);
    EXPECT_EQ(state.Optint, OrderKind::Mail);
    EXPECT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_EQ(chain.front()->id(), PageId::MoogMeret);
    EXPECT_EQ(chain.find(PageId::nnn), nullptr);
    chain.unload(PageId::MoogMeret);

    page = &start();
    page->Image1_Click(9);
    EXPECT_EQ(chain.find(PageId::nnn), nullptr);
    auto& plain = static_cast<Havharot&>(*chain.front());
    EXPECT_FALSE(plain.controls().Command2.visible);
    plain.Command1_Click();
    EXPECT_EQ(chain.front()->id(), PageId::hatchala) << "never a program without a page";

    page = &start();
    page->Image1_Click(7);
    EXPECT_EQ(state.Optint, OrderKind::Restart);
}

TEST_F(nnnTest, CleansTheHistoryOnceItIsAskedAndCarefullyKeepsWhatMayNotHaveArrived) {
    using Phase = OrderState::Phase;
    using Way = OrderState::Way;
    const DrivePath orders = u"C:\\2000lumora\\!!000"_path;
    const struct {
        QString number;
        std::optional<Phase> phase; // none: made by an earlier version
        Way way;
    } given[] = {{"101", {}, Way::Ftp},
                 {"102", Phase::Reported, Way::Ftp},
                 {"103", Phase::Sending, Way::Http},
                 {"104", Phase::Prepared, Way::Station},
                 {"105", Phase::Sending, Way::Mail},
                 {"106", Phase::Arrived, Way::Ftp}};
    const auto folderOf = [&](const QString& number) { return orders / (u"2026_11_20_KUP_1234^"_s + number); };
    const auto makeOrders = [&] {
        for (const auto& g : given) {
            const OrderFolder folder(folderOf(g.number));
            std::filesystem::remove_all(host(folder.path()));
            makeFolder(folder.path());
            for (const QString& name : {u"!1.jpp"_s, u"a.jpp"_s, u"b.JPP"_s, u"c.prk"_s, folder.name() + u".txt"_s})
                ASSERT_TRUE(machine.files.writeWhole(folder.filePath(name), "x"));
            OrderState order;
            order.phase = g.phase.value_or(Phase::Prepared);
            order.way = g.way;
            if (g.phase) {
                ASSERT_TRUE(WriteOrderState(machine.files, folder, order));
            }
        }
    };
    const auto left = [&] {
        QStringList numbers;
        for (const auto& g : given) {
            if (machine.files.fileExists(folderOf(g.number) / u"a.jpp"))
                numbers += g.number;
        }
        return numbers;
    };
    nnn& page = start();
    const nnnControls& shown = page.controls();
    const struct {
        bool careful;
        QList<bool> answers; // are the earlier ones marked as arrived; are those not proven cleaned too
        QStringList left;
    } cases[] = {{false, {false}, {}},
                 {true, {false, false}, {"101", "103", "104", "105"}},
                 {true, {true, false}, {"103", "104", "105"}},
                 {true, {false, true}, {}}};
    for (const auto& c : cases) {
        makeOrders();
        state.Careful = c.careful;
        machine.dialogs.answers = c.answers;
        machine.dialogs.messages.clear();
        page.Command14_Click();
        EXPECT_TRUE(shown.Frame1.visible && shown.Command7.visible);
        EXPECT_TRUE(shown.Frame1.text.endsWith(u"הזמנות שלא הוכח שהגיעו: 2; של התחנה: 1; שיצאו בדואר: 1."))
            << shown.Frame1.text.toStdString();
        page.Command7_Click();
        EXPECT_FALSE(shown.Frame1.visible);
        EXPECT_EQ(machine.dialogs.messages,
                  QStringList({"ניקיון ההיסטוריה הושלם\nמדובר על קבצים הקשורים לתוכנה זו בלבד"}));
        EXPECT_EQ(left(), c.left) << (&c - cases);
        EXPECT_TRUE(machine.dialogs.answers.isEmpty());
        EXPECT_EQ(machine.files.names(folderOf(u"102"_s), u"*"_s),
                  QStringList({"!1.jpp", "2026_11_20_KUP_1234^102.txt", "b.JPP", "c.prk"}))
            << "the print files go but for the first";
    }
    chain.unload(PageId::nnn);
    deployment.MinuyPaar = 2;
    EXPECT_FALSE(start().controls().Command14.visible) << "a lab without quick orders";
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
    for (const bool careful : {false, true}) {
        nnn& next = start();
        state.Careful = careful;
        next.Option1_Click(0);
        EXPECT_EQ(state.coupon.MisparKoopon, 220) << "a lab that takes coupons sells this one unless it says otherwise";
        next.Combo1_Click(4);
        EXPECT_EQ(machine.dialogs.messages.size(), careful ? 1 : 0);
        EXPECT_EQ(state.coupon.MisparKoopon, careful ? 0 : 220);
        next.Option1_Click(0);
        next.Image1_Click(0);
        EXPECT_EQ(state.coupon.MisparKoopon, careful ? 0 : 220) << "of an earlier customer";
    }
}

} // namespace
} // namespace lumora
