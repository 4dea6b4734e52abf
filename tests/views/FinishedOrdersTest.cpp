#include "PageLook.h"

#include "finished/orders/MoogMeret.h"
#include "imaging/files/PictureFile.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "views/window/ScreenDialogs.h"

#include <QPainter>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Finished orders of a busy week, the last two of one day and the very last in pieces.
QString makeOrders(Walk& walk) {
    const Files& files = walk.program().platform().files;
    const DrivePath orders = WorkspacePaths::orders(walk.program().state());
    EXPECT_TRUE(files.makeFolder(WorkspacePaths::root(walk.program().state())).ok());
    EXPECT_TRUE(files.makeFolder(orders).ok());
    QString last;
    for (int number = 98; number <= 106; ++number) {
        last = u"2026_11_%1_KUP_1234^%2"_s.arg(number - 80).arg(number) + (number == 106 ? u"P"_s : QString());
        const DrivePath folder = orders / last;
        EXPECT_TRUE(files.makeFolder(folder).ok());
        const auto write = [&](const QString& name, const QByteArray& bytes) {
            EXPECT_TRUE(files.writeWhole(folder / name, bytes).ok());
        };
        write(last + u".txt"_s, "\"Shemot.n1\",\"Dana Levi\"\r\n\"Shemot.n2\",\"03-1234567\"\r\n");
        Bitmap sheet(640, 480, Qt::white);
        QPainter painter(&sheet.image());
        for (int i = 0; i < 12; ++i)
            painter.fillRect(30 + i % 4 * 150, 120 + i / 4 * 110, 120, 80, QColor::fromHsv(i * 30, 120, 200));
        painter.end();
        EXPECT_TRUE(saveJpeg(sheet, *files.drives().toHost(folder / u"!106_1234.jpp"), 90).ok());
        for (int i = 0; i < 9; ++i)
            write(u"0%1 1015GNB000%2_0%3AABB.jpp"_s.arg(i % 3 + 1).arg(i).arg(i), "print");
        for (int i = 1; i <= 3 && number == 106; ++i)
            write(u"02a_jpp_00%1_003.prk"_s.arg(i), "piece");
    }
    return last;
}

class FinishedOrdersLook : public PageLook {};

} // namespace

TEST_P(FinishedOrdersLook, AreSentAgainAndWalkOutByMail) {
    Walk walk(GetParam(), u"[Switches]\nSplitPage = yes\n"_s);
    walk.toMenu();
    walk.press(u"nnn"_s, u"Image1(4)"_s);
    walk.waitFor(u"MoogMeret"_s);
    // Nobody listens at this port.
    MailAccount& mail = walk.program().state().profile.mail;
    mail.host = u"127.0.0.1"_s;
    mail.port = 9;
    mail.from = u"kiosk@example.com"_s;
    mail.to = u"lab@example.com"_s;
    mail.encryption = MailEncryption::None;
    look(walk, u"60-no-orders"_s);
    const QString pieces = makeOrders(walk);
    walk.press(u"MoogMeret"_s, u"Command5"_s);
    look(walk, u"61-orders"_s);
    const ControlFinder finder(walk.program().window());
    auto& page = walk.page<MoogMeret>(PageId::MoogMeret);
    const QString whole = page.controls().List3.item(page.controls().List3.count() - 2);
    ASSERT_TRUE(finder.choose(u"MoogMeret"_s, u"List3"_s, whole).ok());
    look(walk, u"62-picked"_s);
    EXPECT_EQ(page.files().markedCount(), 10);
    ASSERT_TRUE(finder.drag(u"MoogMeret"_s, u"Picture1"_s, {80, 80}, {10, 10}).ok());
    EXPECT_GT(page.controls().HScroll1.value, 0);
    EXPECT_GT(page.controls().VScroll1.value, 0);
    walk.press(u"MoogMeret"_s, u"Command21"_s);
    ASSERT_TRUE(finder.choose(u"MoogMeret"_s, u"File1"_s, page.controls().File1.item(2)).ok());
    ASSERT_TRUE(finder.choose(u"MoogMeret"_s, u"File1"_s, page.controls().File1.item(3)).ok());
    EXPECT_EQ(page.files().markedCount(), 2);
    look(walk, u"63-two-marked"_s);

    walk.press(u"MoogMeret"_s, u"Command2"_s);
    look(walk, u"64-walk"_s);
    EXPECT_FALSE(walk.pressable(u"MoogMeret"_s, u"Command18"_s));
    walk.press(u"MoogMeret"_s, u"Command19"_s);
    look(walk, u"65-walk-ended"_s);
    EXPECT_EQ(page.walk().fate(0), PackageWalk::Fate::Failed);
    walk.press(u"MoogMeret"_s, u"Command4Orders"_s);
    // The operator's page leads back to the orders.
    walk.press(u"MoogMeret"_s, u"Command4Pieces"_s);
    walk.waitFor(u"SpltForm"_s);
    walk.program().chain().unload(PageId::SpltForm);
    walk.waitFor(u"MoogMeret"_s);

    ASSERT_TRUE(finder.choose(u"MoogMeret"_s, u"List3"_s, pieces).ok());
    EXPECT_EQ(page.files().markedCount(), 4);
    look(walk, u"66-in-pieces"_s);
    walk.press(u"MoogMeret"_s, u"Command4"_s);
    walk.waitFor(u"FtpFrm"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, FinishedOrdersLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
