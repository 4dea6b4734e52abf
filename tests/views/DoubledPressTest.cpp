#include "Walk.h"

#include "entry/details/nnn.h"
#include "session/PageChain.h"
#include "views/kit/HoldButton.h"
#include "views/kit/Overlay.h"
#include "views/window/DoubledPress.h"
#include "views/window/MainWindow.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPointingDevice>
#include <QTest>

#include <gtest/gtest.h>

#include <memory>

namespace lumora {

namespace {

// A busy machine may not come to it by itself in that time.
void paint(QWidget& window) {
    QTest::qWait(30);
    QEvent due(QEvent::UpdateRequest);
    QApplication::sendEvent(&window, &due);
}

} // namespace

TEST(DoubledPress, CountsOnceTheHandWasUpForAPauseBehindWhatHasChanged) {
    qint64 now = 0;
    Walk walk({1024, 768});
    walk.activate();
    MainWindow& window = walk.program().window();
    PageChain& chain = walk.program().chain();
    window.presses().setClock([&] { return now; });
    Overlay panel(window.theme(), &window);
    QString said;
    HoldButton target({[&] { said += u"down"_s; }, [&] { said += u"up"_s; }, [&] { said += u"lost"_s; }}, &window);
    target.setAutoDefault(true); // Enter
    target.setGeometry(0, 0, 100, 100);
    target.show();
    const std::unique_ptr<QPointingDevice> finger(QTest::createTouchDevice());
    using Do = std::function<void()>;
    const std::pair<const char*, Do> hands[] = {{"mouse", [&] { QTest::mouseClick(&target, Qt::LeftButton); }},
                                                {"finger",
                                                 [&] {
                                                     QTest::touchEvent(&window, finger.get()).press(0, {50, 50});
                                                     QTest::touchEvent(&window, finger.get()).release(0, {50, 50});
                                                 }},
                                                {"Enter", [&] { QTest::keyClick(&target, Qt::Key_Return); }},
                                                {"blank", [&] { QTest::keyClick(&target, Qt::Key_Space); }}};
    const std::pair<const char*, Do> changes[] = {
        {"panel opens", [&] { panel.setOpen(true); }},
        {"panel closes", [&] { panel.setOpen(false); }},
        {"page", [&] { chain.show(chain.front()->id() == PageId::SpltForm ? PageId::hatchala : PageId::SpltForm); }}};
    for (const auto& [hand, press] : hands) {
        for (const auto& [what, change] : changes) {
            SCOPED_TRACE(std::string(what) + ", " + hand);
            const auto counts = [&, &press = press](qint64 wait) {
                now += wait;
                target.raise();
                press();
                return !std::exchange(said, {}).isEmpty();
            };
            change();
            EXPECT_FALSE(counts(1000)) << "the work of the change took that long";
            EXPECT_FALSE(counts(399));
            EXPECT_TRUE(counts(400));
            EXPECT_TRUE(counts(0)) << "nothing has changed";
        }
    }
    panel.setOpen(true);
    paint(window);
    now += 400;
    QTest::keyPress(&target, Qt::Key_Return);
    EXPECT_EQ(std::exchange(said, {}), u"downup"_s);
    panel.setOpen(false);
    now += 1000;
    QKeyEvent held(QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier, {}, true);
    QApplication::sendEvent(&target, &held);
    EXPECT_EQ(said, QString());
    QTest::keyRelease(&target, Qt::Key_Return);
    now += 400;
    QTest::mousePress(&target, Qt::LeftButton);
    panel.setOpen(true);
    now += 1000;
    EXPECT_EQ(said, u"down"_s) << "the timer of the page goes on";
    QTest::mouseRelease(&target, Qt::LeftButton);
    EXPECT_EQ(said, u"downup"_s);
}

TEST(DoubledPress, IsNotTakenByTheNextStepOfAPage) {
    qint64 now = 0;
    Walk walk({1024, 768});
    walk.program().window().presses().setClock([&] { return now; });
    walk.go(toMenu);
    const auto& page = walk.page<nnn>(PageId::nnn);
    using enum nnn::Step;
    for (const auto& [wait, name, step] : {std::tuple(400, u"Image1(0)"_s, Details),
                                           {350, u"Command4"_s, Details},
                                           {400, u"Command4"_s, Menu},
                                           {350, u"Image1(0)"_s, Menu},
                                           {400, u"Image1(0)"_s, Details}}) {
        now += wait;
        QTest::mouseClick(&walk.control(name), Qt::LeftButton);
        paint(walk.program().window());
        EXPECT_EQ(page.step(), step) << wait << " " << qPrintable(name);
    }
}

} // namespace lumora
