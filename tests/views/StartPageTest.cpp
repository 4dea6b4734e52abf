#include "PageLook.h"

#include "app/DesktopShell.h"
#include "imaging/files/PictureFile.h"
#include "order/OrderState.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "start/hatchala.h"
#include "support/TestPlatform.h"
#include "views/window/MainWindow.h"
#include "views/window/PageView.h"

#include <QApplication>
#include <QTest>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

hatchala& startPage(Walk& walk) {
    return walk.page<hatchala>(PageId::hatchala);
}

// A mouse that goes onto the control, or off it.
void mouseGoes(Walk& walk, const QString& name, bool onto) {
    QEnterEvent enter(QPointF(5, 5), QPointF(5, 5), QPointF(5, 5));
    QEvent leave(QEvent::Leave);
    QApplication::sendEvent(&walk.control(name), onto ? static_cast<QEvent*>(&enter) : &leave);
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

class StartLook : public PageLook {};

} // namespace

TEST_P(StartLook, HasNoFaultInAnyOfItsStates) {
    Walk walk(Screen{GetParam().size, false, GetParam().contrast}, u"[Switches]\nDeliveryQuestion = yes\n"_s);
    // An advertising picture that the lab's installation has placed.
    const HostPath folder =
        *walk.program().platform().files.drives().toHost(walk.program().state().DiskRoot / u"lumora\\zmany");
    std::filesystem::create_directories(folder);
    ASSERT_TRUE(saveJpeg(Bitmap(400, 300, Qt::cyan), folder / "ad01.jpg", 90).ok());
    walk.program().chain().unload(PageId::hatchala);
    walk.settle();
    hatchala& page = startPage(walk);
    if (GetParam().english)
        walk.press(u"hatchala"_s, u"Check1"_s);
    for (const QString& name : {u"Image11"_s, u"Image6"_s}) {
        mouseGoes(walk, name, true);
        look(walk, u"01-start-help-"_s + name);
        mouseGoes(walk, name, false);
    }
    look(walk, u"01-start-advert"_s);
    EXPECT_TRUE(QTest::qWaitFor([&] { return page.motion().Picture4Width() < StartMotion::pictureWidth / 2; }, 60000));
    look(walk, u"01-start-advert-closing"_s);

    // The panel of the shops unfolds, closes and answers.
    const auto unfold = [&] {
        walk.press(u"hatchala"_s, u"Image1"_s);
        EXPECT_TRUE(QTest::qWaitFor([&] { return !page.timers().Timer3.running(); }, 60000));
        EXPECT_EQ(page.motion().Picture1Width(), StartMotion::panelWidth);
    };
    unfold();
    look(walk, u"01-start-shops"_s);
    walk.press(u"hatchala"_s, u"shopsBack"_s);
    look(walk, u"01-start"_s);
    unfold();
    for (const Qt::Key key : {Qt::Key_Down, Qt::Key_Down, Qt::Key_Return})
        walk.key(key);
    walk.waitFor(u"nnn"_s);
    EXPECT_TRUE(walk.pressable(u"nnn"_s, u"Image1(0)"_s)) << "Enter presses nothing on the next page";
    EXPECT_EQ(walk.program().state().KodMishloach, u"OSK");
}

