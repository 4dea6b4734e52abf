#include "PageLook.h"

#include "kiosk/IdleEnd.h"
#include "kiosk/StaffCode.h"
#include "support/PageRig.h"
#include "views/window/KioskPanels.h"
#include "views/window/PicturePicker.h"
#include "views/window/ScreenDialogs.h"
#include "views/window/StillTherePanel.h"

#include <QListWidget>
#include <QRegularExpression>
#include <QTest>

namespace lumora {
namespace {

// A window before a machine whose clock is turned on.
struct KioskWindow : ::testing::Test, PageRig {
    KioskWindow() {
        state.kiosk.on = true;
        registerBare({PageId::hatchala, PageId::kyoskNew});
        chain.show(PageId::kyoskNew);
        window.resize(1024, 768);
        window.show();
    }
    void wait(std::chrono::seconds time) {
        machine.clock.ran += time;
        idle.Timer_Tick();
        QTest::qWait(30);
    }

    Theme theme{Theme::Fit{}};
    MainWindow window{chain, state};
    ScreenDialogs dialogs{window, state, platform};
    Platform platform = machine.with(dialogs);
    IdleEnd idle{state.kiosk, platform, chain};
    StaffCode staff{state, machine.files, machine.clock};
    KioskPanels panels{window, state, chain, idle, staff};
};

TEST_F(KioskWindow, AsksWhetherAnybodyIsThereAlsoBeforeAPicker) {
    using namespace std::chrono_literals;
    QTimer::singleShot(0, [&] {
        wait(90s);
        auto* here = window.findChild<QAbstractButton*>(u"stillHere"_s);
        ASSERT_TRUE(here && here->isVisible());
        here->click();
        QTest::qWait(30);
        EXPECT_FALSE(window.findChild<QAbstractButton*>(u"stillHere"_s));
        wait(90s);
        wait(20s);
    });
    EXPECT_TRUE(dialogs.pickFile(u"pick"_s, {}, {}, Dialogs::Offer::Pictures).isEmpty());
    ASSERT_TRUE(QTest::qWaitFor([&] { return chain.front()->id() == PageId::hatchala; }, 5000));
    EXPECT_FALSE(window.findChild<QWidget*>(u"stillThere"_s));
}

TEST_F(KioskWindow, PicksFromCardsAndSticksAlone) {
    const HostPath media = machine.drives.dataFolder().parent_path() / "media";
    const auto offered = [&](bool staffIsThere) {
        state.staff = staffIsThere;
        const PicturePicker picker(theme, &window, state, machine.platform, u"pick"_s, machine.drives.programRoot(), {},
                                   Dialogs::Offer::Pictures);
        QStringList names;
        for (const auto* place : picker.findChildren<QAbstractButton*>(QRegularExpression(u"^place"_s)))
            names += place->property("folder").toString();
        EXPECT_TRUE(staffIsThere || !picker.findChild<QAbstractButton*>(u"pickerUp"_s)->isEnabled());
        for (int row = 0; const auto* item = picker.findChild<QListWidget*>(u"pickerGrid"_s)->item(row); ++row)
            names += item->text();
        return names;
    };
    EXPECT_EQ(offered(false), QStringList());
    std::filesystem::create_directories(media / "CARD" / "DCIM");
    std::filesystem::create_directory_symlink(machine.drives.dataFolder(), media / "CARD" / "others");
    machine.drives.refreshMedia();
    EXPECT_EQ(offered(false), QStringList({toText(media / "CARD"), u"DCIM"_s}));
    EXPECT_TRUE(offered(true).contains(u"/"_s)) << "the staff sees all";
}

class KioskLook : public PageLook {};

TEST_P(KioskLook, OpensWhatIsTheStaffsBehindTheCornerAndTheCodeAlone) {
    Walk walk(GetParam(),
              u"[Kiosk]\nMode = yes\nCode = %1\n"_s.arg(StaffCodeLine(u"2468"_s, "0123456789abcdef", 10000)));
    MainWindow& window = walk.program().window();
    window.close();
    walk.settle(100);
    if (GetParam().english)
        walk.press(u"hatchala"_s, u"Check1"_s); // the program has not ended
    walk.go(toMenu);
    StillTherePanel question(window.theme(), &window, walk.program().state());
    question.tell(14, 0.7);
    question.setOpen(true);
    look(walk, u"06-still-there"_s);
    question.setOpen(false);
    auto* held = window.findChild<QTimer*>(u"cornerHeld"_s);
    EXPECT_EQ(held->interval(), 3000);
    const QPoint corner(GetParam().english ? 30 : window.width() - 30, 30);
    QWidget* below = window.childAt(corner);
    for (const bool isHeld : {false, true}) {
        held->setInterval(isHeld ? 0 : 3000);
        QTest::mousePress(below, Qt::LeftButton, {}, below->mapFrom(&window, corner));
        EXPECT_TRUE(held->isActive());
        walk.settle(isHeld ? 500 : 0);
        QTest::mouseRelease(below, Qt::LeftButton, {}, below->mapFrom(&window, corner));
        EXPECT_FALSE(held->isActive());
    }
    look(walk, u"05-staff"_s);
    for (const QString& typed : {u"1111"_s, u"2222"_s, u"3333"_s, u"4444"_s, u"2468"_s}) {
        EXPECT_FALSE(walk.control(u"Image1(4)"_s).isVisible());
        for (const QChar digit : typed)
            window.findChild<QAbstractButton*>(u"staffDigit(%1)"_s.arg(digit))->click();
        look(walk, u"05-staff-typed"_s);
        window.findChild<QAbstractButton*>(u"staffEnter"_s)->click();
        walk.settle();
    }
    EXPECT_TRUE(walk.program().state().staff);
    EXPECT_TRUE(QTest::qWaitFor([&] { return walk.control(u"Image1(4)"_s).isVisible(); }, 5000));
    walk.program().chain().goToStart();
    walk.settle(100);
    EXPECT_FALSE(walk.program().state().staff || walk.control(u"Image3"_s).isVisible());
}

INSTANTIATE_TEST_SUITE_P(Screens, KioskLook, PageLook::screens(), PageLook::nameOf);

} // namespace
} // namespace lumora
