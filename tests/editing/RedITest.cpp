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
#include <functional>
#include <map>
#include <tuple>

namespace lumora {
namespace {

constexpr QRgb skin = qRgb(180, 140, 120);
constexpr QRgb pupil = qRgb(210, 42, 58);
const DrivePath undoCopy = u"C:\\2000lumora\\zmany\\tempred\\000.bmp"_path;
const DrivePath correctedCopy = u"C:\\2000lumora\\zmany\\tempred\\C;]pics]eyes.jpg"_path;

// Two pupils of 9 pixels, and one at the very corner.
constexpr QPoint leftEye{60, 50};
constexpr QPoint rightEye{140, 50};

using Pixels = std::map<std::pair<int, int>, QRgb>;

// Skin with a red pupil, a catch-light and shades between.
Bitmap eye() {
    const Pixels marks = {{{4, 4}, qRgb(210, 42, 58)}, {{2, 6}, qRgb(210, 42, 58)}, {{0, 0}, qRgb(120, 44, 36)},
                          {{5, 4}, qRgb(110, 60, 60)}, {{3, 4}, qRgb(110, 62, 58)}, {{4, 5}, qRgb(110, 70, 58)},
                          {{4, 3}, qRgb(120, 76, 66)}, {{3, 3}, qRgb(60, 50, 50)},  {{5, 5}, qRgb(250, 250, 250)}};
    Bitmap picture(9, 9, QColor(180, 140, 120));
    for (const auto& [at, colour] : marks)
        picture.image().setPixel(at.first, at.second, colour);
    return picture;
}

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
        state.edit.PicturePath = u"C:\\pics\\eyes.jpg"_path;
        ASSERT_TRUE(picture.image().save(toText(host(state.edit.PicturePath)), "PNG"));
        original = picture.image();
        customersFile = read(state.edit.PicturePath);
    }

    RedI& open() {
        auto& page = chain.load<RedI>();
        page.open(state.edit.PicturePath);
        return page;
    }
    // In the record.
    QString redMarker() const {
        return state.edit.EditState.mid(EditRecord::RedMarker.position - 1, EditRecord::RedMarker.width);
    }
    bool isOpen() const { return chain.find(PageId::RedI) != nullptr; }

    static void pick(RedI& page, QPoint at) {
        page.Picture1_MouseDown(RedI::Button::Left, at);
        page.Picture1_MouseUp(at);
    }
    static void setSize(RedI& page, int size) {
        while (page.sight().circle().width() != size) {
            page.sight().circle().width() < size ? page.Image11_MouseDown() : page.Image10_MouseDown();
            page.Timer1_Tick();
            page.Size_MouseUp();
        }
    }
    static const QImage& image(const RedI& page) { return page.picture().Picture1.image(); }
    static void correctAt(RedI& page, QPoint at) {
        pick(page, at);
        page.Image2_Click();
    }
    QImage pictureIn(const DrivePath& path) const {
        const Result<Bitmap> picture = loadPicture(host(path));
        return picture ? picture->image().convertToFormat(QImage::Format_RGB32) : QImage();
    }

    QImage original;
    QByteArray customersFile;
};

TEST_F(RedEyePage, GreysMorePixelsTheDeeperTheLevelThatTheMenuSays) {
    save(eye());
    RedI& page = open();
    pick(page, {4, 4});
    setSize(page, 9);
    const std::map<std::pair<int, int>, int> basic = {{{4, 4}, 80}, {{2, 6}, 80}, {{0, 0}, 60}, {{5, 4}, 71}};
    auto further = basic;
    further.insert({{{3, 4}, 72}, {{4, 5}, 78}});
    auto deepest = further;
    deepest.insert({{{4, 3}, 85}, {{3, 3}, 52}});
    for (const auto& [press, greys] :
         {std::pair(&RedI::Image2_Click, basic), std::pair(&RedI::Bsisi_Click, basic),
          std::pair(&RedI::amok2_Click, further), std::pair(&RedI::amok5_Click, deepest)}) {
        QImage wanted = original;
        for (const auto& [at, grey] : greys)
            wanted.setPixel(at.first, at.second, qRgb(grey, grey, grey));
        page.kofez_Open();
        (page.*press)();
        EXPECT_EQ(image(page), wanted) << greys.size();
        EXPECT_EQ(page.controls().List1.count(), std::ssize(greys));
        EXPECT_EQ(page.controls().List1.item(1), u"2^6"_s) << "column by column";
        EXPECT_EQ(page.picture().RedFixLevel, 0);
        page.kofez_Close();
        page.Image5_Click();
        EXPECT_EQ(image(page), original) << greys.size();
    }
    EXPECT_EQ(page.controls().Label25.text + page.controls().Label30.text + page.controls().Label31.text, u"3202404"_s);
}

