#include "editing/render/PicturePlacement.h"
#include "session/SessionState.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

TEST(PicturePlacement, SizesThePreviewByThePaperCode) {
    struct Case {
        const char* code;
        PictureSize landscape;
        PictureSize portrait;
    };
    const Case cases[] = {{"1015", {450, 300}, {300, 450}},
                          {"1318", {450, 325}, {300, 415}},
                          {"0913", {450, 311}, {300, 433}},
                          {"3040", {450, 337}, {300, 400}},
                          {"1521", {450, 321}, {300, 420}}};
    for (const Case& expected : cases) {
        const auto paper = PaperSize::ofDigits(QString::fromLatin1(expected.code));
        ASSERT_TRUE(paper) << expected.code;
        EXPECT_EQ(previewBox(*paper, PaperOrientation::Landscape), expected.landscape) << expected.code;
        EXPECT_EQ(previewBox(*paper, PaperOrientation::Portrait), expected.portrait) << expected.code;
    }
}

TEST(PicturePlacement, TakesAPictureFromPreviewToPrint) {
    EditFields edit;
    edit.ZoomPercent = 100;
    edit.RotationCode = 180;

    edit.PanX = 225;
    edit.PanY = 150;
    const PictureSize lying{4000, 3000};
    EXPECT_EQ(workPictureSize(lying, 100), (PictureSize{500, 375}));
    EXPECT_EQ(workPictureSize(lying, 40), (PictureSize{200, 150}));
    EXPECT_EQ(workPictureSize(lying, 210), (PictureSize{700, 525}));
    EXPECT_EQ(previewPlacement({500, 375}, {450, 300}, edit).zoomed(), (PictureSize{450, 337}));
    const PrintGeometry tenFifteen = printGeometry({10, 15}, PaperOrientation::Landscape);
    EXPECT_EQ(tenFifteen.size, (PictureSize{1500, 1000}));
    const Placement lyingPrint = printPlacement(lying, tenFifteen, edit);
    EXPECT_EQ(lyingPrint.zoomed(), (PictureSize{1500, 1125}));
    EXPECT_NEAR(lyingPrint.onPaper(0, 0).y, -62, 0.01);

    edit.PanX = 150;
    edit.PanY = 207;
    const PictureSize upright{3000, 4000};
    EXPECT_EQ(workPictureSize(upright, 100), (PictureSize{375, 500}));
    EXPECT_EQ(previewPlacement({375, 500}, {300, 415}, edit).zoomed(), (PictureSize{311, 415}));
    const PrintGeometry thirteenEighteen = printGeometry({13, 18}, PaperOrientation::Portrait);
    EXPECT_EQ(thirteenEighteen.size, (PictureSize{1300, 1800}));
    const Placement uprightPrint = printPlacement(upright, thirteenEighteen, edit);
    EXPECT_EQ(uprightPrint.zoomed(), (PictureSize{1350, 1800}));
    EXPECT_NEAR(uprightPrint.onPaper(0, 0).x, -25, 0.01);
    EXPECT_NEAR(uprightPrint.onPaper(0, 0).y, -3, 0.01);
}

TEST(PicturePlacement, RefusesAPictureSoSlimThatItsWorkCopyWouldFillTheMemory) {
    EXPECT_FALSE(workPictureSize({1, 10000}, 100));
    EXPECT_EQ(workPictureSize({10000, 1}, 100), (PictureSize{500, 1}));
}

} // namespace
} // namespace lumora
