#include "PageLook.h"

#include "editing/redeye/RedEye.h"
#include "editing/redeye/RedI.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/window/MainWindow.h"

#include <QTest>
#include <QWheelEvent>

namespace lumora {

namespace {

class RedEyeView : public PageLook {
protected:
    explicit RedEyeView(const QString& labSettings = {})
        : walk(GetParam(), labSettings) {
        const DrivePath path = walk.writeFlashPhotograph();
        walk.program().state().edit.PicturePath = path;
        walk.program().chain().load<RedI>().open(path);
        walk.waitFor(u"RedI"_s);
        walk.settle(60);
    }
    RedI& page() { return walk.page<RedI>(PageId::RedI); }
    QPoint searched() { return {page().sight().RedSearchX, page().sight().RedSearchY}; }
    // Where the page's overview shows a point of the picture, in percent.
    void pressOverview(QPoint at) {
        const QPointF percent(100.0 * at.x() / Walk::flashPhotograph.width,
                              100.0 * at.y() / Walk::flashPhotograph.height);
        ASSERT_TRUE(ControlFinder(walk.program().window()).pressAt(u"RedI"_s, u"Picture3"_s, percent).ok());
        walk.settle();
    }
    void look(const QString& name) { PageLook::look(walk, name); }
    void go(const QString& route) { PageLook::go(walk, route); }

    Walk walk;
};

class RedEyeHands : public RedEyeView {};

class RedEyeOperator : public RedEyeView {
protected:
    RedEyeOperator()
        : RedEyeView(u"[Operator]\nEditor = yes\n"_s) {}
};

} // namespace

TEST_P(RedEyeView, LeadsFromTheEyeToTheCorrectionWithEveryControlInReach) {
    look(u"redi-1-find"_s);
    EXPECT_FALSE(*ControlFinder(walk.program().window()).enabled(u"RedI"_s, u"Image2"_s));
    pressOverview(Walk::redEye);
    EXPECT_LT((searched() - Walk::redEye).manhattanLength(), 24);
    look(u"redi-2-place"_s);

    // A tap in the middle of the picture picks the pixel that lies there.
    const QPoint before = searched();
    QWidget& canvas = walk.control(u"Picture1"_s);
    QTest::mouseClick(&canvas, Qt::LeftButton, {}, canvas.rect().center());
    EXPECT_LE((searched() - before).manhattanLength(), 2);
    const int size = page().sight().circle().width();
    QWheelEvent turn(canvas.rect().center(), canvas.mapToGlobal(canvas.rect().center()), {}, {0, 120}, Qt::NoButton,
                     Qt::NoModifier, Qt::NoScrollPhase, false);
    for (int i = 0; i < 8; ++i)
        QCoreApplication::sendEvent(&canvas, &turn);
    EXPECT_EQ(page().sight().circle().width(), size + 16);
    go(u":redi-3-aim Image2"_s);
    EXPECT_TRUE(page().picture().RedChanged);
    EXPECT_LT(RedEye::redness(page().picture().Picture1.image().pixel(Walk::redEye)), 20);
    go(u":redi-4-corrected Frame6 Image6 :redi-5-darkened"_s);
    for (const QString& name : {u"Image16"_s, u"Image7"_s, u"CommandCloser"_s, u"CommandFurther"_s, u"Image5"_s})
        EXPECT_TRUE(walk.pressable(u"RedI"_s, name)) << qPrintable(name);
    go(u"CommandMenu :redi-6-menu CommandMenuClose CommandHelp :redi-7-help CommandHelpClose Image7"_s);
    EXPECT_GT(RedEye::redness(page().picture().Picture1.image().pixel(Walk::redEye)), 200);
}

TEST_P(RedEyeHands, OpensItsMenuByALongPress) {
    pressOverview(Walk::redEye);
    QWidget& canvas = walk.control(u"Picture1"_s);
    const QPoint middle = canvas.rect().center();
    const QPoint before = searched();
    QTest::mousePress(&canvas, Qt::LeftButton, {}, middle + QPoint(40, 40));
    walk.settle(750);
    EXPECT_TRUE(page().controls().kofez.visible);
    QTest::mouseRelease(&canvas, Qt::LeftButton, {}, middle + QPoint(40, 40));
    EXPECT_EQ(searched(), before) << "it was no pick";
}

TEST_P(RedEyeHands, FollowsADragAndAHeldArrow) {
    pressOverview(Walk::redEye);
    const double left = page().sight().Picture1Left;
    const int before = searched().x();
    EXPECT_TRUE(ControlFinder(walk.program().window()).drag(u"RedI"_s, u"Picture1"_s, {60, 60}, {40, 60}).ok());
    EXPECT_LT(page().sight().Picture1Left, left - 50);
    EXPECT_EQ(searched().x(), before) << "a drag picks nothing";
    QWidget& right = walk.control(u"Image15"_s);
    QTest::mousePress(&right, Qt::LeftButton);
    walk.settle(350);
    EXPECT_GE(searched().x(), before + 4);
    QTest::mouseRelease(&right, Qt::LeftButton);
    EXPECT_FALSE(page().holds());
}

TEST_P(RedEyeHands, BringTheCircleToAnEyeByArrowsAlone) {
    walk.activate();
    for (const auto& [name, key, times] :
         {std::tuple(u"Picture3"_s, Qt::Key_Left, 6), {u"Picture3"_s, Qt::Key_Up, 4}, {u"Picture1"_s, Qt::Key_Up, 6}}) {
        walk.control(name).setFocus(Qt::TabFocusReason);
        for (int i = 0; i < times; ++i)
            walk.key(key);
    }
    EXPECT_LT((searched() - Walk::redEye).manhattanLength(), 12);
    EXPECT_TRUE(walk.pressable(u"RedI"_s, u"Image2"_s));
}

TEST_P(RedEyeOperator, FindsThePeakAndHasNoFaultInItsTools) {
    pressOverview(Walk::redEye);
    go(u"Command13 Command6 Image2 :redi-8-operator"_s);
    EXPECT_GT(page().picture().RedPeakValue, 200);
}

INSTANTIATE_TEST_SUITE_P(Screens, RedEyeView, PageLook::screens(), PageLook::nameOf);

INSTANTIATE_TEST_SUITE_P(Screens, RedEyeHands, ::testing::Values(Screen{{1024, 768}, false}));

INSTANTIATE_TEST_SUITE_P(Screens, RedEyeOperator, ::testing::Values(Screen{{1024, 768}, false}));

} // namespace lumora
