#include "Walk.h"

#include "entry/nnn.h"
#include "selection/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/hatchala.h"
#include "views/MainWindow.h"
#include "views/ScreenDialogs.h"

#include <QTest>

#include <gtest/gtest.h>

// What the lab's file says, and what a customer then meets: each setting is read from a lab.ini by the program itself.

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

class Lab : public Walk {
public:
    explicit Lab(const QString& settings)
        : Walk({1024, 768}, settings) {}

    ControlFinder finder() { return ControlFinder(program().window()); }
    QString text(const QString& page, const QString& control) {
        const Result<QString> found = finder().text(page, control);
        return found ? *found : u"? "_s + found.failure().message;
    }
    void toMenu() {
        press(u"hatchala"_s, u"Image1"_s);
        waitFor(u"nnn"_s);
    }
    // The first kind of order, up to the choice of the paper's kind; a border and a fit are passed where they are
    // asked.
    void toTermsOf(const QString& paper) {
        toMenu();
        press(u"nnn"_s, u"Image1(0)"_s);
        toOptions();
        EXPECT_TRUE(finder().choose(u"nnn"_s, u"Combo1"_s, paper).ok());
        press(u"nnn"_s, u"Option3(1)"_s);
        toTerms();
    }
    // With three pictures in the basket, the finish pressed.
    void toFinish(const QString& paper) {
        toTermsOf(paper);
        toPictures();
        choosePictures();
        toClosing();
    }
};

} // namespace

TEST(LabSettings, ThePhoneTheMailAndTheSiteStandOnTheStartPage) {
    Lab lab(u"[Addresses]\nSite = http://prints.example.org/\n"_s);
    EXPECT_EQ(lab.text(u"hatchala"_s, u"Label4Tel"_s), u"03-1234567"_s);
    EXPECT_EQ(lab.text(u"hatchala"_s, u"Label1"_s), u"lab@example.com"_s);
    EXPECT_EQ(lab.text(u"hatchala"_s, u"Image8"_s), u"prints.example.org"_s);
    EXPECT_FALSE(lab.pressable(u"hatchala"_s, u"Picture1"_s));
    lab.toMenu();
    EXPECT_EQ(lab.program().state().KodMishloach, u"KUP"_s);
}

TEST(LabSettings, TheDeliveryQuestionOffersTheShopsAndTheirCodeReachesTheOrder) {
    const struct {
        int row;
        const char* shown;
        const char* code;
        const char* phone;
    } cases[] = {{0, "* North", "_SOK_", "04-1"}, {1, "* South", "_OSK_", "08-2"}};
    for (const auto& c : cases) {
        Lab lab(u"[Switches]\nDeliveryQuestion = yes\n"
                "[Shops]\nShop1 = North\nShop1Phone = 04-1\nShop2 = South\nShop2Phone = 08-2\n"_s);
        lab.press(u"hatchala"_s, u"Image1"_s);
        auto& page = lab.page<hatchala>(PageId::hatchala);
        ASSERT_TRUE(QTest::qWaitFor([&] { return page.Picture1.visible && !page.Timer3.running(); }, 5000));
        ASSERT_EQ(page.List1.item(c.row), QString::fromLatin1(c.shown));
        ASSERT_TRUE(lab.finder().choose(u"hatchala"_s, u"List1"_s, QString::fromLatin1(c.shown)).ok());
        lab.waitFor(u"nnn"_s);
        EXPECT_EQ(lab.program().state().profile.LabPhone, QString::fromLatin1(c.phone));
        lab.press(u"nnn"_s, u"Image1(0)"_s);
        EXPECT_TRUE(lab.program().state().shemot.TimeOfJob.contains(QString::fromLatin1(c.code)))
            << qPrintable(lab.program().state().shemot.TimeOfJob);
    }
}

TEST(LabSettings, TheClientLetterAndTheSwitchesDecideTheMenu) {
    const struct {
        const char* settings;
        QList<int> tiles; // of 0, 1, 2, 4, 6, 7, 9: those that are there
    } cases[] = {
        {"", {0, 1, 2, 4, 6}},
        {"[Client]\nLetter = B\n", {0, 2, 4}},
        {"[Client]\nLetter = C\n", {0, 2, 4}},
        {"[Client]\nLetter = D\n", {0, 2}},
        {"[Client]\nLetter = CL\n", {0, 2, 4, 6}},
        {"[Client]\nLetter = AS\n", {0, 1, 2, 4, 9}},
        {"[Client]\nLetter = ALL\n", {0, 1, 2, 4}},
        {"[Switches]\nExtraTile = yes\n", {0, 1, 2, 4, 6, 7}},
        {"[Switches]\nQuickOrder = no\n", {0, 2, 4, 6}},
    };
    for (const auto& c : cases) {
        Lab lab(QString::fromLatin1(c.settings));
        lab.toMenu();
        QList<int> there;
        for (const int tile : {0, 1, 2, 4, 6, 7, 9}) {
            if (lab.pressable(u"nnn"_s, u"Image1(%1)"_s.arg(tile)))
                there += tile;
        }
        EXPECT_EQ(there, c.tiles) << c.settings;
        EXPECT_EQ(lab.pressable(u"nnn"_s, u"Command14"_s), !QByteArray(c.settings).contains("QuickOrder = no"));
    }
}

