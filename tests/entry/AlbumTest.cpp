#include "DetailsPageTest.h"

#include <functional>

namespace lumora {
namespace {

using Panel = AlbumPanels::Panel;

constexpr int albumTile = 6;
const DrivePath photographerStore = u"C:\\2000lumora\\pratim2.txt"_path;

class AlbumTest : public DetailsPageTest {
protected:
    nnn& start() {
        nnn& page = DetailsPageTest::start();
        page.Image1_Click(albumTile);
        return page;
    }
    void fillPhotographer(AlbumPanels& album) {
        const char* const typed[] = {" Studio Or ", "03-7654321", "Noa's wedding", "studio"};
        for (int i = 0; i < 4; ++i)
            album.Text1_Change(i, QString::fromLatin1(typed[i]));
        album.Combo4Mail_Change(u"example.com"_s);
    }
    // A new album of which the kind alone is chosen.
    static void toTheLists(AlbumPanels& album) {
        album.begin();
        album.SoogAlb_Click(5);
        album.Command16_Click();
    }
    // All that an order needs, as far as the bill, with the terms ticked.
    nnn& atBill() {
        nnn& page = start();
        AlbumPanels& album = page.album();
        fillPhotographer(album);
        album.Command17_Click();
        album.SoogAlb_Click(5);
        album.Check4_Click(true);
        album.Command27_Click();
        album.Combo4Horim_Click(4);
        album.Command16_Click();
        album.Combo4Godel_Click(2);
        album.Command18_Click();
        album.Combo4Cricha_Click(0);
        album.Command19_Click();
        album.Combo4Niyar_Click(2);
        album.Command20_Click();
        album.Combo4Tosefet_Click(1);
        album.Check3_Click(2, true);
        album.Command21_Click();
        album.Check6_Click(true);
        return page;
    }
};

TEST_F(AlbumTest, AnAlbumGoesPanelByPanelToThePictures) {
    state.album.HearotLBM = u"of an album before"_s;
    nnn& page = atBill();
    page.Image1_Click(8);
    EXPECT_EQ(page.album().controls().Pic4BilLines.mid(4, 4), (QStringList{"Photo large", "Brown", "Silk", "Canvas"}));
    EXPECT_EQ(page.album().controls().Pic4BilExtras[2], u"Round corners=1");
    const AlbumDetails& order = state.album; // in Hebrew all the same
    EXPECT_EQ(QStringList({order.SoogLBM, order.SoogKricha, order.SoogNiar, order.Tosafot1[0], order.Tosafot2[2]}),
              QStringList({"פוטו גדול", "חום", "משי", "קנבס", "פינות עגולות=1"}));
    page.Command4Ivrit_Click();
    const AlbumControls& shown = page.album().controls();
    EXPECT_DOUBLE_EQ(page.controls().stepShare, 6.0 / 7);
    EXPECT_EQ(shown.Pic4BilLines, (QStringList{"Studio Or", "Noa's wedding", "03-7654321", "studio@example.com",
                                               "פוטו גדול", "חום", "משי", "קנבס", "30/60"}));
    EXPECT_EQ(shown.Pic4BilExtras, (QStringList{"עוד=0", "הטבעת שם בכריכה=0", "פינות עגולות=1", "מזוודה=0",
                                                "סובלימציה=0", "פתיחה אנגלית=0"}));
    EXPECT_EQ(shown.Pic4BilParents.mid(1, 2), (QStringList{"  אלבום הורים  2", "30/60=אלבום הורים"}));

    page.album().Command22_Click();
    ASSERT_EQ(chain.front()->id(), PageId::kyoskNew) << qPrintable(machine.dialogs.messages.join(u'\n'));
    EXPECT_EQ(chain.find(PageId::nnn), nullptr);
    EXPECT_TRUE(state.ModulRezef);
    EXPECT_EQ(state.Optint, OrderKind::Album);
    const OrderDetails& details = state.shemot;
    // The photographer stands in the album's own fields.
    EXPECT_EQ(QStringList({details.n1, details.ppr, details.maat, details.Bord, details.FillFit, details.TimeOfJob}),
              QStringList({"", "30/60", "M", "NB", "FFF", "2026_11_21_KUP_1234^"}));
    EXPECT_EQ(state.MisparHazmana, u"100");
    EXPECT_EQ(state.album.KamutHorim + state.album.SoogHorim + state.album.HearotLBM, u"230/60");
}

TEST_F(AlbumTest, ThePicturesLeadBackToTheAlbumAsItIs) {
    for (const bool cancels : {true, false}) {
        nnn& page = atBill();
        page.album().Command22_Click();
        const AlbumDetails before = state.album;
        ASSERT_TRUE(chain.follow(PageId::kyoskNew, Outcome::DetailsWanted));
        nnn& changed = static_cast<nnn&>(*chain.front());
        AlbumPanels& album = changed.album();
        EXPECT_EQ(album.panel(), Panel::Kind);
        changed.Command4_Click();
        EXPECT_FALSE(changed.controls().Command4.visible || album.controls().Check5.visible);
        album.Command17_Click();
        album.Command16_Click();
        for (const auto next : {&AlbumPanels::Command18_Click, &AlbumPanels::Command19_Click,
                                &AlbumPanels::Command20_Click, &AlbumPanels::Command21_Click})
            (album.*next)();
        EXPECT_FALSE(album.controls().Check6.visible) << "the terms were agreed to";
        EXPECT_EQ(before.SoogHorim + state.album.MailZalam + state.album.Tosafot2[2],
                  u"30/60studio@example.comפינות עגולות=1"_s);
        album.Combo4Godel_Click(5);
        album.Command21_Click();
        cancels ? changed.Command2_Click() : album.Command22_Click();
        ASSERT_EQ(chain.front()->id(), PageId::kyoskNew) << qPrintable(machine.dialogs.messages.join(u'\n'));
        EXPECT_EQ(chain.find(PageId::nnn), nullptr);
        EXPECT_EQ(state.album.GodelLBM + state.shemot.ppr, cancels ? "30/6030/60" : "40/8040/80");
        chain.unload(PageId::kyoskNew);
    }
}

TEST_F(AlbumTest, WhatIsMissingIsToldOnThePanelWhereItIsSetRight) {
    const struct {
        const char* what;
        std::function<void(AlbumPanels&)> takeAway;
        Panel panel;
        const char* focus;
    } cases[] = {
        {"name", [](AlbumPanels& a) { a.Text1_Change(0, u"  "_s); }, Panel::Photographer, "Text1(0)"},
        {"telephone", [](AlbumPanels& a) { a.Text1_Change(1, {}); }, Panel::Photographer, "Text1(1)"},
        {"event", [](AlbumPanels& a) { a.Text1_Change(2, {}); }, Panel::Photographer, "Text1(2)"},
        {"mail", [](AlbumPanels& a) { a.Text1_Change(3, {}); }, Panel::Photographer, "Text1(3)"},
        {"name and size", [](AlbumPanels& a) { toTheLists(a), a.Text1_Change(0, {}); }, Panel::Photographer,
         "Text1(0)"},
        {"kind", [](AlbumPanels& a) { a.begin(); }, Panel::Kind, "SoogAlb(0)"},
        {"size", &AlbumTest::toTheLists, Panel::Size, "Combo4Godel"},
        {"cover", [](AlbumPanels& a) { toTheLists(a), a.Combo4Godel_Click(0); }, Panel::Cover, "Combo4Cricha"},
        {"terms", [](AlbumPanels& a) { a.Check6_Click(false); }, Panel::Bill, "Text1(0)"},
    };
    for (const auto& c : cases) {
        nnn& page = atBill();
        c.takeAway(page.album());
        machine.dialogs.messages.clear();
        page.album().Command22_Click();
        EXPECT_EQ(machine.dialogs.messages.size(), 1) << c.what;
        ASSERT_EQ(chain.front(), &page) << c.what;
        EXPECT_EQ(page.album().panel(), c.panel) << c.what;
        EXPECT_EQ(page.focus().control, QLatin1String(c.focus)) << c.what;
        chain.unload(PageId::nnn);
    }
    // A list of papers or extras that was left untouched passes.
    AlbumPanels& album = atBill().album();
    toTheLists(album);
    album.Combo4Godel_Click(0);
    album.Combo4Cricha_Click(0);
    album.Check6_Click(true);
    album.Command22_Click();
    EXPECT_EQ(chain.front()->id(), PageId::kyoskNew);
    EXPECT_EQ(state.album.SoogNiar + state.album.Tosafot1[0], u"בחר סוג נייר");
}

TEST_F(AlbumTest, CarefullyEachPanelAsksForWhatItNeedsBeforeItIsLeft) {
    deployment.Careful = true;
    nnn& page = start();
    AlbumPanels& album = page.album();
    const struct {
        void (AlbumPanels::*leave)();
        std::function<void()> fill;
        Panel next;
    } panels[] = {
        {&AlbumPanels::Command17_Click, [&] { fillPhotographer(album); }, Panel::Kind},
        {&AlbumPanels::Command16_Click, [&] { album.SoogAlb_Click(5); }, Panel::Size},
        {&AlbumPanels::Command18_Click, [&] { album.Combo4Godel_Click(2); }, Panel::Cover},
        {&AlbumPanels::Command19_Click, [&] { album.Combo4Cricha_Click(0); }, Panel::Paper},
        {&AlbumPanels::Command20_Click, {}, Panel::Extras},
    };
    for (const auto& panel : panels) {
        const Panel before = album.panel();
        (album.*panel.leave)();
        EXPECT_EQ(album.panel(), panel.fill ? before : panel.next);
        if (panel.fill)
            panel.fill(), (album.*panel.leave)();
        EXPECT_EQ(album.panel(), panel.next);
    }
    EXPECT_EQ(machine.dialogs.messages.size(), 4);
}

TEST_F(AlbumTest, CopiesForTheParentsNeedAKindOfAlbumAndASize) {
    const struct {
        int kind; // -1 none
        bool copies;
        int size;          // -1 none
        const char* focus; // nothing: goes on
    } cases[] = {{-1, false, -1, nullptr},
                 {2, false, -1, nullptr},
                 {-1, true, -1, "SoogAlb(0)"},
                 {2, true, -1, "Combo4Horim"},
                 {2, true, 0, nullptr}};
    for (const auto& c : cases) {
        nnn& page = start();
        AlbumPanels& album = page.album();
        album.Command17_Click();
        if (c.kind >= 0)
            album.SoogAlb_Click(c.kind);
        if (c.copies)
            album.Check4_Click(true);
        album.Combo4Horim_Click(c.size);
        album.Command16_Click();
        EXPECT_EQ(album.panel(), c.focus ? Panel::Kind : Panel::Size);
        if (c.focus) {
            EXPECT_EQ(page.focus().control, QLatin1String(c.focus));
            album.Command26_Click(); // at no copies the way is free
            album.Command16_Click();
            EXPECT_EQ(album.panel(), Panel::Size);
        }
        chain.unload(PageId::nnn);
    }
}

TEST_F(AlbumTest, KindsAndCopiesFollowTheirButtons) {
    nnn& page = start();
    AlbumPanels& album = page.album();
    const AlbumControls& shown = album.controls();
    album.Command17_Click();
    album.SoogAlb_Click(1);
    EXPECT_EQ(shown.Label17.text, u"אינדיגו  ספירלה");
    album.Combo4Horim_Click(3);
    EXPECT_EQ(shown.Label36.text, u"30/40");
    album.SoogAlb_Click(4);
    EXPECT_EQ(shown.Combo4Horim.rows.count(), 10) << "each kind that is looked at adds its five";
    EXPECT_EQ(shown.Label36.text, u"");

    album.Check4_Click(true);
    for (const auto& [press, copies] :
         {std::pair(&AlbumPanels::Command27_Click, u"4"_s), std::pair(&AlbumPanels::Command26_Click, u"0"_s)}) {
        for (int i = 0; i < 5; ++i)
            (album.*press)();
        EXPECT_EQ(shown.Label32.text, copies);
    }

    // Each list keeps its prompt until a row is taken; passing a panel again loses nothing.
    album.Command16_Click();
    EXPECT_EQ(shown.Combo4Godel.text, u"בחר גודל אלבום");
    album.Combo4Godel_Click(5);
    album.Command18_Click();
    album.Combo4Cricha_Click(1);
    page.Command4_Click();
    EXPECT_EQ(album.panel(), Panel::Size);
    for (int i = 0; i < 2; ++i)
        page.Command4_Click();
    album.Command17_Click();
    EXPECT_TRUE(shown.SoogAlb[4].checked && shown.SoogAlb[4].shade == AlbumControls::blue);
    album.Command16_Click();
    EXPECT_EQ(page.controls().Choice.text, u"פוטו הורים · 40/80 · קרם");

    // The next album begins with nothing chosen.
    page.Command2_Click();
    EXPECT_EQ(page.step(), nnn::Step::Album) << "the customer does not want to cancel";
    machine.dialogs.answers = {true};
    page.Command2_Click();
    page.Image1_Click(albumTile);
    EXPECT_EQ(shown.Label17.text, u"***");
    EXPECT_EQ(shown.Combo4Horim.rows.count(), 0);
}

TEST_F(AlbumTest, ThePhotographerIsRememberedWhenAskedTo) {
    nnn& first = start();
    first.album().Command28_Click();
    EXPECT_EQ(machine.dialogs.messages, QStringList{u"לא נמצאו פרטים בזיכרון נא הקלד פרטים"_qs});
    EXPECT_EQ(first.focus().control, u"Text1(0)");
    fillPhotographer(first.album());
    first.album().Command17_Click();
    EXPECT_FALSE(machine.files.fileExists(photographerStore));
    first.Command4_Click();
    first.album().Check5_Click(true);
    first.album().Command17_Click();
    EXPECT_EQ(read(photographerStore), "0\r\n\" Studio Or \"\r\n\"03-7654321\"\r\n\"studio\"\r\n0\r\n");
    chain.unload(PageId::nnn);

    AlbumPanels& second = start().album();
    second.Text1_Change(2, u"Another event"_s);
    second.Command28_Click();
    const auto& boxes = second.controls().Text1;
    EXPECT_EQ(QStringList({boxes[0].text, boxes[1].text, boxes[2].text, boxes[3].text}),
              QStringList({" Studio Or ", "03-7654321", "Another event", "studio"}));
}

TEST_F(AlbumTest, TheAlbumsEndRulesWhetherTheCustomersDetailsStay) {
    const struct {
        bool careful, remember;
        QString name;
        const char* stored; // part of it
    } cases[] = {{false, true, "Dana", "Dana"},
                 {false, false, "Dana", nullptr},
                 {true, true, "Dana", "Dana"},
                 {true, false, "Dana", "earlier"},
                 {true, true, "", "earlier"}};
    for (const auto& c : cases) {
        nnn& page = atBill();
        state.Careful = c.careful;
        ASSERT_TRUE(machine.files.writeWhole(customerStore, "of an earlier customer").ok());
        page.Text2_Change(c.name);
        page.Check2_Click(c.remember);
        page.album().Command22_Click();
        const Result<QByteArray> stored = machine.files.read(customerStore);
        EXPECT_TRUE(c.stored ? stored && stored->contains(c.stored) : !stored) << (&c - cases);
        chain.unload(PageId::kyoskNew);
    }
}

TEST_F(AlbumTest, AsksForTheDomainAndForAShorterTelephone) {
    for (const bool careful : {false, true}) {
        AlbumPanels& album = start().album();
        state.Careful = careful;
        state.albumTail = AlbumTail::Photographer;
        fillPhotographer(album);
        album.begin();
        EXPECT_EQ(album.promptStands(), !careful) << "the domain stays with the boxes that stay";
        album.Combo4Mail_Change({});
        album.Text1_Change(1, u"052-7654321-12"_s);
        machine.dialogs.answers = {false, true};
        QStringList asked;
        for (int i = 0; i < 2; ++i) {
            album.Command17_Click();
            asked += static_cast<nnn&>(*chain.front()).focus().control;
        }
        EXPECT_EQ(asked, careful ? QStringList({"Text1(1)", "Combo4Mail"}) : QStringList({"Text1(0)", "Text1(0)"}));
        album.Text1_Change(3, u"studio@lab.example"_s);
        machine.dialogs.answers = {true};
        album.Command17_Click();
        EXPECT_EQ(album.panel(), Panel::Kind);
        album.Command23_Click();
        EXPECT_EQ(state.album.MailZalam, u"studio@lab.example") << "a whole address is taken as it is";
        chain.unload(PageId::nnn);
    }
}

} // namespace
} // namespace lumora
