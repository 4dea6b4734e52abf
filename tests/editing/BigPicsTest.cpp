#include "editing/editor/BigPics.h"
#include "editing/editor/Form3.h"
#include "imaging/files/PictureFile.h"
#include "support/PageRig.h"

#include <QPainter>

#include <gtest/gtest.h>

#include <tuple>

namespace lumora {
namespace {

TEST(SampleColorLevels, SortsItsValuesAsTextsSoThatTheBrightestComeLast) {
    Bitmap row(11, 1, Qt::black);
    row.image().setPixelColor(0, 0, QColor(200, 0, 9));
    row.image().setPixelColor(5, 0, QColor(5, 0, 10));
    row.image().setPixelColor(10, 0, QColor(50, 0, 99));
    const SampleColorLevels samples(row, {0, 0, 10, 0});
    EXPECT_EQ(samples.lists()[0], QStringList({u"05"_s, u"050"_s, u"200"_s}));
    EXPECT_EQ(samples.lists()[2], QStringList({u"010"_s, u"09"_s, u"099"_s}));

    for (const auto& [value, top, gain, floor] : std::initializer_list<std::tuple<int, float, float, float>>{
             {0, 0.2F, 1275, 10}, {255, 255.2F, 0.99922F, 265}, {50, 50.2F, 5.07968F, 60}}) {
        const SampleColorLevels flat(Bitmap(60, 40, QColor(value, 50, 5)), {5, 5, 50, 30});
        EXPECT_EQ(flat.topLevels(), (ChannelValues{top, 50.2F, 5.2F}));
        EXPECT_NEAR(flat.gains()[0], gain, gain * 1e-5);
        EXPECT_EQ(flat.floors(10), (ChannelValues{floor, 60, 15}));
    }
}

class WorkSurfaces : public ::testing::Test, protected PageRig {};

TEST_F(WorkSurfaces, APictureToLookAtTurnsByQuartersAndIsReadAgain) {
    const DrivePath path = u"C:\\wide.bmp"_path;
    Bitmap picture(1000, 500, QColor(20, 40, 60));
    QPainter(&picture.image()).fillRect(500, 0, 500, 500, QColor(220, 180, 140));
    ASSERT_TRUE(picture.image().save(toText(host(path)), "BMP"));
    registerPage<Form3>(PageId::Form3);
    auto& look = chain.load<Form3>();
    look.open(path);
    const auto& shown = look.controls();
    // The dark half lies left, on top, right, below: a quarter turn clockwise each time, and upright again after four.
    for (const auto& [angle, x, y] :
         {std::tuple(0, 0.1, 0.5), {90, 0.5, 0.1}, {180, 0.9, 0.5}, {270, 0.5, 0.9}, {0, 0.1, 0.5}}) {
        EXPECT_EQ(shown.angle, angle);
        EXPECT_EQ(shown.Picture2Box, angle % 180 == 0 ? (PictureSize{700, 350}) : (PictureSize{350, 700}));
        const QImage& image = shown.Picture2.image();
        EXPECT_EQ(image.width() * shown.Picture2Box.height, image.height() * shown.Picture2Box.width);
        EXPECT_EQ(image.pixelColor(static_cast<int>(image.width() * x), static_cast<int>(image.height() * y)),
                  QColor(20, 40, 60))
            << angle;
        look.Command1_Click();
    }
    std::filesystem::remove(host(path));
    look.Command2_Click();
    EXPECT_TRUE(shown.Picture2.isNull());
    ASSERT_EQ(machine.dialogs.messages.size(), 1);
    EXPECT_TRUE(machine.dialogs.messages.first().contains(u"wide.bmp"_s));
    look.Command3_Click();
    EXPECT_EQ(chain.find(PageId::Form3), nullptr);
}

} // namespace
} // namespace lumora
