#include "PageLook.h"

#include "finished/orders/MoogMeret.h"
#include "finished/pieces/SpltForm.h"
#include "imaging/files/PictureFile.h"
#include "order/OrderState.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

namespace lumora {

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
        if (number == 101 || number == 103) {
            walk.write(folder / u"021015GNB0000_03AABB.jpp", "a print as the program names it");
            OrderState state;
            state.phase = OrderState::Phase::Sending;
            state.number = QString::number(number);
            state.tries = 108 - number;
            state.why = {u"אין תשובה מהשרת."_s, u"The server gives no answer."_s};
            walk.write(OrderFolder(folder).statePath(), state.write());
        }
        for (int i = 1; i <= 3 && number == 106; ++i)
            walk.write(folder / u"02a_jpp_00%1_003.prk"_s.arg(i), "piece");
    }
    return last;
}

class FinishedOrdersLook : public PageLook {};

} // namespace

TEST_P(FinishedOrdersLook, AreSentAgainAndWalkOutByMail) {
    // Nobody listens at this port.
    Walk walk(GetParam(),
              u"[Kiosk]\nWaiting = yes\n[Switches]\nSplitPage = yes\n[Mail]\nServer = 127.0.0.1\nPort = 9\nTls = none\n"
              "From = kiosk@example.com\nTo = lab@example.com\n"_s);
    go(walk, toMenu + u"Image1(4)>MoogMeret :60-no-orders"_s);
    const QString pieces = makeOrders(walk);
    go(walk, u"Command5 :61-orders"_s);
    auto& page = walk.page<MoogMeret>(PageId::MoogMeret);
    const QString whole = page.controls().List3.item(page.controls().List3.count() - 2);
    walk.choose(u"MoogMeret"_s, u"List3"_s, whole);
    look(walk, u"62-picked"_s);
    go(walk, u"Command21"_s);
    walk.choose(u"MoogMeret"_s, u"File1"_s, page.controls().File1.item(2));
    walk.choose(u"MoogMeret"_s, u"File1"_s, page.controls().File1.item(3));
    go(walk, u":63-two-marked Command2 :64-walk"_s);
    go(walk, u"Command19 :65-walk-ended"_s);
    EXPECT_EQ(page.walk().fate(0), PackageWalk::Fate::Failed);
    // The operator's page leads back to the orders.
    go(walk, u"Command4Orders Command4Pieces>SpltForm Image3>MoogMeret"_s);
    walk.choose(u"MoogMeret"_s, u"List3"_s, pieces);
    go(walk, u":66-in-pieces Command4>FtpFrm"_s);
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
    go(walk, u"Command4Pieces>SpltForm :70-pieces-start"_s);
    lookAtPicker(walk, u"SpltForm"_s, u"Command2"_s, u"71-pieces-picker"_s);
    walk.pick(u"SpltForm"_s, u"Command2"_s, order / u"2026_11_21_KUP_1234^105.txt");
    go(walk, u":72-pieces-to-cut Command3 :73-pieces-cut Text2=none Command3 :74-pieces-wrong-size !"_s);

    const DrivePath pieces = order / u"meforakim";
    ASSERT_TRUE(files.removeFile(pieces / u"02 1015GNB0002_03AABB_jpp_001_002.prk").ok());
    walk.pick(u"SpltForm"_s, u"Command8"_s, pieces / u"01 1015GNB0001_03AABB_jpp_001_001.prk");
    auto& page = walk.page<SpltForm>(PageId::SpltForm);
    ASSERT_EQ(page.controls().List4Bodedim.count(), 6);
    walk.choose(u"SpltForm"_s, u"List4Bodedim"_s, page.controls().List4Bodedim.item(2));
    walk.choose(u"SpltForm"_s, u"ListChalakim"_s, page.controls().ListChalakim.item(3));
    walk.press(u"SpltForm"_s, u"Command6"_s);
    EXPECT_EQ(page.controls().Label8.text,
              QString::number(*files.size(DrivePath(page.controls().ListChalakim.item(3)))));
    look(walk, u"75-pieces-families"_s);
    bool seen = false;
    QObject::connect(&page, &Page::changed, [&] {
        if (seen || page.phase() != SpltForm::Phase::Working || page.percent() < 40)
            return;
        seen = true;
        look(walk, u"76-pieces-busy"_s);
    });
    go(walk, u"Command1 :77-pieces-joined"_s);
    EXPECT_TRUE(seen);
    EXPECT_EQ(files.names(pieces / u"moorkavim", u"*"_s).size(), 5);
}

INSTANTIATE_TEST_SUITE_P(Screens, FinishedOrdersLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
