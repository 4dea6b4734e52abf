#include "PageLook.h"

#include "finished/pieces/SpltForm.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "views/window/MainWindow.h"
#include "views/window/ScreenDialogs.h"

#include <gtest/gtest.h>

#include <QTest>
#include <QTimer>

namespace lumora {

using namespace Qt::StringLiterals;

class PiecesLook : public PageLook {};

// An order folder is cut, a piece is lost, and what is left is joined: by pressing what the operator sees.
TEST_P(PiecesLook, ThePageOfPieces) {
    Walk walk(GetParam(), u"[Switches]\nSplitPage = yes\n"_s);
    EXPECT_TRUE(walk.program().state().SplitPage);
    const Files& files = walk.program().platform().files;
    const DrivePath order = u"C:\\2000lumora\\!!000\\2026_11_21_KUP_1234^105"_path;
    for (const DrivePath& folder : {order.folder().folder(), order.folder(), order})
        ASSERT_TRUE(files.makeFolder(folder).ok());
    for (int i = 1; i <= 6; ++i)
        ASSERT_TRUE(
            files.writeWhole(order / u"0%1 1015GNB000%1_03AABB.jpp"_s.arg(i), QByteArray(i * 270000, 'x')).ok());
    ASSERT_TRUE(files.writeWhole(order / u"2026_11_21_KUP_1234^105.txt", "the order").ok());

    walk.program().chain().show(PageId::MoogMeret);
    walk.waitFor(u"MoogMeret"_s);
    walk.press(u"MoogMeret"_s, u"Command4Pieces"_s);
    walk.waitFor(u"SpltForm"_s);
    look(walk, u"70-pieces-start"_s);
    QTimer::singleShot(400, &walk.program().window(), [&] {
        look(walk, u"71-pieces-picker"_s);
        QWidget* cancel = walk.program().window().findChild<QWidget*>(u"pickerCancel"_s);
        ASSERT_TRUE(cancel);
        QMetaObject::invokeMethod(cancel, "click");
    });
    walk.press(u"SpltForm"_s, u"Command2"_s);
    const auto pick = [&](const QString& button, const DrivePath& path) {
        walk.program().dialogs().nextPick = [path] { return path; };
        walk.press(u"SpltForm"_s, button);
    };
    pick(u"Command2"_s, order / u"2026_11_21_KUP_1234^105.txt");
    look(walk, u"72-pieces-to-cut"_s);
    walk.press(u"SpltForm"_s, u"Command3"_s);
    look(walk, u"73-pieces-cut"_s);
    walk.type(u"SpltForm"_s, u"Text2"_s, u"none"_s);
    walk.press(u"SpltForm"_s, u"Command3"_s);
    look(walk, u"74-pieces-wrong-size"_s);
    walk.program().dialogs().closeMessages();

    const DrivePath pieces = order / u"meforakim";
    ASSERT_TRUE(files.removeFile(pieces / u"02 1015GNB0002_03AABB_jpp_001_002.prk").ok());
    pick(u"Command8"_s, pieces / u"01 1015GNB0001_03AABB_jpp_001_001.prk");
    auto& page = walk.page<SpltForm>(PageId::SpltForm);
    ASSERT_EQ(page.controls().List4Bodedim.count(), 6);
    const ControlFinder finder(walk.program().window());
    ASSERT_TRUE(finder.choose(u"SpltForm"_s, u"List4Bodedim"_s, page.controls().List4Bodedim.item(2)).ok());
    ASSERT_TRUE(finder.choose(u"SpltForm"_s, u"ListChalakim"_s, page.controls().ListChalakim.item(3)).ok());
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
    walk.press(u"SpltForm"_s, u"Image3"_s);
    walk.waitFor(u"MoogMeret"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, PiecesLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
