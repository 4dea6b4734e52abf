#include "PageLook.h"

#include "editing/editor/tFrmNew.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"

#include <QApplication>
#include <QTest>
#include <QWidget>

#include <gtest/gtest.h>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

class EditorLook : public PageLook {};

} // namespace

TEST_P(EditorLook, ShowsEachToolWholeAndInReach) {
    Walk walk(GetParam());
    walk.toEditor();
    look(walk, u"30-editor"_s);
    const QString editor = u"tFrmNew"_s;
    // What a customer sees is in reach, and what doubles it or is the operator's is not in the way.
    for (const char* name :
         {"Image2(0)",  "Image2(1)", "Image2(3)", "Image2(4)",   "Image2(5)",   "Image2(6)", "Image2(7)", "Image2(8)",
          "Image2(10)", "Image115",  "Image125",  "Image135",    "Image145",    "Image13",   "Image15",   "Image20",
          "Image21",    "Image22",   "Image28",   "Image29",     "Command8",    "Combo4",    "Combo2",    "Misgerett",
          "PicPic",     "Strip(1)",  "Strip(11)", "CommandDone", "Frame4Opener"}) {
        const auto* widget = walk.program().window().frontView()->findChild<QWidget*>(QString::fromLatin1(name));
        ASSERT_TRUE(widget) << name;
        EXPECT_EQ(ControlFinder::whyNotPressable(*widget), QString()) << name;
    }
    for (const char* name : {"Command24", "Command10", "Label13", "Command14", "VScrollZ", "Image16", "Image4"})
        EXPECT_FALSE(walk.pressable(editor, QString::fromLatin1(name))) << name;

    walk.press(editor, u"Frame4Opener"_s);
    look(walk, u"31-turn"_s);
    walk.press(editor, u"Image16"_s);
    walk.press(editor, u"Image13"_s);
    look(walk, u"32-tones"_s);
    walk.press(editor, u"Image11"_s);
    EXPECT_FALSE(walk.pressable(editor, u"Frame3"_s)) << "a tone closes the panel";
    walk.press(editor, u"Image20"_s);
    walk.press(editor, u"Image20"_s);
    walk.press(editor, u"Image20"_s);
    look(walk, u"33-frame"_s);
    walk.press(editor, u"Image29"_s);
    look(walk, u"34-hints"_s);
    walk.press(editor, u"hintsClose"_s);
    // The caption's keyboard lies below the picture, which stays whole and can be dragged.
    walk.press(editor, u"Command8"_s);
    walk.waitFor(u"mikledet"_s);
    look(walk, u"37-caption"_s);
    const auto* paper = walk.program().window().findChild<QWidget*>(u"PicPic"_s);
    EXPECT_EQ(paper->visibleRegion().boundingRect(), paper->rect());
    EXPECT_LT(paper->mapTo(&walk.program().window(), QPoint(0, paper->height())).y(),
              walk.program().window().frontView()->y());
    walk.program().chain().show(PageId::tFrmNew);
    walk.settle(80);
    EXPECT_TRUE(walk.pressable(editor, u"Image2(0)"_s));
    walk.press(editor, u"Strip(3)"_s);
    walk.settle(300);
    look(walk, u"35-other-picture"_s);
    EXPECT_EQ(walk.page<kyoskNew>(PageId::kyoskNew).controls().List1.count(), 2);
    walk.press(editor, u"CommandDone"_s);
    walk.waitFor(u"kyoskNew"_s);
    look(walk, u"36-pictures-edited"_s);
}

