#include "editing/editor/BigPics.h"
#include "editing/editor/Form3.h"
#include "imaging/files/PictureFile.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

// Left half and right half.
Bitmap halves(int width, int height, QColor left, QColor right) {
    Bitmap picture(width, height, left);
    for (int y = 0; y < height; ++y) {
        for (int x = width / 2; x < width; ++x)
            picture.image().setPixelColor(x, y, right);
    }
    return picture;
}

TEST(SampleColorLevels, SortsItsValuesAsTextsSoThatTheBrightestComeLast) {
    Bitmap row(11, 1, Qt::black);
    row.image().setPixelColor(0, 0, QColor(200, 0, 9));
    row.image().setPixelColor(5, 0, QColor(5, 0, 10));
    row.image().setPixelColor(10, 0, QColor(50, 0, 99));
    const SampleColorLevels samples(row, {0, 0, 10, 0});
    EXPECT_EQ(samples.lists()[0], QStringList({u"05"_s, u"050"_s, u"200"_s}));
    EXPECT_EQ(samples.lists()[2], QStringList({u"010"_s, u"09"_s, u"099"_s}));

    struct Case {
        int value;
        float top, gain, floor; // of a flat picture
    };
    for (const Case& c : {Case{0, 0.2F, 1275, 10}, Case{255, 255.2F, 0.99922F, 265}, Case{50, 50.2F, 5.07968F, 60}}) {
        const SampleColorLevels flat(Bitmap(60, 40, QColor(c.value, 50, 5)), {5, 5, 50, 30});
        EXPECT_EQ(flat.topLevels(), (ChannelValues{c.top, 50.2F, 5.2F}));
        EXPECT_NEAR(flat.gains()[0], c.gain, c.gain * 1e-5);
        EXPECT_EQ(flat.floors(10), (ChannelValues{c.floor, 60, 15}));
    }
}

class WorkSurfaces : public ::testing::Test, protected PageRig {
protected:
    WorkSurfaces() { registerPage<Form3>(PageId::Form3); }
    QString picture(const char* name, const Bitmap& bitmap) {
        const QString path = u"C:\\"_s + QString::fromLatin1(name);
        EXPECT_TRUE(bitmap.image().save(toText(host(path)), "BMP"));
        return path;
    }
    EditedPreview opened(const QString& path) {
        return *EditedPreview::open(host(path), {10, 15}, 100, EditedPreview::Tone::Colour);
    }

    BigPics surfaces;
};

TEST_F(WorkSurfaces, MeasureTheMiddleOfTheWorkPictureAndLeaveItAsItIs) {
    surfaces.open(opened(picture("wide.bmp", halves(1000, 500, QColor(20, 40, 60), QColor(220, 180, 140)))));
    const QImage before = surfaces.workPicture()->workPicture().image().copy();
    surfaces.Command2_Click();
    EXPECT_EQ(surfaces.controls().Picture2.image().size(), QSize(400, 200));
    EXPECT_EQ(surfaces.controls().Image_crop, QRect(50, 25, 300, 150));
    EXPECT_EQ(surfaces.controls().List1.item(0), u"020"_s);
    EXPECT_EQ(surfaces.controls().List3.item(surfaces.controls().List3.lastIndex()), u"140"_s);
    EXPECT_NEAR(surfaces.controls().levels.gains[0], 255 / 220.2, 1e-4);
    EXPECT_EQ(surfaces.controls().levels.floors, (ChannelValues{30, 50, 70}));
    EXPECT_EQ(surfaces.workPicture()->workPicture().image(), before);
}

TEST_F(WorkSurfaces, APictureToLookAtTurnsByQuartersAndIsReadAgain) {
    auto& look = chain.load<Form3>();
    const QString path = picture("look.bmp", halves(1000, 500, Qt::red, Qt::blue));
    look.open(DrivePath(path));
    // Red lies left, on top, right, below: a quarter turn clockwise each time, and upright again after four.
    struct Case {
        int angle;
        PictureSize box;
        double redX, redY;
    };
    for (const Case& c :
         {Case{0, {700, 350}, 0.1, 0.5}, Case{90, {350, 700}, 0.5, 0.1}, Case{180, {700, 350}, 0.9, 0.5},
          Case{270, {350, 700}, 0.5, 0.9}, Case{0, {700, 350}, 0.1, 0.5}}) {
        EXPECT_EQ(look.controls().angle, c.angle);
        EXPECT_EQ(look.controls().Picture2Box, c.box);
        const QImage& shown = look.controls().Picture2.image();
        EXPECT_EQ(shown.width() * c.box.height, shown.height() * c.box.width);
        EXPECT_EQ(shown.pixelColor(static_cast<int>(shown.width() * c.redX), static_cast<int>(shown.height() * c.redY)),
                  QColor(Qt::red))
            << c.angle;
        look.Command1_Click();
    }
    std::filesystem::remove(host(path));
    look.Command2_Click();
    EXPECT_TRUE(look.controls().Picture2.isNull());
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages.first().contains(u"look.bmp"_s));
    look.Command3_Click();
    EXPECT_EQ(chain.find(PageId::Form3), nullptr);
}

} // namespace
} // namespace lumora
