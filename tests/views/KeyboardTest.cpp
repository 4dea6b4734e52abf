#include "Walk.h"

#include "entry/details/nnn.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "transfer/ftp/FtpFrm.h"
#include "views/window/MainWindow.h"
#include "views/window/ScreenDialogs.h"

#include <QApplication>
#include <QTest>
#include <QTimer>
#include <QWidget>

#include <gtest/gtest.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

void activate(Walk& walk) {
    walk.program().window().activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&walk.program().window()));
}

QString focusName() {
    return QApplication::focusWidget() ? QApplication::focusWidget()->objectName() : QString();
}

void key(Walk& walk, Qt::Key code) {
    QWidget* target = QApplication::focusWidget();
    QTest::keyClick(target ? target : static_cast<QWidget*>(&walk.program().window()), code);
    walk.settle();
}

void text(const QString& words) {
    QTest::keyClicks(QApplication::focusWidget(), words);
}

// Tab until the control has the keyboard; going round without finding it is a failure.
void tabTo(Walk& walk, const QString& name) {
    for (int i = 0; i < 80 && focusName() != name; ++i)
        key(walk, Qt::Key_Tab);
    ASSERT_EQ(focusName(), name);
}

void press(Walk& walk, const QString& name, Qt::Key code = Qt::Key_Return) {
    tabTo(walk, name);
    key(walk, code);
}

} // namespace

TEST(Keyboard, MakesAWholeOrderWithoutAMouse) {
    Walk walk({1024, 768});
    activate(walk);
    press(walk, u"Image1"_s, Qt::Key_Space);
    walk.waitFor(u"nnn"_s);
    press(walk, u"Image1(0)"_s);
    ASSERT_EQ(focusName(), u"Text2"_s) << "the first box has the keyboard";
    text(u"Dana Levi"_s);
    key(walk, Qt::Key_Tab);
    text(u"03-1234567"_s);
    key(walk, Qt::Key_Return); // the main action
    press(walk, u"Option1(0)"_s, Qt::Key_Space);
    press(walk, u"Option3(1)"_s);
    press(walk, u"Image13(9)"_s, Qt::Key_Space);
    press(walk, u"Command6"_s);
    press(walk, u"Check1"_s, Qt::Key_Space);
    press(walk, u"Command3"_s);
    walk.waitFor(u"kyoskNew"_s);

    // The picker runs an event loop of its own below the press.
    bool picked = false;
    QTimer::singleShot(300, &walk.program().window(), [&] {
        EXPECT_EQ(focusName(), u"pickerGrid"_s);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Right);
        picked = true;
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
    });
    press(walk, u"firstFolder"_s);
    ASSERT_TRUE(picked);
    walk.settle(300);
    auto& pictures = walk.page<kyoskNew>(PageId::kyoskNew);
    ASSERT_EQ(pictures.controls().List4.count(), 14);
    press(walk, u"Picture1(0)"_s, Qt::Key_Space);
    key(walk, Qt::Key_Down);
    key(walk, Qt::Key_Right);
    ASSERT_EQ(focusName(), u"Picture1(5)"_s);
    key(walk, Qt::Key_Return);
    key(walk, Qt::Key_Plus);
    EXPECT_EQ(pictures.controls().Label7.text.trimmed(), u"3"_s);
    EXPECT_EQ(pictures.controls().List1.count(), 2);
    press(walk, u"Image10"_s);
    ASSERT_TRUE(pictures.controls().Frame3.visible);
    key(walk, Qt::Key_Escape);
    EXPECT_FALSE(pictures.controls().Frame3.visible) << "Esc closes the panel";
    press(walk, u"Image7"_s);
    ASSERT_TRUE(pictures.controls().Frame4.visible);
    press(walk, u"Command7"_s);
    walk.waitFor(u"FtpFrm"_s);
    EXPECT_EQ(walk.program().state().shemot.n1, u"Dana Levi"_s);
    EXPECT_EQ(walk.program().state().shemot.Bord, u"WB"_s);
}

