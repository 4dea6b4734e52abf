#include "PageLook.h"

#include "finished/orders/MoogMeret.h"
#include "finished/pieces/SpltForm.h"
#include "imaging/files/PictureFile.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "views/window/ScreenDialogs.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Finished orders of a busy week, the last two of one day and the very last in pieces.
QString makeOrders(Walk& walk) {
    QString last;
    for (int number = 98; number <= 106; ++number) {
        last = u"2026_11_%1_KUP_1234^%2"_s.arg(number - 80).arg(number) + (number == 106 ? u"P"_s : QString());
        const DrivePath folder = WorkspacePaths::orders(walk.program().state()) / last;
        if (number != 104) // its preparation did not come to the end
            walk.write(folder / (last + u".txt"_s), "\"Shemot.n1\",\"Dana Levi\"\r\n\"Shemot.n2\",\"03-1234567\"\r\n");
        walk.write(folder / u"!106_1234.jpp", *encodeJpeg(Bitmap(640, 480, Qt::cyan), 90));
        for (int i = 0; i < 9; ++i)
            walk.write(folder / u"0%1 1015GNB000%2_0%3AABB.jpp"_s.arg(i % 3 + 1).arg(i).arg(i), "print");
        for (int i = 1; i <= 3 && number == 106; ++i)
            walk.write(folder / u"02a_jpp_00%1_003.prk"_s.arg(i), "piece");
    }
    return last;
}

class FinishedOrdersLook : public PageLook {};

} // namespace

TEST_P(FinishedOrdersLook, AreSentAgainAndWalkOutByMail) {
    // Nobody listens at this port.
    Walk walk(GetParam(), u"[Switches]\nSplitPage = yes\n[Mail]\nServer = 127.0.0.1\nPort = 9\nTls = none\n"
                          "From = kiosk@example.com\nTo = lab@example.com\n"_s);
    walk.toMenu();
    walk.press(u"nnn"_s, u"Image1(4)"_s, u"MoogMeret"_s);
    look(walk, u"60-no-orders"_s);
    const QString pieces = makeOrders(walk);
    pressAndLook(walk, u"MoogMeret"_s, u"Command5"_s, u"61-orders"_s);
    auto& page = walk.page<MoogMeret>(PageId::MoogMeret);
    const QString whole = page.controls().List3.item(page.controls().List3.count() - 2);
    walk.choose(u"MoogMeret"_s, u"List3"_s, whole);
    look(walk, u"62-picked"_s);
    EXPECT_EQ(page.files().markedCount(), 10);
    ASSERT_TRUE(ControlFinder(walk.program().window()).drag(u"MoogMeret"_s, u"Picture1"_s, {80, 80}, {10, 10}).ok());
    EXPECT_GT(page.controls().HScroll1.value, 0);
    EXPECT_GT(page.controls().VScroll1.value, 0);
    walk.press(u"MoogMeret"_s, u"Command21"_s);
    walk.choose(u"MoogMeret"_s, u"File1"_s, page.controls().File1.item(2));
    walk.choose(u"MoogMeret"_s, u"File1"_s, page.controls().File1.item(3));
    EXPECT_EQ(page.files().markedCount(), 2);
    look(walk, u"63-two-marked"_s);

    pressAndLook(walk, u"MoogMeret"_s, u"Command2"_s, u"64-walk"_s);
    EXPECT_FALSE(walk.pressable(u"MoogMeret"_s, u"Command18"_s));
    pressAndLook(walk, u"MoogMeret"_s, u"Command19"_s, u"65-walk-ended"_s);
    EXPECT_EQ(page.walk().fate(0), PackageWalk::Fate::Failed);
    walk.press(u"MoogMeret"_s, u"Command4Orders"_s);
    // The operator's page leads back to the orders.
    walk.press(u"MoogMeret"_s, u"Command4Pieces"_s, u"SpltForm"_s);
    walk.program().chain().unload(PageId::SpltForm);
    walk.waitFor(u"MoogMeret"_s);

    walk.choose(u"MoogMeret"_s, u"List3"_s, pieces);
    EXPECT_EQ(page.files().markedCount(), 4);
    look(walk, u"66-in-pieces"_s);
    walk.press(u"MoogMeret"_s, u"Command4"_s, u"FtpFrm"_s);
}