TEST_F(RedEyePage, EachFurtherPressGoesTenDeeperUntilAnotherEyeIsPicked) {
    RedI& page = open();
    page.Image2_Click();
    EXPECT_FALSE(page.picture().RedChanged) << "no circle, no correction";
    pick(page, leftEye);
    for (const int level : {10, 20, 30}) {
        level < 30 ? page.Image16_Click() : page.amok_Click();
        EXPECT_EQ(page.controls().Label37.text, QString::number(level));
    }
    EXPECT_EQ(page.controls().Label43.text, QString::number(page.controls().List2.count()));
    pick(page, rightEye);
    EXPECT_EQ(page.picture().RedFixLevel, 0);
    page.HScroll1_Change(3);
    EXPECT_EQ(page.picture().RedFixLevel, 30);
}

TEST_F(RedEyePage, WritesNothingWithoutACorrection) {
    const std::function<void(RedI&)> visits[] = {
        [](RedI& page) { page.Image8_Click(); },
        [](RedI& page) {
            correctAt(page, leftEye);
            page.Image9_Click();
        },
        [](RedI& page) {
            correctAt(page, leftEye);
            page.Image7_Click();
            page.Image8_Click();
        },
    };
    for (const auto& visit : visits) {
        visit(open());
        EXPECT_FALSE(isOpen());
        EXPECT_EQ(state.edit.RedMarker, u"000"_s);
        EXPECT_FALSE(machine.files.fileExists(correctedCopy));
        EXPECT_EQ(machine.files.fileExists(undoCopy), &visit != visits) << "a look leaves no undo copy";
    }
}

TEST_F(RedEyePage, AcceptsIntoAFileOfItsOwn) {
    auto& editor = chain.load<tFrmNew>();
    editor.Command17_Click();
    editor.Image2_Click(7);
    ASSERT_TRUE(isOpen());
    auto& page = *chain.find<RedI>();
    correctAt(page, leftEye);
    correctAt(page, rightEye);
    const QImage corrected = image(page);
    std::filesystem::create_directory(host(correctedCopy)); // stands where the file belongs
    page.Image8_Click();
    ASSERT_TRUE(isOpen());
    EXPECT_EQ(state.edit.RedMarker, u"000"_s);
    EXPECT_TRUE(machine.dialogs.messages.value(machine.dialogs.messages.size() - 1).contains(u"eyes.jpg"_s));
    EXPECT_EQ(image(page), corrected);
    EXPECT_FALSE(page.controls().busy);

    std::filesystem::remove(host(correctedCopy));
    page.Image8_Click();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(redMarker(), u"RED"_s);
    EXPECT_TRUE(machine.files.folderExists(u"C:\\2000lumora\\zmany\\job_folder\\red_folder"_path));
    EXPECT_EQ(read(correctedCopy).left(2), "BM");
    EXPECT_EQ(pictureIn(correctedCopy), corrected);
    EXPECT_EQ(read(state.edit.PicturePath), customersFile);
}

TEST_F(RedEyePage, CarefullyGoesOnFromTheCorrectionAndGivesItUpByRestoring) {
    for (const bool careful : {false, true}) {
        SCOPED_TRACE(careful);
        state.Careful = careful;
        UnpackEditState(EditRecord::newPicture(), state.edit);
        auto& editor = chain.load<tFrmNew>();
        editor.Command17_Click();
        const QImage uncorrected = editor.controls().PicPic.image();
        RedI& nothing = open();
        correctAt(nothing, {100, 120}); // skin alone
        nothing.Image8_Click();
        EXPECT_EQ(state.edit.RedMarker, careful ? u"000"_s : u"RED"_s);
        state.edit.RedMarker = u"000"_s;

        RedI& first = open();
        correctAt(first, leftEye);
        const QImage corrected = image(first);
        first.Image8_Click();
        EXPECT_EQ(editor.controls().PicPic.image() != uncorrected, careful);

        RedI& second = open();
        EXPECT_EQ(image(second), careful ? corrected : original);
        EXPECT_EQ(second.controls().Image5.enabled, careful);
        correctAt(second, rightEye);
        second.Image8_Click();
        EXPECT_EQ(pictureIn(correctedCopy).pixel(leftEye) == corrected.pixel(leftEye), careful);

        RedI& third = open();
        third.Image5_Click();
        EXPECT_EQ(image(third), original);
        third.Image8_Click();
        EXPECT_EQ(redMarker(), careful ? u"000"_s : u"RED"_s);
        EXPECT_EQ(machine.files.fileExists(correctedCopy), !careful);
        EXPECT_EQ(editor.controls().PicPic.image(), uncorrected);
    }
}

