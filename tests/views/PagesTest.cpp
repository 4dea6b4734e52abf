#include "PageLook.h"

#include "assembly/edited/B3.h"
#include "entry/details/nnn.h"
#include "order/EditRecord.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "views/window/ScreenDialogs.h"

#include <QTest>
#include <QTimer>

namespace lumora {

using namespace Qt::StringLiterals;

TEST_P(PageLook, FromTheStartToTheTerms) {
    Walk walk(GetParam());
    look(walk, u"01-start"_s);
    walk.toMenu();
    look(walk, u"02-menu"_s);
    if (walk.pressable(u"nnn"_s, u"Command14"_s)) {
        pressAndLook(walk, u"nnn"_s, u"Command14"_s, u"03-clean"_s);
        walk.press(u"nnn"_s, u"Command9"_s);
    }
    walk.press(u"nnn"_s, u"Command15"_s, u"Havharot"_s);
    look(walk, u"04-notice"_s);
    walk.press(u"Havharot"_s, u"Command1"_s, u"nnn"_s);
    pressAndLook(walk, u"nnn"_s, u"Image1(0)"_s, u"05-details"_s);
    pressAndLook(walk, u"nnn"_s, u"Command10"_s, u"06-message"_s);
    walk.program().dialogs().closeMessages();
    walk.toOptions();
    look(walk, u"07-options"_s);
    walk.toBorder();
    look(walk, u"08-border"_s);
    walk.toTerms();
    look(walk, u"09-terms"_s);
    pressAndLook(walk, u"nnn"_s, u"Command3"_s, u"09-terms-not-agreed"_s);
    walk.program().dialogs().closeMessages();
}

TEST_P(PageLook, FromThePicturesToTheSending) {
    Walk walk(GetParam(), u"[Switches]\nCoupon = no\n"_s);
    walk.toDetails();
    walk.toOptions();
    walk.toBorder();
    walk.toTerms();
    walk.toPictures();
    look(walk, u"10-no-pictures"_s);
    lookAtPicker(walk, u"kyoskNew"_s, u"Image5"_s, u"11-picker"_s);
    walk.choosePictures();
    look(walk, u"12-pictures"_s);
    walk.press(u"kyoskNew"_s, u"Picture2"_s, u"Form3"_s);
    look(walk, u"12-upright"_s);
    pressAndLook(walk, u"Form3"_s, u"Command1"_s, u"12-turned"_s);
    walk.press(u"Form3"_s, u"Command3"_s, u"kyoskNew"_s);
    pressAndLook(walk, u"kyoskNew"_s, u"Image6"_s, u"13-help"_s);
    walk.press(u"kyoskNew"_s, u"helpClose"_s);
    pressAndLook(walk, u"kyoskNew"_s, u"Image10"_s, u"14-leave"_s);
    walk.press(u"kyoskNew"_s, u"Command4"_s);
    walk.toClosing();
    look(walk, u"15-closing"_s);
    walk.press(u"kyoskNew"_s, u"Command7"_s, u"FtpFrm"_s);
    walk.settle(200);
    look(walk, u"17-countdown"_s);
}

TEST_P(PageLook, TheWholeFolderAndTheShopsOfACoupon) {
    Walk walk(
        GetParam(),
        u"[Switches]\nCoupon = yes\nDeepCompression = ask\nFitPage = yes\n[Branches]\n"
        "Branch1 = Haifa\nBranch1Name = Haifa Carmel\nBranch1Address1 = 5 Herzl Street\nBranch1Phone = 04-5550000\n"
        "Branch2 = Eilat\nBranch3 = Tel Aviv\nBranch4 = Jerusalem\nBranch5 = Beer Sheva\n"_s);
    walk.toMenu();
    walk.press(u"nnn"_s, u"Image1(2)"_s);
    walk.toOptions();
    const auto& sizes = walk.page<nnn>(PageId::nnn).controls().Combo1.rows;
    walk.choose(u"nnn"_s, u"Combo1"_s, sizes.item(sizes.lastIndex()));
    walk.press(u"nnn"_s, u"Option3(0)"_s);
    walk.toTerms();
    look(walk, u"23-fit"_s);
    walk.press(u"nnn"_s, u"Option5"_s);
    walk.toPictures();
    walk.pick(u"kyoskNew"_s, u"Image5"_s);
    look(walk, u"23-whole-folder"_s);
    walk.press(u"kyoskNew"_s, u"Command24"_s);
    walk.program().state().coupon.MisparKoopon = 14;
    walk.program().state().coupon.HaKoopon = 1;
    pressAndLook(walk, u"kyoskNew"_s, u"Image7"_s, u"24-panel-in-front"_s);
    pressAndLook(walk, u"kyoskNew"_s, u"Command21"_s, u"24-branches"_s);
    pressAndLook(walk, u"kyoskNew"_s, u"Command4Snif(10)"_s, u"24-closing-coupon"_s);
}

TEST_P(PageLook, ThePreparationOfAnEditedOrder) {
    Walk walk(GetParam());
    SessionState& state = walk.program().state();
    state.Optint = OrderKind::EditedPrint;
    state.shemot.ppr = u"10/15"_s;
    state.shemot.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
    walk.program().chain().show(PageId::Form2);
    look(walk, u"25-plain-to-prepare"_s);
    const QString code = u"1 1015GNB"_s + EditRecord::newPicture() + walk.pictureFolder().text();
    state.handOver.lines = {code + u"\\missing picture.jpg"_s};
    for (int i = 1; i <= 12; ++i)
        state.handOver.lines += code + u"\\IMG_00%1.jpg"_s.arg(i, 2, 10, QChar(u'0'));
    // An order whose folder can't be made waits for a second press.
    const Files& files = walk.program().platform().files;
    const DrivePath orders = WorkspacePaths::orders(state);
    ASSERT_TRUE(files.makeFolder(orders.folder()).ok() && files.writeWhole(orders, "no folder").ok());
    state.handOver.basket = state.handOver.lines;
    walk.program().chain().show(PageId::B3);
    auto& page = walk.page<B3>(PageId::B3);
    page.Command5_Click();
    walk.program().dialogs().closeMessages();
    ASSERT_TRUE(files.removeFile(orders).ok());
    look(walk, u"25-to-prepare"_s);
    // In the middle of the work: the timer ticks while the page lets the screen update.
    QTimer middle;
    bool looked = false;
    QObject::connect(&middle, &QTimer::timeout, &middle, [&] {
        if (page.controls().Label17.text.toInt() < 5)
            return;
        middle.stop();
        looked = true;
        look(walk, u"26-preparing-edited"_s);
    });
    middle.start(0);
    page.Command5_Click();
    EXPECT_TRUE(looked);
    walk.waitFor(u"FtpFrm"_s);
    look(walk, u"27-left-out"_s);
    walk.press(u"FtpFrm"_s, u"Command4Bli"_s);
    look(walk, u"27-left-out-told"_s);
}

TEST_P(PageLook, TheAlbumFromThePhotographerToTheClosingPanel) {
    Walk walk(GetParam(), u"[Switches]\nCoupon = no\nDeepCompression = always\n"_s);
    walk.toMenu();
    walk.press(u"nnn"_s, u"Image1(6)"_s);
    const auto lookAtRest = [&](const QString& name) {
        const AlbumControls& album = walk.page<nnn>(PageId::nnn).album().controls();
        EXPECT_TRUE(QTest::qWaitFor([&] { return album.panelShift + album.parentsShift == 0; }, 60000));
        look(walk, name);
    };
    int box = 0;
    for (const QString& text : {u"Studio Or"_s, u"03-7654321"_s, u"Wedding"_s, u"studio"_s})
        walk.type(u"nnn"_s, u"Text1(%1)"_s.arg(box++), text);
    walk.choose(u"nnn"_s, u"Combo4Mail"_s, u"gmail.com"_s);
    lookAtRest(u"40-album-photographer"_s);
    walk.press(u"nnn"_s, u"Command17"_s);
    lookAtRest(u"41-album-kinds"_s);
    walk.press(u"nnn"_s, u"SoogAlb(4)"_s);
    walk.tick(u"nnn"_s, u"Check4"_s);
    walk.press(u"nnn"_s, u"Command27"_s);
    walk.choose(u"nnn"_s, u"Combo4Horim"_s, u"30/60"_s);
    lookAtRest(u"42-album-parents"_s);
    walk.press(u"nnn"_s, u"Command16"_s);
    walk.choose(u"nnn"_s, u"Combo4Godel"_s, u"30/60"_s);
    lookAtRest(u"43-album-size"_s);
    walk.press(u"nnn"_s, u"Command18"_s);
    walk.press(u"nnn"_s, u"Combo4Cricha(1)"_s);
    lookAtRest(u"44-album-cover"_s);
    walk.key(Qt::Key_Escape);
    EXPECT_EQ(walk.page<nnn>(PageId::nnn).album().panel(), AlbumPanels::Panel::Size) << "Esc goes one panel back";
    walk.press(u"nnn"_s, u"Command18"_s);
    walk.press(u"nnn"_s, u"Command19"_s);
    walk.press(u"nnn"_s, u"Combo4Niyar(2)"_s);
    lookAtRest(u"45-album-paper"_s);
    walk.press(u"nnn"_s, u"Command20"_s);
    walk.press(u"nnn"_s, u"Combo4Tosefet(1)"_s);
    walk.tick(u"nnn"_s, u"Check3(2)"_s);
    lookAtRest(u"46-album-extras"_s);
    walk.press(u"nnn"_s, u"Command21"_s);
    walk.tick(u"nnn"_s, u"Check6"_s);
    lookAtRest(u"47-album-bill"_s);
    walk.press(u"nnn"_s, u"Command22"_s, u"kyoskNew"_s);
    walk.pick(u"kyoskNew"_s, u"Image5"_s);
    EXPECT_TRUE(walk.pressable(u"kyoskNew"_s, u"Image13"_s));
    look(walk, u"48-album-pictures"_s);
    walk.press(u"kyoskNew"_s, u"Command24"_s);
    pressAndLook(walk, u"kyoskNew"_s, u"Image7"_s, u"49-album-closing"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, PageLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
