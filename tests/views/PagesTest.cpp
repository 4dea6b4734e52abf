#include "PageLook.h"

#include "assembly/edited/B3.h"
#include "entry/details/nnn.h"
#include "order/EditRecord.h"
#include "platform/Instances.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/Workspace.h"
#include "views/kit/Theme.h"
#include "views/window/DoubledPress.h"
#include "views/window/MainWindow.h"
#include "views/window/ScreenDialogs.h"

#include <QDesktopServices>
#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>
#include <QTextBrowser>
#include <QTimer>

#include <algorithm>
#include <cmath>

namespace lumora {

TEST(CarefulProgram, HoldsItsDataFolderAlone) {
    Walk walk(QSize(1280, 800), u"[Guards]\nCareful = yes\n"_s);
    const HostPath data = walk.program().platform().files.drives().dataFolder();
    EXPECT_TRUE(Instances(data, Instances::Lock::Shared).refused()) << "two programs would write one order";
}

TEST(Words, KeepTheDirectionOfCodesAndLoseTheBlanksAtTheEndsOfLines) {
    // "<" and ">" stand for the signs that set a part apart.
    for (const auto& [text, shown] :
         {std::pair(u" יש שאלה? \nנשמח לעזור\t", u"יש שאלה?\nנשמח לעזור"),
          {u"הזמנה 2026_11_21_KUP_1234^105 נשלחה.", u"הזמנה <2026_11_21_KUP_1234^105> נשלחה."},
          {u"שלב 3 / 12, מ-10/15 ו-052-7654321.", u"שלב <3 / 12>, מ-<10/15> ו-<052-7654321>."},
          {u"מס' 105   26.11.2026", u"מס' <105>   <26.11.2026>"},
          {u"הקובץ Version 2.0 (3) נשמר", u"הקובץ <Version 2.0 (3)> נשמר"},
          {u"נשלחו 3, 4, 5 (מתוך 12)", u"נשלחו <3>, <4>, <5> (מתוך <12>)"},
          {u"אל lab@example.com: C:\\תמונות\\a b.jpg", u"אל <lab@example.com>: <C:\\תמונות\\a b.jpg>"},
          {u"Press OK, then Send", u"Press OK, then Send"}}) {
        QString once = isolated(QString::fromUtf16(text));
        EXPECT_EQ(isolated(once), once);
        EXPECT_EQ(once.replace(QChar(0x2066), u'<').replace(QChar(0x2069), u'>').toStdString(),
                  QString::fromUtf16(shown).toStdString());
    }
}

// WCAG 2's contrast of two colours.
static double contrastOf(const QColor& one, const QColor& other) {
    const auto luminance = [](const QColor& colour) {
        const auto linear = [](double part) {
            return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
        };
        return 0.2126 * linear(colour.redF()) + 0.7152 * linear(colour.greenF()) + 0.0722 * linear(colour.blueF());
    };
    const auto [darker, lighter] = std::minmax({luminance(one), luminance(other)});
    return (lighter + 0.05) / (darker + 0.05);
}

TEST(ContrastLook, KeepsEachTextAtSevenToOneAndEachEdgeAtThree) {
    using C = Theme::Colour;
    Theme::setLook(Theme::Look::Contrast);
    for (const QColor& ground : {C::Paper, C::Surface, C::Sunken, C::PrimarySoft, C::SunSoft, C::DangerSoft,
                                 C::GoodSoft, C::SkySoft, C::VioletSoft, C::Here}) {
        for (const QColor& text : {C::Ink, C::Muted, C::Primary, C::PrimaryDark, C::Danger, C::Good})
            EXPECT_GE(contrastOf(text, ground), 7) << qPrintable(text.name() + u" on "_s + ground.name());
        for (const QColor& edge : {C::Line, C::Edge, C::SunEdge, C::Focus})
            EXPECT_GE(contrastOf(edge, ground), 3) << qPrintable(edge.name() + u" on "_s + ground.name());
    }
    for (const QColor& ground : {C::Primary, C::PrimaryDark, C::Ink, C::Danger, C::Good})
        EXPECT_GE(contrastOf(Qt::white, ground), 7) << qPrintable(ground.name());
    EXPECT_GE(contrastOf(C::Ink, C::Sun), 7);
    EXPECT_GE(contrastOf(C::Ink, C::Marker), 7);
    Theme::setLook(Theme::Look::Calm);
}

TEST_P(PageLook, HasNoFaultFromTheStartToTheTerms) {
    Walk walk(GetParam(), u"[Guards]\nCareful = yes\n"_s);
    EXPECT_EQ(Theme::Colour::Ink == Qt::black, GetParam().contrast);
    go(walk, u":01-start "_s + toMenu + u":02-menu Command14 :03-clean Command9 Command15>Havharot :04-notice "_s);
    go(walk, u"Command1>nnn Image1(0) :05-details Command10 :06-message ! Text2=Dana Text3=+1-212-555-01234"_s);
    lookAtPicker(walk, u"nnn"_s, u"Command12"_s, u"06-long-telephone"_s, u"messageNo"_s);
    go(walk, toOptions + u":07-options "_s);
    go(walk, toBorder + u":08-border "_s + toTerms + u":09-terms Command3 :09-terms-not-agreed !"_s);
}

TEST_P(PageLook, HasNoFaultFromThePicturesToTheSending) {
    Walk walk(GetParam(), u"[Switches]\nCoupon = no\n[Guards]\nCareful = yes\n"_s);
    go(walk, toDetails + toOptions + toBorder + toTerms + toPictures + u":10-no-pictures"_s);
    lookAtPicker(walk, u"kyoskNew"_s, u"Image5"_s, u"11-picker"_s);
    walk.pick(u"kyoskNew"_s, u"Image5"_s);
    EXPECT_EQ(focusName(), u"Picture1(0)"_s);
    go(walk, u"Picture1(0) Picture1(1) Picture1(4) Command12(1) :12-pictures changeDetails>nnn :12-change Command4 "
             ":12-change-details Command12 Command8 Command6 :12-changed Command3>kyoskNew Picture2>Form3 :12-upright "
             "Command1 "
             ":12-turned Command3>kyoskNew Image6 :13-help helpClose Image10 :14-leave Command4 Image7 :15-closing "
             "Text1=dana Command8 :15-domain-wanted ! :15-domain Command7>FtpFrm"_s);
    walk.settle(200);
    look(walk, u"17-countdown"_s);
}

TEST_P(PageLook, HasNoFaultWithAWholeFolderAndTheShopsOfACoupon) {
    Walk walk(
        GetParam(),
        u"[Switches]\nCoupon = yes\nDeepCompression = ask\nFitPage = yes\n[Paper]\nQuickSizes = 10/15, 13/18, "
        u"20/30\n[Branches]\n"
        "Branch1 = Haifa\nBranch1Name = Haifa Carmel\nBranch1Address1 = 5 Herzl Street\nBranch1Phone = 04-5550000\n"
        "Branch2 = Eilat\nBranch3 = Tel Aviv\nBranch4 = Jerusalem\nBranch5 = Beer Sheva\n[Guards]\nCareful = yes\n[Door]\nFormats = all\n"_s);
    walk.write(walk.pictureFolder() / u"A film of summer.heic", "no picture, and left out of the whole folder");
    walk.program().state().coupon.HaKoopon = 1;
    go(walk, toMenu + u"Image1(2) "_s + toOptions);
    const auto& sizes = walk.page<nnn>(PageId::nnn).controls().Combo1.rows;
    walk.choose(u"nnn"_s, u"Combo1"_s, sizes.item(sizes.lastIndex()));
    go(walk, u":23-no-coupon ! Option3(0) "_s + toTerms + u":23-fit Option4 "_s + toPictures);
    walk.pick(u"kyoskNew"_s, u"Image5"_s);
    go(walk, u":23-whole-folder Command24 Picture1(2) :23-fitted"_s);
    walk.program().state().coupon.MisparKoopon = 15;
    go(walk, u"Image7 :24-coupon-refuses !"_s);
    walk.program().state().coupon.MisparKoopon = 14;
    go(walk, u"Image7 :24-panel-in-front Command21 :24-branches Command4Snif(10) :24-closing-coupon "
             "! showCoarse :24-coarse"_s);
}

TEST_P(PageLook, HasNoFaultWhileAnEditedOrderIsPrepared) {
    Walk walk(GetParam());
    SessionState& state = walk.program().state();
    state.Optint = OrderKind::EditedPrint;
    state.shemot.ppr = u"10/15"_s;
    state.shemot.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
    walk.program().chain().show(PageId::Form2);
    look(walk, u"25-plain-to-prepare"_s);
    const QString code = u"1 1015GNB"_s + EditRecord::newPicture() + walk.pictureFolder().text();
    for (int i = 1; i <= 9; ++i)
        state.handOver.lines += code + u"\\missing picture%1.jpg"_s.arg(i);
    walk.write(walk.pictureFolder() / u"missing picture2.jpg", "no picture");
    for (int i = 1; i <= 12; ++i)
        state.handOver.lines += code + u"\\IMG_00%1.jpg"_s.arg(i, 2, 10, QChar(u'0'));
    // An order whose folder can't be made waits for a second press.
    const Files& files = walk.program().platform().files;
    const DrivePath orders = WorkspacePaths::orders(state);
    ASSERT_TRUE(files.makeFolder(orders.folder()).ok() && files.writeWhole(orders, "no folder").ok());
    state.handOver.basket = state.handOver.lines;
    walk.program().chain().show(PageId::B3);
    auto& page = walk.page<B3>(PageId::B3);
    walk.press(u"B3"_s, u"Command5"_s);
    ASSERT_TRUE(files.removeFile(orders).ok());
    go(walk, u"! :25-to-prepare"_s);
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
    walk.press(u"B3"_s, u"Command5"_s);
    EXPECT_TRUE(looked);
    walk.waitFor(u"FtpFrm"_s);
    look(walk, u"27-left-out"_s);
    walk.press(u"FtpFrm"_s, u"Command4Bli"_s);
    look(walk, u"27-left-out-told"_s);
}

TEST_P(PageLook, HasNoFaultFromThePhotographerOfAnAlbumToTheClosingPanel) {
    Walk walk(GetParam(), u"[Switches]\nCoupon = no\nDeepCompression = always\n"_s);
    // The panels slide to their places before they are looked at.
    const auto goOn = [&](const QString& route) {
        walk.go(route, [&](const QString& name) {
            const AlbumControls& album = walk.page<nnn>(PageId::nnn).album().controls();
            EXPECT_TRUE(QTest::qWaitFor([&] { return album.panelShift + album.parentsShift == 0; }, 60000));
            look(walk, name);
        });
    };
    goOn(toMenu + u"Image1(6) Text1(0)=Studio_Or Text1(1)=03-7654321 Text1(2)=Wedding Text1(3)=studio "
                  "Combo4Mail~gmail.com :40-album-photographer Command17 :41-album-kinds SoogAlb(4) Check4+ Command27 "
                  "Combo4Horim~30/60 :42-album-parents Command16 Combo4Godel~30/60 :43-album-size Command18 "
                  "Combo4Cricha(1) :44-album-cover"_s);
    goOn(u"Command19 Combo4Niyar(2) :45-album-paper Command20 Combo4Tosefet(1) Check3(2)+ :46-album-extras "
         "Command21 Check6+ :47-album-bill Command22>kyoskNew"_s);
    walk.pick(u"kyoskNew"_s, u"Image5"_s);
    go(walk, u":48-album-pictures Command24 Image7 :49-album-closing"_s);
}

class LabTextLook : public PageLook {};

// Of a terms.html beside a picture, which names things outside of its folder too.
TEST_P(LabTextLook, OpensInsideTheProgramAndLeadsNowhere) {
    const QTemporaryDir lab;
    ASSERT_TRUE(QDir(lab.path()).mkdir(u"texts"_s));
    const auto write = [&](const QString& name, const QString& text) {
        QFile file(lab.filePath(name));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly) && file.write(text.toUtf8()) > 0);
    };
    QImage picture(2000, 300, QImage::Format_RGB32);
    picture.fill(QColor(20, 110, 115));
    ASSERT_TRUE(picture.save(lab.filePath(u"texts/prints.png"_s)) && picture.save(lab.filePath(u"outside.png"_s)));
    const QString rest = u"<p><img src='prints.png'><img src='../outside.png'></p>"_s +
                         u"<p>Lumora 2026. 10/15, 13/18, 20/30.</p>"_s.repeated(30);
    write(u"texts/terms.html"_s,
          u"<h1>תנאי ההזמנה</h1><p>ההזמנה נשלחת <a href='http://lab.example/'>למעבדה</a>.</p>"_s + rest);
    write(u"texts/terms.en.html"_s,
          u"<h1>Terms</h1><p>The order goes <a href='http://lab.example/'>to the lab</a>.</p>"_s + rest);
    const QString terms = lab.filePath(u"texts/terms.html"_s);
    Walk walk(GetParam(),
              u"[Texts]\nTerms = %1\nPriceList = %1\nHelp = %2\n"_s.arg(terms, lab.filePath(u"gone.html"_s)));
    walk.go(u"Image11"_s);
    auto& text = dynamic_cast<QTextBrowser&>(walk.control(u"labText"_s));
    look(walk, u"16-text"_s);
    EXPECT_TRUE(text.toPlainText().startsWith(GetParam().english ? u"Terms"_s : u"תנאי"_s));
    EXPECT_LE(text.document()->idealWidth(), text.viewport()->width());
    EXPECT_TRUE(text.loadResource(QTextDocument::ImageResource, QUrl(u"../outside.png"_s)).value<QImage>().isNull());
    QTextBrowser desktop; // in the place of the desktop's browser
    QDesktopServices::setUrlHandler(u"http"_s, &desktop, "setSource");
    QPoint link;
    for (int y = 0; link.isNull() && y < text.viewport()->height(); y += 4) {
        for (int x = 0; link.isNull() && x < text.viewport()->width(); x += 4)
            link = text.anchorAt({x, y}).isEmpty() ? QPoint() : QPoint(x, y);
    }
    ASSERT_FALSE(link.isNull());
    const QString before = text.toPlainText();
    QTest::mouseClick(text.viewport(), Qt::LeftButton, {}, link);
    QDesktopServices::unsetUrlHandler(u"http"_s);
    EXPECT_TRUE(desktop.source().isEmpty());
    EXPECT_EQ(text.toPlainText(), before);
    const auto close = [&] {
        QTest::mouseClick(&walk.control(u"textClose"_s), Qt::LeftButton);
        walk.program().window().presses().rest();
    };
    close();
    walk.go(toDetails + toOptions + toBorder + toTerms + u"Command29"_s);
    EXPECT_TRUE(walk.control(u"textPanel"_s).isVisible());
    close();
    walk.go(toPictures + u"Image6"_s);
    EXPECT_FALSE(walk.program().dialogs().frontText().isEmpty()) << "the help can't be read";
}

INSTANTIATE_TEST_SUITE_P(Screens, LabTextLook, PageLook::screens(), PageLook::nameOf);

INSTANTIATE_TEST_SUITE_P(Screens, PageLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
