#include "Walk.h"

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/kit/HoldButton.h"
#include "views/kyoskNew/LargePicture.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"
#include "views/window/ScreenDialogs.h"

#include <QApplication>
#include <QKeySequence>
#include <QTest>
#include <QTimer>
#include <QVBoxLayout>

#include <gtest/gtest.h>

#include <functional>

namespace lumora {

// The caption's keyboard is the page that covers the lower half of another.
TEST(Panel, LeavesThePageBelowInSightAndUsableWhereItIsNotCovered) {
    Walk walk({1024, 768});
    MainWindow& window = walk.program().window();
    const ControlFinder finder(window);
    const QString start = u"hatchala"_s;
    walk.activate();
    QWidget& tile = walk.control(u"Image11"_s);
    tile.setFocus();
    walk.program().chain().show(PageId::mikledet);
    walk.settle();
    EXPECT_EQ(finder.frontPage(), u"mikledet"_s);
    EXPECT_NE(QApplication::focusWidget(), &tile);
    EXPECT_EQ(window.frontView()->geometry().bottom(), window.rect().bottom());
    EXPECT_LT(window.frontView()->height(), 500);
    walk.program().chain().show(PageId::hatchala);
    walk.settle();
    EXPECT_EQ(QApplication::focusWidget(), &tile) << "the keyboard comes back";
    EXPECT_EQ(window.viewBelow(), nullptr);
    walk.program().chain().show(PageId::mikledet);
    walk.press(u"mikledet"_s, u"leter(0)"_s);

    walk.press(start, u"Check1"_s); // in the header
    EXPECT_EQ(walk.program().state().EnglishTips, 1);
    EXPECT_FALSE(finder.press(start, u"Image11"_s).ok()) << "covered";
    window.resize(1920, 1080);
    walk.settle(100);
    ASSERT_TRUE(window.viewBelow());
    EXPECT_EQ(window.frontView()->width(), 1920);
    walk.press(start, u"Command4Ivrit"_s);
}

TEST(LargePicture, ShadesWhatThePaperDoesNotTake) {
    const Theme theme(Theme::Fit{});
    LargePicture large(theme, nullptr);
    large.resize(400, 400);
    kyoskNewControls page;
    for (const auto& [size, paper, taken, beside, white] :
         {std::tuple(QSize(400, 300), QRectF(0, 0.1, 1, 0.8), QPoint(200, 88), QPoint(200, 72), false),
          {QSize(300, 400), QRectF(0.1, 0, 0.8, 1), QPoint(88, 200), QPoint(72, 200), false},
          {QSize(400, 300), QRectF(-0.1, 0, 1.2, 1), QPoint(42, 200), QPoint(26, 200), true},
          {QSize(300, 400), QRectF(0, -0.1, 1, 1.2), QPoint(200, 42), QPoint(200, 26), true}}) {
        page.Picture2.bitmap = Bitmap(size.width(), size.height(), Qt::red);
        page.Picture2.paper = paper;
        large.show(page.Picture2);
        const QImage seen = large.grab().toImage();
        EXPECT_EQ(seen.pixelColor(taken), QColor(Qt::red));
        const QColor other = seen.pixelColor(beside);
        EXPECT_TRUE(white ? other == Qt::white : other.red() < 200 && other.red() > other.green());
    }
}

TEST(QuestionBox, AnswersWhatWasPressed) {
    Walk walk({1024, 768});
    walk.activate();
    for (const auto& [pressed, yes] :
         {std::pair("messageYes", true), {"messageNo", false}, {"Return", true}, {"Esc", false}}) {
        QTimer::singleShot(50, &walk.program().window(), [&walk, name = QString::fromLatin1(pressed)] {
            walk.settle(0);
            if (name.startsWith(u"message"_s))
                QTest::mouseClick(&walk.control(name), Qt::LeftButton);
            else
                walk.key(QKeySequence(name)[0].key());
        });
        EXPECT_EQ(walk.program().dialogs().ask(u"Throw the order away?"_s), yes) << pressed;
    }
}

TEST(HeldButton, TellsTheTapFromTheLossAndLetsGoOnce) {
    QStringList said;
    QWidget window;
    auto* column = new QVBoxLayout(&window);
    auto* button =
        new HoldButton({[&] { said += u"down"_s; }, [&] { said += u"up"_s; }, [&] { said += u"lost"_s; }}, &window);
    column->addWidget(button);
    window.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&window));
    const QStringList whole{u"down"_s, u"up"_s};
    const QStringList lost{u"down"_s, u"lost"_s};

    const auto click = [&](Qt::MouseButton mouse) { QTest::mouseClick(button, mouse); };
    const std::pair<std::function<void()>, QStringList> uses[] = {
        {[&] { click(Qt::LeftButton); }, whole},
        {[&] { QTest::keyClick(button, Qt::Key_Space); }, whole},
        {[&] { click(Qt::RightButton); }, {}},
        {[&] {
             QTest::mousePress(button, Qt::LeftButton);
             button->setEnabled(false);
         },
         lost},
        {[&] { QTest::mouseRelease(button, Qt::LeftButton); }, {}},
        {[&] {
             button->setEnabled(true);
             QTest::mousePress(button, Qt::LeftButton);
             button->hide();
         },
         lost},
    };
    for (const auto& [use, told] : uses) {
        use();
        EXPECT_EQ(std::exchange(said, {}), told);
    }
    EXPECT_FALSE(button->isHeld());
}

} // namespace lumora
