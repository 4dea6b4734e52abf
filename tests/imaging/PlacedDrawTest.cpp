#include "imaging/drawing/PlacedDraw.h"

#include "imaging/scaling/Resample.h"

#include <QPainter>

#include <gtest/gtest.h>

#include <tuple>

namespace lumora {
namespace {

Placement placed(double width, double height, int zoom, int rotation, double panX, double panY) {
    Placement placement;
    placement.drawWidth = width;
    placement.drawHeight = height;
    placement.zoomPercent = zoom;
    placement.rotationCode = rotation;
    placement.panX = panX;
    placement.panY = panY;
    return placement;
}

// Four flat quarters: red, green above blue, white.
Bitmap quarters(int width, int height) {
    Bitmap picture(width, height, Qt::red);
    QPainter painter(&picture.image());
    painter.fillRect(width / 2, 0, width, height, 0xFF00FF00);
    painter.fillRect(0, height / 2, width, height, Qt::blue);
    painter.fillRect(width / 2, height / 2, width, height, Qt::white);
    return picture;
}

TEST(Placement, PutsTheCornersWhereTheLabsPrintsHaveThem) {
    struct Case {
        Placement placement;
        int width, height;
        double x0, y0, x1, y1;
    };
    const Case cases[] = {
        {placed(450, 337, 100, 180, 225, 150), 450, 337, 0, -18, 450, 319},
        {placed(450, 337, 40, 180, 225, 150), 180, 135, 135, 83, 315, 218},
        {placed(450, 337, 150, 180, 225, 150), 675, 506, -112, -103, 563, 403}, // 505.5 is a tie, to even
        {placed(450, 337, 210, 180, 225, 150), 945, 708, -247, -204, 698, 504},
        {placed(311, 415, 100, 180, 150, 207), 311, 415, -5, 0, 306, 415},
        {placed(450, 337, 150, 195, 245, 140), 675, 506, -15.04, -191.60, 506.00, 471.86},
        {placed(311, 415, 80, 270, 130, 217), 249, 332, 296, 93, -36, 342},
        {placed(1500, 1125, 150, 195, 816.6667, 466.6667), 2250, 1688, -51.56, -639.75, 1684.89, 1573.08},
    };
    for (const Case& expected : cases) {
        const PictureSize size = expected.placement.zoomed();
        EXPECT_EQ(size, (PictureSize{expected.width, expected.height}));
        const auto first = expected.placement.onPaper(0, 0);
        const auto last = expected.placement.onPaper(size.width, size.height);
        EXPECT_NEAR(first.x, expected.x0, 0.01);
        EXPECT_NEAR(first.y, expected.y0, 0.01);
        EXPECT_NEAR(last.x, expected.x1, 0.01);
        EXPECT_NEAR(last.y, expected.y1, 0.01);
    }
}

TEST(PlacedDraw, TurnsClockwiseWithoutMirroring) {
    const Bitmap picture = quarters(40, 40);
    // What upright quarter of the picture comes to the top left and to the top right.
    const QPoint red(2, 2), green(37, 2), blue(2, 37), white(37, 37);
    for (const auto& [code, left, right] : {std::tuple(180, red, green),
                                            {270, blue, red},
                                            {360, white, blue},
                                            {90, green, white},
                                            {-90, blue, red},
                                            {540, red, green}}) {
        Bitmap paper(40, 40, Qt::black);
        drawPlaced(paper, picture, placed(40, 40, 100, code, 20, 20), ColourMatrix());
        EXPECT_EQ(paper.image().pixel(red), picture.image().pixel(left)) << code;
        EXPECT_EQ(paper.image().pixel(green), picture.image().pixel(right)) << code;
        EXPECT_TRUE((code - 180) % 360 != 0 || paper.image() == picture.image()) << "as it is";
    }
}

TEST(PlacedDraw, LeavesThePaperAloneWhereThePictureDoesNotReach) {
    Bitmap paper(90, 60, Qt::black);
    drawPlaced(paper, quarters(40, 30), placed(90, 68, 210, 200, 999, 999), ColourMatrix());
    EXPECT_EQ(paper.image(), Bitmap(90, 60, Qt::black).image());
}

TEST(ColourMatrix, FloorsAndClampsAsTheLabsPrintsDo) {
    const auto gains = [](float r, float g, float b) { return ColourMatrix::fromGains(r, g, b, 0.001F); };
    const ColourMatrix grey = ColourMatrix::grey(0.3F);
    const std::tuple<ColourMatrix, QRgb, QRgb> cases[] = {
        {gains(1, 1, 1), qRgb(255, 255, 255), qRgb(255, 255, 255)},
        {gains(1, 1, 1), qRgb(200, 100, 50), qRgb(200, 100, 50)},
        {grey, qRgb(255, 255, 255), qRgb(229, 229, 229)},
        {grey, qRgb(255, 0, 0), qRgb(76, 76, 76)},
        {grey, qRgb(100, 150, 200), qRgb(135, 135, 135)},
        {grey, qRgb(1, 1, 1), qRgb(0, 0, 0)},
        {gains(1.3F, 1, 0.8F), qRgb(135, 135, 135), qRgb(175, 135, 108)},
        {gains(1.04F, 1.04F, 1.04F), qRgb(100, 150, 200), qRgb(104, 156, 208)},
        {gains(1.6F, 1, 0.4F), qRgb(100, 150, 200), qRgb(160, 150, 80)},
        {gains(2.5F, 2.5F, 2.5F), qRgb(200, 100, 50), qRgb(255, 250, 125)},
        {gains(-0.5F, 1, -0.04F), qRgb(100, 150, 200), qRgb(0, 150, 0)},
    };
    for (const auto& [matrix, in, out] : cases) {
        // Wide enough for the vector loop, with a rest behind it.
        const Bitmap result = matrix.applied(Bitmap(37, 1, QColor(in)));
        EXPECT_EQ(result.image().pixel(0, 0), out);
        EXPECT_EQ(result.image().pixel(36, 0), out);
    }
}

TEST(KeyedFrame, MakesBlackTransparentAndDarkPartlySo) {
    for (const auto& [dark, red, green, blue] : {std::tuple(qRgb(0, 0, 0), 200, 150, 100),
                                                 {qRgb(1, 0, 0), 191, 143, 95},
                                                 {qRgb(10, 0, 0), 118, 85, 56},
                                                 {qRgb(24, 0, 0), 24, 0, 0},
                                                 {qRgb(255, 255, 255), 255, 255, 255}}) {
        Bitmap paper(8, 8, QColor(200, 150, 100));
        drawKeyedFrame(paper, keyedFrame(Bitmap(4, 4, QColor(dark)), {8, 8}));
        const QRgb found = paper.image().pixel(4, 4);
        EXPECT_NEAR(qRed(found), red, 1);
        EXPECT_NEAR(qGreen(found), green, 1);
        EXPECT_NEAR(qBlue(found), blue, 1);
    }
}

// A tile of the key or of the background that is wrongly taken for empty would leave a hole.
TEST(KeyedFrame, InPiecesIsTheWholeFrame) {
    Bitmap frame(90, 61, Qt::black);
    for (const QPoint& point : {QPoint(0, 0), QPoint(42, 30), QPoint(89, 60), QPoint(60, 3)})
        frame.image().setPixel(point, 0xFF0C64FA);
    frame.image().setPixel(20, 50, 0xFF020301);
    QImage alpha = frame.image().convertToFormat(QImage::Format_ARGB32);
    for (int i = 0; i < 90 * 61; ++i) {
        const QRgb pixel = alpha.pixel(i % 90, i / 90);
        const int key = std::min(255, 11 * (qRed(pixel) + qGreen(pixel) + qBlue(pixel)));
        alpha.setPixel(i % 90, i / 90, (pixel & 0xFFFFFF) | static_cast<QRgb>(key) << 24);
    }
    for (const PictureSize size : {PictureSize{1500, 1000}, PictureSize{450, 300}, PictureSize{40, 27}}) {
        Bitmap pieces(size.width, size.height, QColor(200, 150, 100));
        Bitmap whole = pieces;
        drawKeyedFrame(pieces, keyedFrame(frame, size));
        QPainter(&whole.image()).drawImage(0, 0, resampled(Bitmap(alpha), size).image());
        EXPECT_EQ(pieces.image(), whole.image()) << size.width;
    }
}

TEST(Placement, AFlatPictureAndTheUncoveredPartsGiveAFlatPaper) {
    constexpr PictureSize size{300, 200};
    const QColor colour(37, 141, 211);
    const Bitmap source(400, 300, colour);
    const Bitmap flat(size.width, size.height, colour);
    for (const int rotation : {180, 183, 187, 217, 270, 301}) {
        for (const int zoom : {40, 100, 137, 210}) {
            for (const QPoint pan : {QPoint(150, 100), QPoint(0, 0), QPoint(999, 999)}) {
                const Placement placement = placed(300, 225, zoom, rotation, pan.x(), pan.y());
                const auto bare = placement.uncovered(size);
                EXPECT_TRUE(bare.empty() || !placement.covers(size)) << rotation << ' ' << zoom;
                Bitmap paper(size.width, size.height, Qt::black);
                for (const QRect& part : bare)
                    drawStretched(paper, source, part);
                drawPlaced(paper, source, placement, ColourMatrix());
                EXPECT_EQ(paper.image(), flat.image()) << rotation << ' ' << zoom << ' ' << pan.x();
            }
        }
    }
    EXPECT_TRUE(placed(300, 225, 100, 180, 150, 100).uncovered(size).empty());
}

} // namespace
} // namespace lumora
