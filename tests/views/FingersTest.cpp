#include "Walk.h"

#include "editing/editor/PinchSteps.h"
#include "editing/editor/tFrmNew.h"
#include "selection/pictures/kyoskNew.h"
#include "session/SessionState.h"
#include "views/kit/FingerMoves.h"
#include "views/window/DoubledPress.h"
#include "views/window/MainWindow.h"

#include <QApplication>
#include <QComboBox>
#include <QListWidget>
#include <QPointingDevice>
#include <QPushButton>
#include <QScrollArea>
#include <QScrollBar>
#include <QScroller>
#include <QTest>
#include <QTouchEvent>
#include <QWheelEvent>
#include <QWindow>

#include <gtest/gtest.h>

#include <memory>

namespace lumora {

namespace {

// Fingers on the screen. A second one comes later than the first, and is lifted before it where its way is shorter.
class Fingers {
public:
    explicit Fingers(Walk& walk)
        : m_walk(walk) {
        walk.activate();
    }
    enum class End { Lifted, Cancelled };
    void draw(QWidget& on, const std::vector<QPoint>& way, const std::vector<QPoint>& second = {},
              End end = End::Lifted, bool isDoubled = false) {
        m_walk.settle();
        if (isDoubled)
            m_walk.program().window().presses().changed();
        auto hand = QTest::touchEvent(on.window(), m_device.get(), false);
        hand.press(0, way.front(), &on).commit();
        if (!second.empty())
            hand.stationary(0).press(1, second.front(), &on).commit();
        for (std::size_t i = 0; i < way.size(); ++i) {
            hand.move(0, way[i], &on);
            if (i < second.size())
                hand.move(1, second[i], &on);
            else if (!second.empty() && i == second.size())
                hand.release(1, second.back(), &on);
            hand.commit();
            QTest::qWait(20); // what scrolls follows by the frames of the screen
        }
        if (end == End::Cancelled) {
            QTouchEvent cancelled(QEvent::TouchCancel, m_device.get());
            QApplication::sendEvent(on.window()->windowHandle(), &cancelled);
        }
        hand.release(0, way.back(), &on).commit();
        m_walk.settle();
    }

private:
    Walk& m_walk;
    std::unique_ptr<QPointingDevice> m_device{QTest::createTouchDevice()};
};

} // namespace

TEST(Swipe, IsLongLevelAndQuick) {
    using enum Swipe::Way;
    for (const auto& [to, time, way, strays] : {std::tuple(QPointF(-60, 30), 1500, Left, true),
                                                {{60, -30}, 0, Right, true},
                                                {{-59, 0}, 300, None, true},
                                                {{-60, 31}, 300, None, true},
                                                {{-60, 0}, 1501, None, true},
                                                {{15, -15}, 300, None, false}}) {
        Swipe swipe({500, 500}, 1000);
        EXPECT_EQ(swipe.strays(QPointF(500, 500) + to), strays) << to.x() << ' ' << to.y();
        EXPECT_EQ(swipe.end(QPointF(500, 500) + to, 1000 + time), way) << to.x() << ' ' << to.y() << ' ' << time;
    }
    Swipe back({0, 0}, 0);
    EXPECT_TRUE(back.strays({25, 0}) && back.strays({0, 0}));
}

TEST(Fingers, MoveWhatScrollsAndChooseNothingOnTheWay) {
    Walk walk({1024, 768});
    Fingers fingers(walk);
    QWidget& window = walk.program().window();
    QListWidget list(&window);
    QScrollArea area(&window);
    auto* tall = new QPushButton;
    tall->setFixedSize(200, 900);
    area.setWidget(tall);
    QComboBox box(&window);
    for (int i = 0; i < 60; ++i) {
        list.addItem(QString::number(i));
        box.addItem(QString::number(i));
    }
    QString said;
    QObject::connect(&list, &QListWidget::currentRowChanged, [&](int row) { said += u"row %1 "_s.arg(row); });
    QObject::connect(&list, &QListWidget::itemClicked, [&] { said += u"clicked"_s; });
    QObject::connect(tall, &QPushButton::clicked, [&] { said += u"pressed"_s; });
    QObject::connect(&box, &QComboBox::activated, [&](int row) { said += u"chosen %1"_s.arg(row); });
    const auto move = [&](QAbstractScrollArea& moved, QWidget& below, const QString& tapped) {
        SCOPED_TRACE(qPrintable(tapped));
        QScrollBar& bar = *moved.verticalScrollBar();
        fingers.draw(below, {{50, 210}, {50, 190}, {50, 150}, {50, 110}});
        const QScroller& runs = *QScroller::scroller(moved.viewport());
        EXPECT_TRUE(QTest::qWaitFor([&] { return runs.state() == QScroller::Inactive; }, 20000));
        EXPECT_GT(bar.value(), 40);
        EXPECT_EQ(said, QString());
        bar.setValue(0);
        fingers.draw(below, {{50, 12}, {52, 14}});
        EXPECT_EQ(bar.value(), 0);
        EXPECT_EQ(std::exchange(said, {}), tapped);
    };
    for (QWidget* widget : {static_cast<QWidget*>(&box), static_cast<QWidget*>(&list), static_cast<QWidget*>(&area)}) {
        widget->setGeometry(0, 0, 260, 300);
        widget->raise();
        widget->show();
    }
    move(area, *tall, u"pressed"_s);
    area.hide();
    move(list, *list.viewport(), u"row 0 clicked"_s);
    QTest::mousePress(list.viewport(), Qt::LeftButton, {}, {50, 150});
    EXPECT_NE(std::exchange(said, {}), QString()) << "a mouse chooses at the press";
    QTest::mouseMove(list.viewport(), {50, 50});
    EXPECT_EQ(list.verticalScrollBar()->value(), 0) << "and moves nothing";
    QTest::mouseRelease(list.viewport(), Qt::LeftButton, {}, {50, 50});
    said.clear();
    box.showPopup();
    QTest::qWait(QApplication::doubleClickInterval() + 50); // no tap that has opened it
    move(*box.view(), *box.view()->viewport(), u"chosen 0"_s);
}

TEST(Fingers, TurnThePagesOfPicturesAndChooseNothingOnTheWay) {
    for (const bool english : {true, false}) {
        Walk walk(Screen{{1024, 768}, english});
        Fingers fingers(walk);
        walk.go(toDetails + toOptions + toBorder + toTerms + toPictures);
        walk.pick(u"kyoskNew"_s, u"Image5"_s);
        const auto& page = walk.page<kyoskNew>(PageId::kyoskNew).controls();
        QWidget& cell = walk.control(u"Picture1(1)"_s);
        const QString first = page.Picture1[1].text;
        const QPoint from(80, 60), forwards(english ? -90 : 90, 10);
        const auto draw = [&](QPoint way) { fingers.draw(cell, {from, from + way / 2, from + way}); };
        draw(-forwards);
        EXPECT_EQ(page.Picture1[1].text, first) << "there is no page before";
        draw({0, 70});
        draw(forwards);
        EXPECT_NE(page.Picture1[1].text, first) << english;
        draw(forwards);
        draw(-forwards);
        EXPECT_EQ(page.Picture1[1].text, first) << english;
        fingers.draw(cell, {from, from + forwards / 2, from + forwards}, {}, Fingers::End::Lifted, true);
        EXPECT_EQ(page.Picture1[1].text, first) << "a doubled press";
        EXPECT_EQ(page.List1.count(), 0);
        draw({10, 10});
        EXPECT_EQ(page.List1.count(), 1) << "a tap chooses";
    }
}

TEST(Fingers, ZoomAndTurnThePictureByTheStepsOfItsButtons) {
    Walk walk(Screen{{1024, 768}, true});
    walk.toEditor();
    Fingers fingers(walk);
    const auto& page = walk.page<tFrmNew>(PageId::tFrmNew);
    const auto& edit = walk.program().state().edit;
    const auto record = [&](int at) {
        return walk.page<kyoskNew>(PageId::kyoskNew).controls().List1.item(0).mid(9 + at, 3).toInt();
    };
    QWidget& paper = walk.control(u"PicPic"_s);
    const QPoint middle = paper.rect().center();
    // Lengths and angles of the line between the fingers, clockwise; then the second one is lifted and the first
    // strays.
    const auto pinch = [&](std::initializer_list<std::pair<double, double>> lines) {
        std::vector<QPoint> one, other;
        for (const auto& [length, degrees] : lines) {
            one.push_back(middle - QLineF::fromPolar(length / 2, -degrees).p2().toPoint());
            other.push_back(middle + QLineF::fromPolar(length / 2, -degrees).p2().toPoint());
        }
        one.insert(one.end(), {middle, middle + QPoint(90, 90)});
        fingers.draw(paper, one, other);
    };
    const int panX = edit.PanX;
    fingers.draw(paper, {middle, middle}, {middle + QPoint(100, 0), middle + QPoint(120, 0)}, Fingers::End::Cancelled);
    EXPECT_EQ(record(15), 120);
    pinch({{100, 0}, {100, 0}});
    EXPECT_EQ(record(15), 120) << "the pinch before has ended";
    pinch({{120, 0}, {135, 45}, {150, 90}});
    EXPECT_EQ(record(15), 150);
    EXPECT_EQ(record(12), 180) << "the panel of the turns is closed";
    EXPECT_EQ(edit.PanX, panX) << "the finger that stays drags nothing";
    walk.go(u"Frame4Opener"_s);
    pinch({{200, 0}, {200, 30}, {200, 60}});
    EXPECT_NEAR(record(12), 240, 1);
    EXPECT_TRUE(page.controls().Frame4.visible);
    pinch({{200, 0}, {200, -120}, {200, -240}, {200, -360}, {200, -480}});
    EXPECT_EQ(record(12), -99) << "it has no room for more";
    const int before = record(15);
    QWheelEvent wheel(middle, paper.mapToGlobal(middle), {}, {0, 240}, Qt::NoButton, {}, Qt::NoScrollPhase, false);
    QApplication::sendEvent(paper.parentWidget(), &wheel);
    EXPECT_EQ(record(15), before + 2 * PinchSteps::ofNotch * PinchSteps::zoomStep);
}

TEST(Fingers, HideThePointerUntilAMouseMoves) {
    Walk walk({1024, 768});
    Fingers fingers(walk);
    QWidget& check = walk.control(u"Check1"_s);
    fingers.draw(check, {{20, 20}, {24, 20}});
    EXPECT_TRUE(QGuiApplication::overrideCursor());
    QMouseEvent mouse(QEvent::MouseMove, {3, 3}, check.mapToGlobal(QPoint(3, 3)), Qt::NoButton, {}, {});
    QApplication::sendEvent(&check, &mouse);
    EXPECT_FALSE(QGuiApplication::overrideCursor());
}

} // namespace lumora
