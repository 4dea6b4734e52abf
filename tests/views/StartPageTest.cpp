#include "PageLook.h"

#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "start/hatchala.h"
#include "support/SamplePhotographs.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"

#include <QApplication>
#include <QLabel>
#include <QTest>

#include <gtest/gtest.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

hatchala& startPage(Walk& walk) {
    return walk.page<hatchala>(PageId::hatchala);
}

QWidget& control(Walk& walk, const QString& name) {
    const QWidget& view = *walk.program().window().frontView();
    return *view.findChild<QWidget*>(name);
}

// A mouse that goes onto the control, or off it.
void mouseGoes(Walk& walk, const QString& name, bool onto) {
    QWidget& widget = control(walk, name);
    if (onto) {
        QEnterEvent event(QPointF(5, 5), QPointF(5, 5), QPointF(5, 5));
        QApplication::sendEvent(&widget, &event);
    } else {
        QEvent event(QEvent::Leave);
        QApplication::sendEvent(&widget, &event);
    }
    walk.settle();
}

// Counts how often a widget paints itself.
class Paints : public QObject {
public:
    int count = 0;

protected:
    bool eventFilter(QObject*, QEvent* event) override {
        count += event->type() == QEvent::Paint;
        return false;
    }
};

class StartLook : public PageLook {
protected:
    // An advertising picture that the lab's installation has placed.
    void placePicture(Walk& walk) {
        const HostPath folder =
            *walk.program().platform().files.drives().toHost(walk.program().state().DiskRoot / u"lumora\\zmany");
        std::filesystem::create_directories(folder);
        ASSERT_TRUE(writeSamplePhotographs(folder, 1, 0.2).ok());
        std::filesystem::rename(folder / "IMG_0001.jpg", folder / "ad01.jpg");
    }
};

} // namespace

TEST_P(StartLook, TheStartPageInEachOfItsStates) {
    Walk walk(GetParam(), u"[Switches]\nDeliveryQuestion = yes\n"_s);
    hatchala& page = startPage(walk);
    mouseGoes(walk, u"Image11"_s, true);
    look(walk, u"01-start-help"_s);
    mouseGoes(walk, u"Image11"_s, false);
    mouseGoes(walk, u"Image6"_s, true);
    look(walk, u"01-start-help-lab"_s);
    mouseGoes(walk, u"Image6"_s, false);

    placePicture(walk);
    page.Timer2_Tick();
    page.Timer4_Tick();
    look(walk, u"01-start-advert"_s);
    while (page.motion().Picture4Width() > 120)
        page.Timer2_Tick();
    look(walk, u"01-start-advert-closing"_s);

    walk.press(u"hatchala"_s, u"Image1"_s);
    ASSERT_TRUE(QTest::qWaitFor([&] { return !page.timers().Timer3.running(); }, 60000));
    look(walk, u"01-start-shops"_s);
    walk.press(u"hatchala"_s, u"shopsBack"_s);
    EXPECT_FALSE(page.controls().Picture1.visible);
    look(walk, u"01-start"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, StartLook, PageLook::screens(), PageLook::nameOf);

TEST(StartPage, HelpsAMouseAFingerAndTheKeyboard) {
    Walk walk({1024, 768});
    hatchala& page = startPage(walk);
    const std::pair<QString, hatchala::Hover> controls[] = {{u"Image1"_s, hatchala::Hover::Image1},
                                                            {u"Image11"_s, hatchala::Hover::Image11},
                                                            {u"Image5"_s, hatchala::Hover::Image5},
                                                            {u"Image3"_s, hatchala::Hover::Image3},
                                                            {u"Image6"_s, hatchala::Hover::Image6}};
    const auto shown = [&] {
        QStringList names;
        for (int i = 0; i < 6; ++i) {
            const QString name = u"Image12(%1)"_s.arg(i);
            if (i > 0 && control(walk, name).isVisible())
                names += name;
        }
        return names;
    };
    for (const bool english : {false, true}) {
        if (english)
            walk.press(u"hatchala"_s, u"Check1"_s);
        for (const auto& [name, over] : controls) {
            mouseGoes(walk, name, true);
            EXPECT_EQ(shown(), QStringList(u"Image12(%1)"_s.arg(static_cast<int>(over))));
            const QWidget& head = control(walk, u"Picture3"_s);
            EXPECT_EQ(head.isVisible(), !english);
            EXPECT_GE(head.height(), 32);
            EXPECT_EQ(page.controls().Picture2.visible, english);
            EXPECT_EQ(page.controls().Image2.visible, english);
            mouseGoes(walk, name, false);
            EXPECT_EQ(shown(), QStringList());
            EXPECT_TRUE(page.controls().Picture2.visible && page.controls().Image2.visible);
            EXPECT_FALSE(page.controls().Picture3.visible);
        }
    }
    // A finger that touches the lab's telephone, then the bare page.
    QTest::mousePress(&control(walk, u"Image6"_s), Qt::LeftButton);
    walk.settle();
    EXPECT_EQ(shown(), QStringList(u"Image12(5)"_s));
    QTest::mousePress(walk.program().window().frontView(), Qt::LeftButton, {}, {500, 100});
    walk.settle();
    EXPECT_EQ(shown(), QStringList());
    // The keyboard that walks on.
    control(walk, u"Image5"_s).setFocus(Qt::TabFocusReason);
    walk.settle();
    EXPECT_EQ(shown(), QStringList(u"Image12(3)"_s));
}

TEST(StartPage, ItsMotionsPaintNothingButThemselves) {
    Walk walk({1024, 768});
    hatchala& page = startPage(walk);
    walk.settle(100);
    int renderings = 0;
    QObject::connect(&page, &Page::changed, [&] { ++renderings; });
    Paints arrow;
    Paints words;
    control(walk, u"Label8"_s).installEventFilter(&arrow);
    control(walk, u"Title"_s).installEventFilter(&words);
    const int top = page.motion().Label8Top();
    walk.settle(400);
    EXPECT_NE(page.motion().Label8Top(), top);
    EXPECT_GT(arrow.count, 3);
    EXPECT_EQ(words.count, 0);
    EXPECT_EQ(renderings, 0);
}

TEST(StartPage, ThePanelOfTheShopsUnfoldsAnswersAndCloses) {
    Walk walk({1024, 768}, u"[Switches]\nDeliveryQuestion = yes\n"_s);
    hatchala& page = startPage(walk);
    walk.press(u"hatchala"_s, u"Image1"_s);
    ASSERT_TRUE(QTest::qWaitFor([&] { return !page.timers().Timer3.running(); }, 60000));
    EXPECT_EQ(page.motion().Picture1Width(), StartMotion::panelWidth);
    EXPECT_FALSE(page.timers().Timer5.running());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    walk.settle();
    EXPECT_FALSE(control(walk, u"Picture1"_s).isVisible());
    EXPECT_TRUE(page.timers().Timer5.running());

    walk.press(u"hatchala"_s, u"Image1"_s);
    ASSERT_TRUE(QTest::qWaitFor([&] { return !page.timers().Timer3.running(); }, 60000));
    const Result<void> chosen =
        ControlFinder(walk.program().window()).choose(u"hatchala"_s, u"List1"_s, page.controls().List1.item(1));
    ASSERT_TRUE(chosen.ok()) << qPrintable(chosen.failure().message);
    walk.waitFor(u"nnn"_s);
    EXPECT_EQ(walk.program().state().KodMishloach, u"OSK");
}

} // namespace lumora