TEST_F(RedEyePage, KeepsThePictureBeforeTheLatestCorrectionOfThisVisitAsItsUndoCopy) {
    std::filesystem::create_directories(host(undoCopy).parent_path());
    ASSERT_TRUE(QImage(200, 150, QImage::Format_RGB32).save(toText(host(undoCopy)), "BMP"));
    RedI& page = open();
    EXPECT_FALSE(page.controls().Image7.enabled);
    page.Image7_Click();
    EXPECT_EQ(image(page), original) << "the copy is of another visit";
    correctAt(page, leftEye);
    const QImage first = image(page);
    EXPECT_EQ(pictureIn(undoCopy), original);
    correctAt(page, rightEye);
    page.Image6_Click(); // darkened along with the correction that it belongs to
    EXPECT_EQ(pictureIn(undoCopy), first);
    EXPECT_NE(image(page), first);

    page.Image7_Click();
    EXPECT_EQ(image(page), first);
    EXPECT_TRUE(page.picture().RedChanged);
    page.Image7_Click(); // one step and no more
    EXPECT_EQ(image(page), first);
    page.Image6_Click(); // what was taken back is not darkened
    EXPECT_EQ(image(page), first);

    page.Rstor_Click();
    EXPECT_EQ(image(page), original);
    EXPECT_FALSE(page.picture().RedChanged);
    page.Image7_Click();
    EXPECT_EQ(image(page), first);
    EXPECT_TRUE(page.picture().RedChanged);
    correctAt(page, QPoint(1, 1));
    EXPECT_EQ(pictureIn(undoCopy), first);
}

TEST_F(RedEyePage, DoesNotCorrectWhatItCouldNotTakeBack) {
    RedI& page = open();
    pick(page, leftEye);
    std::filesystem::remove_all(host(undoCopy).parent_path());
    std::ofstream(host(u"C:\\2000lumora\\zmany\\tempred"_s)) << "in the way";
    page.Image2_Click();
    EXPECT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_EQ(image(page), original);
    EXPECT_FALSE(page.picture().RedChanged);
    EXPECT_TRUE(page.controls().Image2.enabled);
    std::filesystem::remove(host(u"C:\\2000lumora\\zmany\\tempred"_s));
    page.Image2_Click(); // the whole copy is written now, while the page waits
    EXPECT_FALSE(page.controls().Label4Busy.visible);
    EXPECT_TRUE(page.controls().Image2.enabled);
    EXPECT_TRUE(page.picture().RedChanged);
    EXPECT_EQ(pictureIn(undoCopy), original);
}

TEST_F(RedEyePage, WorksAtTheSmallestSizeAtTheEdgeAndPartlyOutside) {
    for (const auto& [at, size] :
         {std::pair(leftEye, 4), {QPoint(0, 0), 40}, {QPoint(199, 149), 31}, {QPoint(100, 75), 200}}) {
        SCOPED_TRACE(size);
        RedI& page = open();
        pick(page, at);
        setSize(page, size);
        page.amok5_Click();
        page.Image6_Click();
        for (int y = 0; y < original.height(); ++y) {
            for (int x = 0; x < original.width(); ++x) {
                const bool red = original.pixel(x, y) == pupil && page.sight().circle().contains(x, y);
                ASSERT_TRUE(red || image(page).pixel(x, y) == original.pixel(x, y)) << x << ',' << y;
            }
        }
        page.Image5_Click();
        page.Command3_Click(); // by hand, round the middle
        EXPECT_TRUE(at != leftEye || RedEye::redness(image(page).pixel(leftEye)) < 20);
        page.Image7_Click();
        page.Image5_Click();
        EXPECT_EQ(image(page), original);
        page.Image9_Click();
    }
}