// An order folder is cut, a piece is lost, and what is left is joined: by pressing what the operator sees.
TEST_P(FinishedOrdersLook, AreCutIntoPiecesAndJoinedAgain) {
    Walk walk(GetParam(), u"[Switches]\nSplitPage = yes\n"_s);
    const Files& files = walk.program().platform().files;
    const DrivePath order = u"C:\\2000lumora\\!!000\\2026_11_21_KUP_1234^105"_path;
    for (int i = 1; i <= 6; ++i)
        walk.write(order / u"0%1 1015GNB000%1_03AABB.jpp"_s.arg(i), QByteArray(i * 270000, 'x'));
    walk.write(order / u"2026_11_21_KUP_1234^105.txt", "the order");

    walk.program().chain().show(PageId::MoogMeret);
    walk.waitFor(u"MoogMeret"_s);
    walk.press(u"MoogMeret"_s, u"Command4Pieces"_s, u"SpltForm"_s);
    look(walk, u"70-pieces-start"_s);
    lookAtPicker(walk, u"SpltForm"_s, u"Command2"_s, u"71-pieces-picker"_s);
    walk.pick(u"SpltForm"_s, u"Command2"_s, order / u"2026_11_21_KUP_1234^105.txt");
    look(walk, u"72-pieces-to-cut"_s);
    pressAndLook(walk, u"SpltForm"_s, u"Command3"_s, u"73-pieces-cut"_s);
    walk.type(u"SpltForm"_s, u"Text2"_s, u"none"_s);
    pressAndLook(walk, u"SpltForm"_s, u"Command3"_s, u"74-pieces-wrong-size"_s);
    walk.program().dialogs().closeMessages();

    const DrivePath pieces = order / u"meforakim";
    ASSERT_TRUE(files.removeFile(pieces / u"02 1015GNB0002_03AABB_jpp_001_002.prk").ok());
    walk.pick(u"SpltForm"_s, u"Command8"_s, pieces / u"01 1015GNB0001_03AABB_jpp_001_001.prk");
    auto& page = walk.page<SpltForm>(PageId::SpltForm);
    ASSERT_EQ(page.controls().List4Bodedim.count(), 6);
    walk.choose(u"SpltForm"_s, u"List4Bodedim"_s, page.controls().List4Bodedim.item(2));
    walk.choose(u"SpltForm"_s, u"ListChalakim"_s, page.controls().ListChalakim.item(3));
    walk.press(u"SpltForm"_s, u"Command6"_s);
    EXPECT_EQ(page.controls().List4Bodedim.currentIndex(), 2);
    EXPECT_EQ(page.controls().Label8.text,
              QString::number(*files.size(DrivePath(page.controls().ListChalakim.item(3)))));
    look(walk, u"75-pieces-families"_s);
    bool seen = false;
    QObject::connect(&page, &Page::changed, [&] {
        if (seen || page.phase() != SpltForm::Phase::Working || page.percent() < 40)
            return;
        seen = true;
        look(walk, u"76-pieces-busy"_s);
        EXPECT_TRUE(walk.pressable(u"SpltForm"_s, u"Command15"_s));
    });
    walk.press(u"SpltForm"_s, u"Command1"_s);
    EXPECT_TRUE(seen);
    look(walk, u"77-pieces-joined"_s);
    EXPECT_EQ(files.names(pieces / u"moorkavim", u"*"_s).size(), 5);
    walk.press(u"SpltForm"_s, u"Image3"_s, u"MoogMeret"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, FinishedOrdersLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