TEST(LabSettings, TheBorderAndTheFitAreAskedForWhereTheLabWantsThem) {
    const struct {
        const char* settings;
        bool border, fit;
        const char* bord;
    } cases[] = {{"", true, false, "B7"},
                 {"[Switches]\nBorderPage = no\n", false, false, "NB"},
                 {"[Switches]\nFitPage = yes\n", true, true, "B7"},
                 {"[Switches]\nBorderPage = no\nFitPage = yes\n", false, true, "NB"}};
    for (const auto& c : cases) {
        Lab lab(QString::fromLatin1(c.settings));
        lab.toDetails(false);
        lab.toOptions();
        lab.toBorder();
        EXPECT_EQ(lab.pressable(u"nnn"_s, u"Image13(1)"_s), c.border) << c.settings;
        if (c.border) {
            lab.press(u"nnn"_s, u"Image13(1)"_s);
            lab.press(u"nnn"_s, u"Command6"_s);
        }
        EXPECT_EQ(lab.pressable(u"nnn"_s, u"Option4"_s), c.fit) << c.settings;
        if (c.fit)
            lab.press(u"nnn"_s, u"Option4"_s);
        EXPECT_TRUE(lab.pressable(u"nnn"_s, u"Check1"_s)) << "the terms";
        EXPECT_EQ(lab.program().state().shemot.Bord, QString::fromLatin1(c.bord));
        EXPECT_EQ(lab.program().state().shemot.FillFit, c.fit ? u"FIT"_s : u"FIL"_s);
    }
}

TEST(LabSettings, TheClosingPanelAsksForWhatTheLabWants) {
    const struct {
        const char* settings;
        const char* paper;
        bool address, required, deeper;
        int deep;
    } cases[] = {{"", "10/15", true, true, false, 0},
                 {"", "30/45", true, true, false, 1},
                 {"[Switches]\nOptionalMail = yes\nDeepCompression = ask\n", "30/45", true, false, true, 0},
                 {"[Switches]\nLocalStation = yes\nDeepCompression = ask\n", "20/30", false, false, false, 0}};
    for (const auto& c : cases) {
        Lab lab(QString::fromLatin1(c.settings));
        lab.toFinish(QString::fromLatin1(c.paper));
        const QString pictures = u"kyoskNew"_s;
        EXPECT_EQ(lab.pressable(pictures, u"Command21"_s), c.deeper) << c.settings;
        EXPECT_EQ(lab.program().state().DchisaAmoka, c.deep) << c.settings << c.paper;
        if (c.deeper)
            lab.press(pictures, u"Command20"_s);
        EXPECT_EQ(lab.pressable(pictures, u"Text1"_s), c.address) << c.settings;
        EXPECT_EQ(lab.pressable(pictures, u"Label33"_s), c.required) << c.settings;
        EXPECT_EQ(lab.pressable(pictures, u"Command8"_s), c.address) << c.settings;
        EXPECT_TRUE(lab.pressable(pictures, u"Command7"_s));
        EXPECT_EQ(lab.text(pictures, u"Command7"_s), c.address ? u"המשך ללא כתובת דואר"_s : u"המשך"_s);
        if (!c.address) {
            // The order stays here, and the customer learns its number.
            lab.press(pictures, u"Command7"_s);
            lab.waitFor(u"hatchala"_s);
            EXPECT_TRUE(lab.text(u"hatchala"_s, u"Notice"_s).contains(u"100"_s));
        }
    }
}

TEST(LabSettings, ACouponIsCheckedAndFetchedAtABranchOfTheLab) {
    Lab lab(u"[Switches]\nCoupon = yes\n[Paper]\nQuickSizes = 10/15, 20/30\n"
            "[Branches]\nBranch1 = Haifa\nBranch1Name = Haifa Carmel\nBranch1Address1 = Herzl 5\n"
            "Branch1Phone = 04-5\nBranch10 = Eilat\n"_s);
    lab.toMenu();
    lab.press(u"nnn"_s, u"Image1(0)"_s);
    lab.toOptions();
    lab.press(u"nnn"_s, u"Option1(1)"_s);
    EXPECT_EQ(lab.text(u"nnn"_s, u"Label4kpn"_s), u"3"_s);
    lab.press(u"nnn"_s, u"Option3(1)"_s);
    lab.toTerms();
    lab.toPictures();
    lab.choosePictures(); // three, one of them twice
    const QString pictures = u"kyoskNew"_s;
    lab.toClosing();
    EXPECT_TRUE(lab.program().dialogs().frontText().startsWith(u"חרגת"_s));
    EXPECT_FALSE(lab.pressable(pictures, u"Pic4snifim"_s));
    lab.program().dialogs().closeMessages();
    lab.settle();
    EXPECT_EQ(lab.text(pictures, u"Label7"_s), u"4"_s);
    lab.press(pictures, u"Command13(1)"_s);
    lab.toClosing();
    EXPECT_TRUE(lab.pressable(pictures, u"Pic4snifim"_s));
    QStringList offered;
    for (int i = 0; i < 11; ++i) {
        if (lab.pressable(pictures, u"Command4Snif(%1)"_s.arg(i)))
            offered += lab.text(pictures, u"Command4Snif(%1)"_s.arg(i));
    }
    EXPECT_EQ(offered, QStringList({u"Haifa"_s, u"Eilat"_s, u"משלוח לבית"_s}));
    lab.page<kyoskNew>(PageId::kyoskNew).Command4Snif_MouseMove(0);
    EXPECT_EQ(lab.text(pictures, u"Label41"_s), u"Haifa Carmel\nHerzl 5\n04-5"_s);
    lab.press(pictures, u"Command4Snif(0)"_s);
    EXPECT_TRUE(lab.pressable(pictures, u"Label4kpn3"_s));
    EXPECT_EQ(lab.text(pictures, u"Label4kpn3"_s), u"3"_s);
    lab.type(pictures, u"Text2"_s, u"gift"_s);
    lab.press(pictures, u"Command7"_s);
    EXPECT_EQ(lab.program().state().shemot.Hearot, u"gift - Haifa"_s);
}

} // namespace lumora