// With the events of a mouse, as a scenario makes them.
TEST(EditorByMouse, HoldsDragsAndTaps) {
    Walk walk(Screen{{1024, 768}, true});
    walk.toEditor();
    auto& page = walk.page<tFrmNew>(PageId::tFrmNew);
    auto& edit = walk.program().state().edit;
    const ControlFinder finder(walk.program().window());
    const QString editor = u"tFrmNew"_s;
    const auto record = [&] { return walk.page<kyoskNew>(PageId::kyoskNew).controls().List1.item(0).mid(9, 200); };

    walk.press(editor, u"Image2(0)"_s);
    EXPECT_EQ(page.controls().Label11.text, u"102"_s) << "a tap is one step";
    EXPECT_EQ(edit.ZoomPercent, 102);
    EXPECT_EQ(record().mid(15, 3), u"102"_s) << "kept in the basket when let go";
    walk.press(editor, u"Image2(4)"_s);
    EXPECT_EQ(record().left(4), u"1.04"_s);
    walk.press(editor, u"Image125"_s);
    EXPECT_EQ(edit.PanY, 148);

    const Result<ControlFinder::Held> held = finder.hold(editor, u"Image2(0)"_s);
    ASSERT_TRUE(held.ok());
    walk.settle(420);
    finder.letGo(*held);
    const int after = page.controls().Label11.text.toInt();
    EXPECT_GE(after, 106) << "it goes on while it is held";
    EXPECT_LE(after, 120);
    walk.settle(200);
    EXPECT_EQ(page.controls().Label11.text.toInt(), after) << "and stops when let go";

    // Held while the page goes from under the finger.
    const Result<ControlFinder::Held> lost = finder.hold(editor, u"Image135"_s);
    ASSERT_TRUE(lost.ok());
    page.CommandDone_Click();
    walk.waitFor(u"kyoskNew"_s);
    const int pan = edit.PanX;
    walk.settle(200);
    EXPECT_EQ(edit.PanX, pan);
    walk.press(u"kyoskNew"_s, u"Picture1(0)"_s);
    walk.waitFor(editor);
    EXPECT_EQ(page.controls().Label11.text.toInt(), after) << "as it was left";

    // Twenty moves of 2 percent of the paper: their distances from the press, a thirteenth of each.
    const int before = edit.PanX;
    ASSERT_TRUE(finder.drag(editor, u"PicPic"_s, {50, 50}, {90, 50}).ok());
    walk.settle();
    EXPECT_NEAR(edit.PanX - before, 450 * 0.02 * (20 * 21 / 2) / 13, 3);
    EXPECT_EQ(record().mid(18, 4).trimmed(), QString::number(edit.PanX));

    // Hover opens the panels, the picture closes them.
    QTest::mouseMove(walk.program().window().frontView()->findChild<QWidget*>(u"Image13"_s));
    walk.settle();
    EXPECT_TRUE(walk.pressable(editor, u"Frame3"_s));
    ASSERT_TRUE(finder.pressAt(editor, u"PicPic"_s, {50, 80}).ok());
    walk.settle();
    EXPECT_FALSE(walk.pressable(editor, u"Frame3"_s));
    // The pointer stays where it was when the next window opens.
    QTest::mouseMove(walk.program().window().frontView()->findChild<QWidget*>(u"PicPic"_s));
}

TEST(EditorByKeyboard, ReachesEachToolAndLeavesByEsc) {
    Walk walk({1024, 768});
    walk.toEditor();
    walk.program().window().activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&walk.program().window()));
    ASSERT_TRUE(QApplication::focusWidget());
    EXPECT_EQ(QApplication::focusWidget()->objectName(), u"Image2(0)"_s);
    QStringList wanted{u"Image2(1)"_s, u"Image2(3)"_s,  u"Image2(5)"_s, u"Image2(7)"_s,    u"Image2(10)"_s,
                       u"Image115"_s,  u"Image13"_s,    u"Image15"_s,   u"Frame4Opener"_s, u"Image20"_s,
                       u"Image22"_s,   u"Combo4"_s,     u"Combo2"_s,    u"Misgerett"_s,    u"Command8"_s,
                       u"Strip(3)"_s,  u"CommandDone"_s};
    for (int i = 0; i < 60; ++i) {
        wanted.removeAll(QApplication::focusWidget()->objectName());
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    }
    EXPECT_EQ(wanted, QStringList()) << qPrintable(wanted.join(u' '));

    auto& page = walk.page<tFrmNew>(PageId::tFrmNew);
    walk.program().window().findChild<QWidget*>(u"Image2(0)"_s)->setFocus();
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
    EXPECT_EQ(page.controls().Label11.text, u"102"_s);
    walk.program().window().findChild<QWidget*>(u"Combo2"_s)->setFocus();
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Right);
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Left);
    walk.settle();
    EXPECT_NE(walk.program().state().edit.FrameName, u"000"_s) << "the arrows walk through the frames";
    page.Image13_MouseMove();
    walk.settle();
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    EXPECT_FALSE(page.controls().Frame3.visible) << "Esc closes a panel first";
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    walk.waitFor(u"kyoskNew"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, EditorLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
