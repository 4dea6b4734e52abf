#include "Walk.h"

#include "entry/details/nnn.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/window/MainWindow.h"

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

TEST(LabSettings, TheClientLetterAndTheSwitchesDecideTheMenu) {
    const struct {
        const char* settings;
        QList<int> tiles; // of 0, 1, 2, 4, 6, 7, 9: those that are there
    } cases[] = {
        {"[Client]\nLetter = AS\n", {0, 1, 2, 4, 9}},
        {"[Switches]\nExtraTile = yes\nQuickOrder = no\n", {0, 2, 4, 6, 7}},
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
    } cases[] = {{"", true, false, "B7"}, {"[Switches]\nBorderPage = no\nFitPage = yes\n", false, true, "NB"}};
    for (const auto& c : cases) {
        Lab lab(QString::fromLatin1(c.settings));
        lab.toDetails();
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
    } cases[] = {{"", "30/45", true, true, false, 1},
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

} // namespace lumora
