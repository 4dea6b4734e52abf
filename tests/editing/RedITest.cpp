#include "editing/redeye/RedI.h"

#include "editing/editor/BigPics.h"
#include "editing/editor/tFrmNew.h"
#include "editing/redeye/RedEye.h"
#include "editing/redeye/RedOverview.h"
#include "order/EditRecord.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

#include <QPainter>

#include <fstream>

namespace lumora {
namespace {

constexpr QRgb skin = qRgb(180, 140, 120);
constexpr QRgb pupil = qRgb(210, 42, 58);
const QString undoCopy = u"C:\\2000lumora\\zmany\\tempred\\000.bmp"_s;
const QString correctedCopy = u"C:\\2000lumora\\zmany\\tempred\\C;]pics]eyes.jpg"_s;

// Two pupils of 9 pixels, and one at the very corner.
constexpr QPoint leftEye{60, 50};
constexpr QPoint rightEye{140, 50};

class RedEyePage : public ::testing::Test, protected PageRig {
protected:
    RedEyePage() {
        registerPage<tFrmNew>(PageId::tFrmNew);
        registerPage<RedI>(PageId::RedI);
        chain.registerPage(PageId::BigPics, [] { return std::make_unique<BigPics>(); });
        makeFolder(u"C:\\pics"_s);
        Bitmap face(200, 150, QColor::fromRgb(skin));
        QPainter painter(&face.image());
        for (const QPoint eye : {leftEye, rightEye, QPoint(1, 1)})
            painter.fillRect(QRect(eye.x() - 4, eye.y() - 4, 9, 9), QColor::fromRgb(pupil));
        painter.end();
        save(face);
        UnpackEditState(EditRecord::newPicture(), state.edit);
    }

    // Without loss, whatever the name's ending says.
    void save(const Bitmap& picture) {
        state.edit.PicturePath = u"C:\\pics\\eyes.jpg"_s;
        ASSERT_TRUE(picture.image().save(toText(host(state.edit.PicturePath)), "PNG"));
        original = picture.image();
        customersFile = *machine.files.read(state.edit.PicturePath);
    }

    RedI& open() {
        auto& page = static_cast<RedI&>(chain.load(PageId::RedI));
        page.open(state.edit.PicturePath);
        return page;
    }
    bool isOpen() const { return chain.find(PageId::RedI) != nullptr; }

    static void pick(RedI& page, QPoint at) {
        page.Picture1_MouseDown(RedI::Button::Left, at);
        page.Picture1_MouseUp(at);
    }
    static void setSize(RedI& page, int size) {
        while (page.circle().width() != size) {
            page.circle().width() < size ? page.Image11_MouseDown() : page.Image10_MouseDown();
            page.Timer1_Tick();
            page.Size_MouseUp();
        }
    }
    static void correctAt(RedI& page, QPoint at) {
        pick(page, at);
        page.Image2_Click();
    }
    static bool isGrey(QRgb pixel) { return qRed(pixel) == qGreen(pixel) && qGreen(pixel) == qBlue(pixel); }
    QImage pictureIn(const QString& path) const {
        const Result<Bitmap> picture = loadPicture(host(path));
        return picture ? picture->image().convertToFormat(QImage::Format_RGB32) : QImage();
    }