TEST_F(RedEyePage, DarkensTheCorrectedPixelsByFiveAndForgetsThemAtANewPickOrSize) {
    RedI& page = open();
    pick(page, leftEye);
    setSize(page, 20);
    page.Image2_Click();
    ASSERT_EQ(page.controls().List1.count(), 81);
    const QRgb grey = image(page).pixel(leftEye);
    page.Image6_Click();
    EXPECT_EQ(page.controls().List2.count(), 81);
    EXPECT_EQ(qRed(image(page).pixel(leftEye)), qRed(grey) - 5);
    EXPECT_EQ(image(page).pixel(leftEye + QPoint(7, 0)), skin);
    for (const bool other : {false, true}) {
        other ? pick(page, rightEye) : setSize(page, 21);
        EXPECT_TRUE(page.controls().List1.isEmpty() && page.controls().List2.isEmpty());
        EXPECT_FALSE(page.controls().Image6.enabled);
        page.Image2_Click();
    }
}

TEST(RedEyeSight, KeepsTheCircleInThePictureAndThePictureInSight) {
    RedEyeSight sight;
    for (const auto& [picture, circle, magnification] :
         {std::tuple(PictureSize{200, 150}, 12, 4), {{2400, 1800}, 24, 2}, {{9000, 6000}, 80, 1}}) {
        sight = {};
        sight.open(picture);
        EXPECT_EQ(sight.circleSize, circle);
        EXPECT_EQ(sight.Magnification, magnification);
        EXPECT_EQ(sight.middle(), QPointF(picture.width / 2, picture.height / 2));
    }
    sight = {};
    const auto corner = [&] { return QPointF(sight.Picture1Left, sight.Picture1Top); };
    sight.open({200, 150});
    sight.place({60, 50});
    sight.bringToCentre(sight.centre());
    sight.moveCircle(2, -2);
    EXPECT_EQ(corner(), QPointF(500 - 62 * 4, 400 - 48 * 4)) << "in sight as before";
    sight.moveCircle(-300, 900);
    EXPECT_EQ(sight.centre(), QPoint(0, 149));
    sight.movePicture({2000, -2000});
    EXPECT_EQ(corner(), QPointF(500, 400 - 150 * 4));
    EXPECT_FALSE(sight.magnify(8, {0, 0}));
    EXPECT_TRUE(sight.magnify(2, {100, 75}));
    EXPECT_EQ(corner(), QPointF(300, 250));
    sight.resizeCircle(5000);
    EXPECT_EQ(sight.circleSize, 200) << "the longer side";
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
    const QImage before = page.picture().Picture3.image();
    page.Image2_Click();
    EXPECT_NE(page.picture().Picture3.image(), before);
    EXPECT_EQ(
        page.picture().Picture3.image(),
        RedOverview::draw(page.picture().Picture1, {page.picture().Picture3.width(), page.picture().Picture3.height()})
            .image());
    page.Image7_Click();
    EXPECT_EQ(page.picture().Picture3.image(), before);
}

TEST_F(RedEyePage, TellsAPictureThatCannotBeOpenedAndCloses) {
    ASSERT_TRUE(machine.files.writeWhole(u"C:\\pics\\broken.jpg"_path, "\xFF\xD8\xFF\xE0 broken"));
    for (const char* path : {"C:\\pics\\broken.jpg", "C:\\pics\\missing.jpg", "", "Q:\\a.jpg"}) {
        machine.dialogs.messages.clear();
        chain.load<RedI>().open(DrivePath(QString::fromLatin1(path)));
        EXPECT_FALSE(isOpen()) << path;
        EXPECT_EQ(machine.dialogs.messages.size(), 1) << path;
    }
}

TEST(RedEye, PassesOverWhatLiesOutsideAndFindsNoPeakWithoutRed) {
    Bitmap picture(3, 3, QColor(7, 5, 200));
    RedEye::darken(picture, {1, 1, 2, 2}, {u"0^0"_s, u"5^5"_s});
    EXPECT_EQ(picture.image().pixel(1, 1), qRgb(2, 5, 195)) << "down to five";
    EXPECT_EQ(picture.image().pixel(0, 0), qRgb(7, 5, 200));
    const RedEye::Peak peak = RedEye::findPeak(Bitmap(20, 20, QColor(90, 90, 90)), {30, 5});
    EXPECT_EQ(QPoint(peak.x, peak.y), QPoint(30, 5));
    EXPECT_DOUBLE_EQ(peak.ratio(), 0.0);
}

} // namespace
} // namespace lumora
