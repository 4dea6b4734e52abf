#include "Walk.h"

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/kit/HoldButton.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"

#include <QApplication>
#include <QPushButton>
#include <QTest>
#include <QVBoxLayout>

#include <gtest/gtest.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

struct PanelControls : Controls {
    Caption Command1{*this, u"Command1"};
};

struct PanelPage : Page, PanelControls {
    PanelPage()
        : Page(PageId::SpltForm) {
        Command1.text = u"Close"_s;
    }
    const Controls& controls() const override { return *this; }
    int presses = 0;
};

// The lower half of the window.
class PanelView : public PageView {
public:
    PanelView(PanelPage& page, const SessionState& state, const Theme& theme)
        : PageView(page, state, theme) {
        m_close = button(page.Command1, Role::Main, [&page] { ++page.presses; });
        frame().content()->addStretch(1);
        frame().content()->addWidget(m_close);
        frame().content()->addSpacing(theme.px(240));
        start();
    }
    bool isPanel() const override { return true; }
    QWidget* firstFocus() const override { return m_close; }

protected:
    void render() override {}

private:
    QPushButton* m_close;
};

class Panel : public ::testing::Test {
protected:
    Panel() {
        walk.program().chain().registerPage(PageId::SpltForm, [] { return std::make_unique<PanelPage>(); });
        walk.program().window().registerView(PageId::SpltForm, [&](Page& page, const Theme& theme) {
            return std::make_unique<PanelView>(static_cast<PanelPage&>(page), walk.program().state(), theme);
        });
    }
    Walk walk{{1024, 768}};
    ControlFinder finder{walk.program().window()};
};

} // namespace

TEST_F(Panel, LeavesThePageBelowInSightAndUsableWhereItIsNotCovered) {
    walk.program().window().activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&walk.program().window()));
    auto* tile = walk.program().window().findChild<QWidget*>(u"Image11"_s);
    tile->setFocus();
    walk.program().chain().show(PageId::SpltForm);
    walk.settle();
    EXPECT_EQ(finder.frontPage(), u"SpltForm"_s);
    const QWidget& panel = *walk.program().window().frontView();
    EXPECT_EQ(panel.geometry().bottom(), walk.program().window().rect().bottom());
    EXPECT_LT(panel.height(), 500);
    walk.press(u"SpltForm"_s, u"Command1"_s);
    EXPECT_EQ(walk.page<PanelPage>(PageId::SpltForm).presses, 1);

    EXPECT_TRUE(*finder.visible(u"hatchala"_s, u"Check1"_s));
    EXPECT_TRUE(finder.press(u"hatchala"_s, u"Check1"_s).ok()) << "in the header";
    EXPECT_EQ(walk.program().state().EnglishTips, 1);
    const Result<void> covered = finder.press(u"hatchala"_s, u"Image11"_s);
    ASSERT_FALSE(covered.ok());
    EXPECT_TRUE(covered.failure().message.contains(u"hidden"_s) || covered.failure().message.contains(u"covered"_s))
        << qPrintable(covered.failure().message);
    EXPECT_FALSE(finder.press(u"nnn"_s, u"Command12"_s).ok());

    tile->setFocus();
    walk.program().chain().unload(PageId::SpltForm);
    walk.settle();
    EXPECT_EQ(finder.frontPage(), u"hatchala"_s);
    EXPECT_TRUE(finder.press(u"hatchala"_s, u"Check1"_s).ok());
}

TEST_F(Panel, GivesTheKeyboardBackWhenThePageBelowIsShownAgain) {
    MainWindow& window = walk.program().window();
    window.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&window));
    auto* before = window.findChild<QWidget*>(u"Image11"_s);
    before->setFocus();
    walk.program().chain().show(PageId::SpltForm);
    walk.settle();
    EXPECT_EQ(QApplication::focusWidget(), window.frontView()->firstFocus());
    walk.program().chain().show(PageId::hatchala);
    walk.settle();
    EXPECT_EQ(QApplication::focusWidget(), before);
    EXPECT_EQ(window.viewBelow(), nullptr);
}

TEST_F(Panel, StaysOverItsPageWhenTheWindowGrows) {
    walk.program().chain().show(PageId::SpltForm);
    walk.program().window().resize(1920, 1080);
    walk.settle(100);
    EXPECT_EQ(finder.frontPage(), u"SpltForm"_s);
    ASSERT_TRUE(walk.program().window().viewBelow());
    EXPECT_EQ(walk.program().window().frontView()->width(), 1920);
    EXPECT_TRUE(finder.press(u"hatchala"_s, u"Check1"_s).ok());
}

TEST(HeldButton, TellsTheTapFromTheLossAndLetsGoOnce) {
    QStringList said;
    QWidget window;
    auto* column = new QVBoxLayout(&window);
    auto* button =
        new HoldButton({[&] { said += u"down"_s; }, [&] { said += u"tap"_s; }, [&] { said += u"up"_s; }}, &window);
    column->addWidget(button);
    window.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&window));
    const QStringList whole{u"down"_s, u"tap"_s, u"up"_s};
    const QStringList lost{u"down"_s, u"up"_s};

    QTest::mouseClick(button, Qt::LeftButton);
    EXPECT_EQ(std::exchange(said, {}), whole);
    button->setFocus();
    QTest::keyClick(button, Qt::Key_Space);
    EXPECT_EQ(std::exchange(said, {}), whole);
    button->click(); // Enter does this
    EXPECT_EQ(std::exchange(said, {}), whole);
    QTest::mousePress(button, Qt::RightButton);
    QTest::mouseRelease(button, Qt::RightButton);
    EXPECT_EQ(std::exchange(said, {}), QStringList());

    QTest::mousePress(button, Qt::LeftButton);
    button->setEnabled(false);
    EXPECT_EQ(std::exchange(said, {}), lost);
    QTest::mouseRelease(button, Qt::LeftButton);
    button->setEnabled(true);
    EXPECT_EQ(std::exchange(said, {}), QStringList());

    QTest::mousePress(button, Qt::LeftButton);
    button->hide();
    EXPECT_EQ(std::exchange(said, {}), lost);
    EXPECT_FALSE(button->isHeld());
}

} // namespace lumora