TEST(Keyboard, PutsAnAlbumTogetherWithoutAMouse) {
    Walk walk({1024, 768});
    activate(walk);
    walk.toMenu();
    press(walk, u"Image1(6)"_s);
    ASSERT_EQ(focusName(), u"Text1(0)"_s) << "the first box has the keyboard";
    text(u"Studio Or"_s);
    key(walk, Qt::Key_Return); // the main action
    ASSERT_EQ(focusName(), u"SoogAlb(0)"_s);
    key(walk, Qt::Key_Tab);
    key(walk, Qt::Key_Space);
    press(walk, u"Check4"_s, Qt::Key_Space);
    press(walk, u"Combo4Horim"_s, Qt::Key_Down);
    press(walk, u"Command16"_s);
    ASSERT_EQ(focusName(), u"Combo4Godel(0)"_s);
    press(walk, u"Combo4Godel(2)"_s, Qt::Key_Space);
    EXPECT_EQ(focusName(), u"Combo4Godel(2)"_s) << "a card that is taken keeps the keyboard";
    for (const auto& [next, card] : {std::pair{u"Command18"_s, u"Combo4Cricha(1)"_s},
                                     {u"Command19"_s, u"Combo4Niyar(0)"_s},
                                     {u"Command20"_s, u"Combo4Tosefet(3)"_s}}) {
        press(walk, next);
        press(walk, card);
    }
    press(walk, u"Check3(5)"_s, Qt::Key_Space);
    key(walk, Qt::Key_Escape);
    const AlbumPanels& album = walk.page<nnn>(PageId::nnn).album();
    EXPECT_EQ(album.panel(), AlbumPanels::Panel::Paper) << "Esc goes one panel back";
    press(walk, u"Command20"_s);
    press(walk, u"Command21"_s);
    ASSERT_EQ(focusName(), u"Check6"_s);
    key(walk, Qt::Key_Space);
    press(walk, u"Command22"_s);
    // The telephone is missing: its box is where the keyboard is once the message is read.
    EXPECT_EQ(walk.program().dialogs().shownTexts, QStringList{u"לא כתבתה מספר טלפון"_s});
    key(walk, Qt::Key_Return);
    EXPECT_EQ(focusName(), u"Text1(1)"_s);
    const AlbumDetails& details = walk.program().state().album;
    EXPECT_EQ(details.SoogLBM, u"אינדיגו  ספירלה");
    EXPECT_EQ(details.SoogHorim, u"20/40");
    EXPECT_EQ(details.GodelLBM, u"30/60");
    EXPECT_EQ(details.SoogKricha, u"קרם");
    EXPECT_EQ(details.SoogNiar, u"מבריק");
    EXPECT_EQ(details.Tosafot1[0], u"פרספקט");
    EXPECT_EQ(details.Tosafot2[5], u"פתיחה אנגלית=1");
}

TEST(Language, TurnsOverOnEachPageAndBack) {
    Walk walk({1024, 768});
    const auto flip = [&](PageId id) {
        auto& page = walk.page<Page>(id);
        for (const std::int16_t english : {1, 0}) {
            walk.program().state().EnglishTips = english;
            page.setTexts();
            Q_EMIT page.changed();
            walk.settle(60);
            const QWidget* view = walk.program().window().findChild<QWidget*>(pageName(id));
            EXPECT_EQ(view->layoutDirection(), english == 1 ? Qt::LeftToRight : Qt::RightToLeft)
                << qPrintable(pageName(id));
            // A slow machine lays the page out over several turns.
            QStringList faults = walk.faults();
            for (int turn = 0; turn < 500 && !faults.isEmpty(); ++turn) {
                walk.settle(60);
                faults = walk.faults();
            }
            for (const QString& fault : faults)
                ADD_FAILURE() << qPrintable(pageName(id)) << ": " << qPrintable(fault);
        }
    };
    flip(PageId::hatchala);
    walk.toDetails();
    flip(PageId::nnn);
    walk.toOptions();
    flip(PageId::nnn);
    // From here on the paper's kind is data, in the words in which it was chosen.
    walk.toBorder();
    walk.toTerms();
    walk.toPictures();
    walk.choosePictures();
    flip(PageId::kyoskNew);
    walk.toClosing();
    flip(PageId::kyoskNew);
}

TEST(Presses, FailOnWhatAPersonCouldNotPress) {
    Walk walk({1024, 768});
    const ControlFinder finder(walk.program().window());
    EXPECT_FALSE(finder.press(u"nnn"_s, u"Command12"_s).ok()) << "another page is in front";
    EXPECT_FALSE(finder.press(u"hatchala"_s, u"Picture8"_s).ok()) << "hidden";
    EXPECT_FALSE(finder.press(u"hatchala"_s, u"NoSuchControl"_s).ok());
    walk.program().dialogs().message(u"First"_s);
    walk.program().dialogs().message(u"Second"_s);
    walk.settle();
    const Result<void> covered = finder.press(u"hatchala"_s, u"Image11"_s);
    ASSERT_FALSE(covered.ok());
    EXPECT_TRUE(covered.failure().message.contains(u"covered"_s)) << qPrintable(covered.failure().message);
    EXPECT_EQ(walk.program().dialogs().frontText(), u"First"_s);
    walk.program().dialogs().closeMessages();
    walk.settle();
    EXPECT_TRUE(finder.press(u"hatchala"_s, u"Image1"_s).ok());
    EXPECT_EQ(walk.program().dialogs().shownTexts, (QStringList{u"First"_s, u"Second"_s}));
}

} // namespace lumora