TEST_P(StartLook, OffersAnOrderThatWasNotFinished) {
    Walk walk(GetParam(), u"[Kiosk]\nWaiting = yes\n"_s);
    SessionState& state = walk.program().state();
    for (const QString& number : {u"103"_s, u"104"_s, u"105"_s, u"106"_s}) {
        const OrderFolder folder(WorkspacePaths::orders(state) / (u"2026_11_21_KUP_1234^"_s + number));
        std::filesystem::create_directories(*walk.program().platform().files.drives().toHost(folder.path()));
        OrderState order;
        order.number = number;
        if (number < u"105"_s) { // sent by itself, and not offered
            order.phase = OrderState::Phase::Sending;
            walk.write(folder.filePath(u"021015GNB0000_03AABB.jpp"_s), "print");
        }
        order.kind = OrderKind::Print;
        order.items = {u"1 1015GNBC:\\pics\\one.jpg"_s, u"1 1015GNBC:\\pics\\two.jpg"_s};
        order.choices = {{u"Shemot.n2"_s, u"03-1234567"_s}};
        ASSERT_TRUE(WriteOrderState(walk.program().platform().files, folder, order));
    }
    PageChain& chain = walk.program().chain();
    chain.unload(PageId::hatchala);
    walk.settle();
    startPage(walk).Check1_Click(GetParam().english);
    look(walk, u"01-start-unfinished"_s);
    state.kiosk.on = true;
    chain.setAllTexts();
    go(walk, u":01-start-digits Command4Sifra(1) Command4Mehak Command4Sifra(2) Command4Sifra(3) Command4Sifra(4) "
             u":01-start-digits-wrong Command4Sifra(5) Command4Sifra(6) Command4Sifra(7)"_s);
    walk.press(u"hatchala"_s, u"Command4Hemshech"_s);
    look(walk, u"01-start-unfinished-gone"_s);
    walk.press(u"hatchala"_s, u"Command4Achar"_s);
    walk.press(u"hatchala"_s, u"Command4Achar"_s);
    EXPECT_TRUE(walk.control(u"Label4Mamtinot"_s).isVisible());
    look(walk, u"01-start-waiting"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, StartLook, PageLook::screens(), PageLook::nameOf);

TEST(DesktopShell, TellsOfEachPageThatNothingShows) {
    TestPlatform machine;
    QFile opener(machine.folder.filePath(u"xdg-open"_s));
    ASSERT_TRUE(opener.open(QIODevice::WriteOnly));
    opener.write("#!/bin/sh\ncase $1 in *seen*) exit 0 ;; esac\nexit 3\n");
    opener.close();
    opener.setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    const QByteArray path = qgetenv("PATH");
    qputenv("PATH", machine.folder.path().toLocal8Bit() + ':' + path);
    DesktopShell shell(machine.drives);
    QStringList told;
    const auto tell = [&](const QString& what) { return [&told, what] { told += what; }; };
    shell.openWebPage(u"http://seen.example/"_s, tell(u"seen"_s));
    shell.openWebPage({}, tell(u"none"_s));
    shell.openFolder(u"X:\\orders"_path, tell(u"no drive"_s));
    shell.openFolder(u"C:\\orders"_path, tell(u"folder"_s));
    EXPECT_TRUE(QTest::qWaitFor([&] { return told.size() == 3; }, 20000));
    shell.mayOpen = [] { return false; };
    shell.openWebPage(u"http://seen.example/"_s, tell(u"closed"_s));
    EXPECT_EQ(told, QStringList({"none", "no drive", "folder", "closed"}));
    qputenv("PATH", path);
}

TEST(StartPage, HelpsAMouseAFingerAndTheKeyboard) {
    Walk walk({1024, 768});
    const auto shown = [&] {
        QString numbers;
        for (int i = 1; i < 6; ++i) {
            if (walk.control(u"Image12(%1)"_s.arg(i)).isVisible())
                numbers += QString::number(i);
        }
        return numbers;
    };
    for (const bool english : {false, true}) {
        if (english)
            walk.press(u"hatchala"_s, u"Check1"_s);
        mouseGoes(walk, u"Image11"_s, true);
        QFocusEvent focusGoes(QEvent::FocusOut);
        QApplication::sendEvent(&walk.control(u"Image5"_s), &focusGoes);
        walk.settle();
        EXPECT_EQ(shown(), u"2"_s);
        EXPECT_EQ(walk.control(u"Picture3"_s).isVisible(), !english);
        mouseGoes(walk, u"Image11"_s, false);
        EXPECT_EQ(shown(), QString());
    }
    // A finger that touches the lab's telephone, then the bare page.
    QTest::mousePress(&walk.control(u"Image6"_s), Qt::LeftButton);
    walk.settle();
    EXPECT_EQ(shown(), u"5"_s);
    QTest::mousePress(walk.program().window().frontView(), Qt::LeftButton, {}, {500, 100});
    walk.settle();
    EXPECT_EQ(shown(), QString());
    // The keyboard that walks on.
    walk.control(u"Image5"_s).setFocus(Qt::TabFocusReason);
    walk.settle();
    EXPECT_EQ(shown(), u"3"_s);
}

TEST(StartPage, ItsMotionsPaintNothingButThemselves) {
    Walk walk({1024, 768});
    hatchala& page = startPage(walk);
    walk.settle(100);
    int renderings = 0;
    QObject::connect(&page, &Page::changed, [&] { ++renderings; });
    Paints arrow;
    Paints words;
    walk.control(u"Label8"_s).installEventFilter(&arrow);
    walk.control(u"Title"_s).installEventFilter(&words);
    const int top = page.motion().Label8Top();
    walk.settle(400);
    EXPECT_NE(page.motion().Label8Top(), top);
    EXPECT_GT(arrow.count, 3);
    EXPECT_EQ(words.count, 0);
    EXPECT_EQ(renderings, 0);
}

} // namespace lumora