    QImage original;
    QByteArray customersFile;
};

TEST_F(RedEyePage, GreysByLevelAsTheMenuSays) {
    Bitmap eye(9, 9, QColor::fromRgb(skin));
    const std::pair<QPoint, QRgb> marks[] = {{{4, 4}, pupil},
                                             {{2, 6}, pupil},
                                             {{0, 0}, qRgb(120, 44, 36)},
                                             {{5, 4}, qRgb(110, 60, 60)},
                                             {{3, 4}, qRgb(110, 62, 58)},
                                             {{4, 5}, qRgb(110, 70, 58)},
                                             {{4, 3}, qRgb(120, 76, 66)},
                                             {{3, 3}, qRgb(60, 50, 50)},
                                             {{5, 5}, qRgb(250, 250, 250)}};
    for (const auto& [at, colour] : marks)
        eye.image().setPixel(at, colour);
    save(eye);
    RedI& page = open();
    pick(page, {4, 4});
    setSize(page, 9);
    ASSERT_EQ(page.circle(), QRect(0, 0, 9, 9));
    struct Case {
        const char* name;
        void (RedI::*press)();
        int level;
    };
    for (const Case& wanted : {Case{"Image2", &RedI::Image2_Click, 0}, Case{"Bsisi", &RedI::Bsisi_Click, 0},
                               Case{"amok2", &RedI::amok2_Click, 15}, Case{"amok5", &RedI::amok5_Click, 65}}) {
        page.kofez_Open();
        (page.*wanted.press)();
        EXPECT_EQ(page.Label25.text + u' ' + page.Label30.text + u' ' + page.Label31.text, u"320 240 4"_s);
        EXPECT_EQ(page.RedFixLevel, 0);
        Bitmap expected(original.copy());
        EXPECT_EQ(page.List1.items(), RedEye::correct(expected, page.circle(), 4, wanted.level)) << wanted.name;
        EXPECT_EQ(page.Picture1.image(), expected.image()) << wanted.name;
        page.kofez_Close();
        page.Image5_Click();
        EXPECT_EQ(page.Picture1.image(), original) << wanted.name;
    }
}

TEST_F(RedEyePage, EachFurtherPressGoesTenDeeperUntilAnotherEyeIsPicked) {
    RedI& page = open();
    pick(page, leftEye);
    page.Image16_Click();
    page.Image16_Click();
    EXPECT_EQ(page.RedFixLevel, 20);
    EXPECT_EQ(page.Label37.text, u"20"_s);
    EXPECT_EQ(page.Label43.text, QString::number(page.List2.count()));
    page.amok_Click();
    EXPECT_EQ(page.RedFixLevel, 30);
    pick(page, rightEye);
    EXPECT_EQ(page.RedFixLevel, 0);
    page.HScroll1_Change(3);
    EXPECT_EQ(page.RedFixLevel, 30);
}

TEST_F(RedEyePage, WritesNothingWithoutACorrection) {
    const auto expectNothing = [this] {
        EXPECT_FALSE(isOpen());
        EXPECT_EQ(state.edit.RedMarker, u"000"_s);
        EXPECT_FALSE(machine.files.fileExists(correctedCopy));
    };
    RedI& looked = open();
    pick(looked, leftEye);
    looked.Image8_Click();
    expectNothing();
    EXPECT_TRUE(machine.files.names(u"C:\\2000lumora\\zmany\\tempred"_s, u"*"_s).isEmpty());

    RedI& left = open();
    correctAt(left, leftEye);
    left.Image9_Click();
    expectNothing();

    RedI& takenBack = open();
    correctAt(takenBack, leftEye);
    takenBack.Image7_Click();
    EXPECT_EQ(takenBack.Picture1.image(), original);
    takenBack.Image8_Click();
    expectNothing();
}

TEST_F(RedEyePage, AcceptsIntoAFileOfItsOwnAndTheNextVisitStartsFromTheCustomersFile) {
    auto& editor = static_cast<tFrmNew&>(chain.load(PageId::tFrmNew));
    editor.Command17_Click();
    editor.Image2_Click(7);
    ASSERT_TRUE(isOpen());
    auto& page = static_cast<RedI&>(*chain.front());
    EXPECT_EQ(page.caption, state.edit.PicturePath);
    correctAt(page, leftEye);
    correctAt(page, rightEye);
    const QImage corrected = page.Picture1.image();
    page.Image8_Click();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(state.edit.RedMarker, u"RED"_s);
    EXPECT_EQ(state.edit.EditState.mid(38, 3), u"RED"_s);
    EXPECT_TRUE(machine.files.folderExists(u"C:\\2000lumora\\zmany\\job_folder\\red_folder"_s));
    EXPECT_EQ(machine.files.read(correctedCopy)->left(2), "BM");
    EXPECT_EQ(pictureIn(correctedCopy), corrected);
    EXPECT_EQ(*machine.files.read(state.edit.PicturePath), customersFile);

    RedI& again = open();
    EXPECT_EQ(again.Picture1.image(), original);
    EXPECT_FALSE(again.RedChanged);
    correctAt(again, leftEye);
    const QImage replaced = again.Picture1.image();
    again.Image8_Click();
    EXPECT_EQ(pictureIn(correctedCopy), replaced);
}

TEST_F(RedEyePage, MarksThePictureOnlyWhenTheSaveSucceeded) {
    RedI& page = open();
    correctAt(page, leftEye);
    const QImage corrected = page.Picture1.image();
    // A folder stands where the file belongs.
    std::filesystem::create_directory(host(correctedCopy));
    page.Image8_Click();
    ASSERT_TRUE(isOpen());
    EXPECT_EQ(state.edit.RedMarker, u"000"_s);
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages[0].contains(u"eyes.jpg"_s));
    EXPECT_EQ(page.Picture1.image(), corrected);
    EXPECT_FALSE(page.busy);

