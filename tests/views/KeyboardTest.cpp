#include "Walk.h"

#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "transfer/ftp/FtpFrm.h"
#include "views/window/MainWindow.h"
#include "views/window/ScreenDialogs.h"

#include <QApplication>
#include <QComboBox>
#include <QLineEdit>
#include <QTest>
#include <QTimer>

#include <gtest/gtest.h>

namespace lumora {

namespace {

void text(const QString& words) {
    QTest::keyClicks(QApplication::focusWidget(), words);
}

// Tab until the control has the keyboard; going round without finding it is a failure.
void tabTo(Walk& walk, const QString& name) {
    for (int i = 0; i < 80 && focusName() != name; ++i)
        walk.key(Qt::Key_Tab);
    ASSERT_EQ(focusName(), name);
}

void tapAndType(Walk& walk, const QString& name, const QString& words) {
    QTest::mouseClick(static_cast<QComboBox&>(walk.control(name)).lineEdit(), Qt::LeftButton);
    walk.settle();
    text(words);
}

void press(Walk& walk, const QString& name, Qt::Key code = Qt::Key_Return) {
    tabTo(walk, name);
    walk.key(code);
}

} // namespace

TEST(Keyboard, MakesAWholeOrderWithoutAMouse) {
    Walk walk({1024, 768});
    walk.activate();
    press(walk, u"Image1"_s, Qt::Key_Space);
    walk.waitFor(u"nnn"_s);
    press(walk, u"Image1(0)"_s);
    ASSERT_EQ(focusName(), u"Text2"_s) << "the first box has the keyboard";
    text(u"Dana Levi"_s);
    walk.key(Qt::Key_Tab);
    text(u"03-1234567"_s);
    walk.key(Qt::Key_Return); // the main action
    const QString controls[] = {u"Option1(0)"_s, u"Option3(1)"_s, u"Image13(9)"_s,
                                u"Command6"_s,   u"Check1"_s,     u"Command3"_s};
    for (const QString& control : controls)
        press(walk, control, (&control - controls) % 2 == 0 ? Qt::Key_Space : Qt::Key_Return);
    walk.waitFor(u"kyoskNew"_s);

    // The picker runs an event loop of its own below the press.
    bool picked = false;
    QTimer look;
    QObject::connect(&look, &QTimer::timeout, &look, [&] {
        if (focusName() != u"pickerGrid"_s)
            return; // a busy machine has not opened it yet
        look.stop();
        walk.settle(0);
        walk.key(Qt::Key_Right);
        picked = true;
        walk.key(Qt::Key_Return);
    });
    look.start(100);
    press(walk, u"firstFolder"_s);
    ASSERT_TRUE(picked);
    walk.settle(300);
    auto& pictures = walk.page<kyoskNew>(PageId::kyoskNew);
    ASSERT_EQ(pictures.controls().List4.count(), 14);
    press(walk, u"Picture1(0)"_s, Qt::Key_Space);
    walk.key(Qt::Key_Down);
    walk.key(Qt::Key_Right);
    ASSERT_EQ(focusName(), u"Picture1(5)"_s);
    walk.key(Qt::Key_Return);
    walk.key(Qt::Key_Plus);
    EXPECT_EQ(pictures.controls().Label7.text.trimmed(), u"3"_s);
    press(walk, u"Image7"_s);
    ASSERT_TRUE(pictures.controls().Frame4.visible);
    tapAndType(walk, u"Combo1"_s, u"lab.example"_s);
    EXPECT_EQ(pictures.controls().Combo1.text, u"lab.example"_s) << "in place of the prompt";
    walk.key(Qt::Key_Return); // goes on, as in every box that is typed in
    walk.waitFor(u"FtpFrm"_s);
    EXPECT_EQ(walk.program().state().shemot.n1, u"Dana Levi"_s);
    EXPECT_EQ(walk.program().state().shemot.Bord, u"WB"_s);
    walk.program().chain().show(PageId::SpltForm); // has no exit
    bool asked = false;
    walk.program().dialogs().nextAnswer = [&] { return std::optional(!(asked = true)); };
    walk.program().window().close();
    EXPECT_TRUE(asked && !walk.program().chain().hasEnded());
    EXPECT_EQ(walk.program().dialogs().shownTexts.last(), u"לצאת מהתוכנה?"_s) << "nothing is lost";
}

TEST(Keyboard, StaysOnACardThatIsTaken) {
    Walk walk({1024, 768});
    walk.activate();
    walk.go(toMenu);
    press(walk, u"Image1(6)"_s);
    ASSERT_EQ(focusName(), u"Text1(0)"_s) << "the first box has the keyboard";
    text(u"Studio Or"_s);
    walk.key(Qt::Key_Return); // the main action
    EXPECT_EQ(focusName(), u"SoogAlb(0)"_s);
    press(walk, u"SoogAlb(1)"_s, Qt::Key_Space);
    press(walk, u"Command16"_s);
    press(walk, u"Combo4Godel(2)"_s, Qt::Key_Space);
    EXPECT_EQ(focusName(), u"Combo4Godel(2)"_s);
}

TEST(Presses, FailOnWhatAPersonCouldNotPress) {
    Walk walk({1024, 768});
    const ControlFinder finder(walk.program().window());
    const QString start = u"hatchala"_s;
    EXPECT_FALSE(finder.press(u"nnn"_s, u"Command12"_s).ok()) << "another page is in front";
    for (const QString& name : {u"Picture8"_s, u"NoSuchControl"_s}) // the first is hidden
        EXPECT_FALSE(finder.press(start, name).ok()) << qPrintable(name);
    const QStringList messages{u"First"_s, u"Second"_s};
    for (const QString& message : messages)
        walk.program().dialogs().message(message);
    walk.settle();
    const Result<void> covered = finder.press(start, u"Image11"_s);
    ASSERT_FALSE(covered.ok());
    EXPECT_TRUE(covered.failure().message.contains(u"covered"_s)) << qPrintable(covered.failure().message);
    EXPECT_EQ(walk.program().dialogs().frontText(), u"First"_s);
    walk.program().dialogs().closeMessages();
    walk.settle();
    EXPECT_TRUE(finder.press(start, u"Image1"_s).ok());
    EXPECT_EQ(walk.program().dialogs().shownTexts, messages);
}

} // namespace lumora