    std::filesystem::remove(host(correctedCopy));
    page.Image8_Click();
    EXPECT_EQ(state.edit.RedMarker, u"RED"_s);
    EXPECT_EQ(pictureIn(correctedCopy), corrected);
}

TEST_F(RedEyePage, KeepsThePictureBeforeTheLatestCorrectionAsItsUndoCopy) {
    RedI& page = open();
    EXPECT_FALSE(machine.files.fileExists(undoCopy));
    correctAt(page, leftEye);
    const QImage first = page.Picture1.image();
    EXPECT_EQ(pictureIn(undoCopy), original);
    correctAt(page, rightEye);
    page.Image6_Click(); // darkened along with the correction that it belongs to
    EXPECT_EQ(pictureIn(undoCopy), first);
    EXPECT_NE(page.Picture1.image(), first);

    page.Image7_Click();
    EXPECT_EQ(page.Picture1.image(), first);
    EXPECT_TRUE(page.RedChanged);
    page.Image7_Click(); // one step and no more
    EXPECT_EQ(page.Picture1.image(), first);
    page.Image6_Click(); // what was taken back is not darkened
    EXPECT_EQ(page.Picture1.image(), first);

    page.Rstor_Click();
    EXPECT_EQ(page.Picture1.image(), original);
    EXPECT_FALSE(page.RedChanged);
    page.Image7_Click();
    EXPECT_EQ(page.Picture1.image(), first);
    EXPECT_TRUE(page.RedChanged);
    correctAt(page, QPoint(1, 1));
    EXPECT_EQ(pictureIn(undoCopy), first);
}

TEST_F(RedEyePage, NeverTakesBackToTheCopyOfAnotherVisit) {
    std::filesystem::create_directories(host(undoCopy).parent_path());
    ASSERT_TRUE(QImage(200, 150, QImage::Format_RGB32).save(toText(host(undoCopy)), "BMP"));
    const QByteArray others = *machine.files.read(undoCopy);
    RedI& page = open();
    EXPECT_FALSE(page.Image7.enabled);
    page.Image7_Click();
    EXPECT_EQ(page.Picture1.image(), original);
    page.Image9_Click();
    EXPECT_EQ(*machine.files.read(undoCopy), others);

    RedI& corrected = open();
    correctAt(corrected, leftEye);
    EXPECT_TRUE(corrected.Image7.enabled);
    EXPECT_EQ(pictureIn(undoCopy), original);
}

TEST_F(RedEyePage, DoesNotCorrectWhatItCouldNotTakeBack) {
    RedI& page = open();
    pick(page, leftEye);
    std::filesystem::remove_all(host(undoCopy).parent_path());
    std::ofstream(host(u"C:\\2000lumora\\zmany\\tempred"_s)) << "in the way";
    page.Image2_Click();
    EXPECT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_EQ(page.Picture1.image(), original);
    EXPECT_FALSE(page.RedChanged);
    EXPECT_TRUE(page.Image2.enabled);
    std::filesystem::remove(host(u"C:\\2000lumora\\zmany\\tempred"_s));
    page.Image2_Click(); // the whole copy is written now, while the page waits
    EXPECT_FALSE(page.Label4Busy.visible);
    EXPECT_TRUE(page.Image2.enabled);
    EXPECT_TRUE(page.RedChanged);
    EXPECT_EQ(pictureIn(undoCopy), original);
}

TEST_F(RedEyePage, WorksAtTheSmallestSizeAtTheEdgeAndPartlyOutside) {
    struct Case {
        const char* name;
        QPoint at;
        int size;
    };
    for (const Case& circle : {Case{"smallest", leftEye, 4}, Case{"corner", {0, 0}, 40},
                               Case{"far corner", {199, 149}, 31}, Case{"larger than the picture", {100, 75}, 200}}) {
        RedI& page = open();
        pick(page, circle.at);
        setSize(page, circle.size);
        page.amok5_Click();
        page.Image6_Click();
        for (int y = 0; y < original.height(); ++y) {
            for (int x = 0; x < original.width(); ++x) {
                const QRgb now = page.Picture1.image().pixel(x, y);
                const bool red = original.pixel(x, y) == pupil;
                ASSERT_TRUE(now == original.pixel(x, y) || (red && page.circle().contains(x, y)))
                    << circle.name << ' ' << x << ',' << y;
            }
        }
        page.Command3_Click();
        page.Image1_MouseDown(RedI::Button::Right, QPointF(-3, 2));
        page.Image7_Click();
        page.Image5_Click();
        EXPECT_EQ(page.Picture1.image(), original) << circle.name;
        page.Image9_Click();
    }
    RedI& page = open();
    pick(page, leftEye);
    setSize(page, 5);
    page.Image10_MouseDown();
    page.Timer1_Tick();
    page.Timer1_Tick();
    EXPECT_EQ(page.circle().width(), RedI::smallestCircle);
}

TEST_F(RedEyePage, DarkensTheCorrectedPixelsByFiveAndForgetsThemAtANewPickOrSize) {
    RedI& page = open();
    pick(page, leftEye);
    setSize(page, 20);
    page.Image2_Click();
    ASSERT_EQ(page.List1.count(), 81);
    const QRgb grey = page.Picture1.image().pixel(leftEye);
    page.Image6_Click();
    EXPECT_EQ(page.List2.count(), 81);
    EXPECT_EQ(qRed(page.Picture1.image().pixel(leftEye)), qRed(grey) - 5);
    EXPECT_EQ(page.Picture1.image().pixel(leftEye + QPoint(7, 0)), skin);
    EXPECT_TRUE(page.Label45.visible);
    EXPECT_FALSE(page.Frame6.visible);
    EXPECT_TRUE(page.Timer7.running());
    EXPECT_EQ(page.Timer7.interval(), 4000);
    page.Timer7_Tick();
    EXPECT_FALSE(page.Label45.visible);
    for (int press = 0; press < 60; ++press)
        page.Frame6_Click();
    EXPECT_LE(qRed(page.Picture1.image().pixel(leftEye)), 5);

    setSize(page, 21);
    EXPECT_TRUE(page.List1.isEmpty());
    EXPECT_FALSE(page.Image6.enabled);
    page.Image2_Click();
    pick(page, rightEye);
    EXPECT_TRUE(page.List1.isEmpty() && page.List2.isEmpty());
}

TEST_F(RedEyePage, CorrectsByHandRoundTheMiddleOrThePoint) {
    for (const bool atPoint : {false, true}) {
        RedI& page = open();
        pick(page, leftEye);
        setSize(page, 24);
        if (atPoint)
            page.Image1_MouseDown(RedI::Button::Right, QPointF(12, 12));
        else
            page.Image1_MouseUp();
        EXPECT_TRUE(isGrey(page.Picture1.image().pixel(leftEye))) << atPoint;
        EXPECT_EQ(page.Picture1.image().pixel(rightEye), pupil);
        EXPECT_TRUE(page.RedChanged);
        EXPECT_EQ(pictureIn(undoCopy), original);
        page.Image7_Click();
        EXPECT_EQ(page.Picture1.image(), original);
        page.Image9_Click();
    }
}

TEST_F(RedEyePage, MovesTheCircleAndThePictureUnderIt) {
    RedI& page = open();
    EXPECT_FALSE(page.Image2.enabled);
    page.Image2_Click();
    EXPECT_FALSE(page.RedChanged); // no circle, no correction
    page.Picture3_Click({0.3, 1 / 3.0});
    EXPECT_EQ(QPoint(page.RedSearchX, page.RedSearchY), QPoint(60, 50));
    EXPECT_EQ(page.Picture1Left, 500 - 60 * page.Magnification);
    EXPECT_EQ(page.Picture1Top, 400 - 50 * page.Magnification);

    page.Image15_MouseDown();
    EXPECT_EQ(page.Timer5.interval(), 100);
    page.tickOnceIfNone();
    page.tickOnceIfNone(); // it has ticked by now
    page.Arrow_MouseUp();
    EXPECT_FALSE(page.Timer5.running());
    page.Timer5_Tick(); // one that was under way
    page.Image12_MouseDown();
    page.Timer2_Tick();
    EXPECT_EQ(QPoint(page.RedSearchX, page.RedSearchY), QPoint(62, 48));
    EXPECT_EQ(page.Picture1Left, 500 - 62 * page.Magnification); // it stays where it is in view
    page.Image14_MouseDown();
    for (int tick = 0; tick < 100; ++tick)
        page.Timer4_Tick();
    page.Arrow_MouseUp();
    EXPECT_EQ(page.RedSearchX, 0);

    const int size = page.circle().width();
    page.Combo1_Change(0);
    EXPECT_EQ(page.circle().width(), size + 2);
    EXPECT_EQ(page.Combo1.currentIndex(), 1);
    page.Combo1_Change(2);
    EXPECT_EQ(page.circle().width(), size);

    pick(page, {100, 75});
    page.Picture3_Click({0.5, 0.5});
    page.Picture1_MouseDown(RedI::Button::Left, {100, 75});
    page.Picture1_MouseMove({113, 75});
    const double left = page.Picture1Left;
    page.Picture1_MouseMove({126, 75});
    EXPECT_DOUBLE_EQ(page.Picture1Left - left, 2.0 * page.Magnification);
    page.Picture1_MouseUp({126, 75});
    EXPECT_EQ(page.RedSearchX, 100); // a drag picks nothing
}

TEST_F(RedEyePage, ShowsTheCorrectionInTheOverviewAsIfDrawnAnew) {
    Bitmap large(1733, 911, QColor::fromRgb(skin));
    for (int y = 300; y < 380; ++y)
        for (int x = 700; x < 780; ++x)
            large.image().setPixel(x, y, qRgb(150 + (x * 7 + y * 13) % 100, 30, 40));
    save(large);
    RedI& page = open();
    pick(page, {741, 339});
    setSize(page, 71);
    const QImage before = page.Picture3.image();
    page.Image2_Click();
    EXPECT_NE(page.Picture3.image(), before);
    EXPECT_EQ(page.Picture3.image(),
              RedOverview::draw(page.Picture1, {page.Picture3.width(), page.Picture3.height()}).image());
    page.Image7_Click();
    EXPECT_EQ(page.Picture3.image(), before);
}

TEST(RedEyeOverview, Is250WideOr300High) {
    struct Case {
        PictureSize picture, overview;
    };
    for (const Case& wanted :
         {Case{{4000, 3000}, {250, 188}}, Case{{3000, 4000}, {225, 300}}, Case{{1000, 1000}, {250, 250}},
          Case{{1000, 1080}, {250, 270}}, Case{{1, 60000}, {1, 300}}, Case{{60000, 1}, {250, 1}}})
        EXPECT_EQ(RedOverview::size(wanted.picture), wanted.overview)
            << wanted.picture.width << 'x' << wanted.picture.height;
}

TEST_F(RedEyePage, TellsAPictureThatCannotBeOpenedAndCloses) {
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\pics\\broken.jpg"_s, "\xFF\xD8\xFF\xE0 broken"));
    for (const char* path : {"C:\\pics\\broken.jpg", "C:\\pics\\missing.jpg", "", "Q:\\a.jpg"}) {
        machine.dialogs.messages.clear();
        static_cast<RedI&>(chain.load(PageId::RedI)).open(QString::fromLatin1(path));
        EXPECT_FALSE(isOpen()) << path;
        EXPECT_EQ(machine.dialogs.messages.size(), 1) << path;
    }
}

} // namespace
} // namespace lumora
