#include "imaging/scaling/Resample.h"

#include "JpegOfKind.h"
#include "common/HostFile.h"
#include "imaging/drawing/Drawing.h"
#include "imaging/scaling/PlaneScaler.h"
#include "support/ReferenceScaling.h"
#include "support/SamplePhotographs.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <numeric>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

ReferencePlane lumaOf(const Bitmap& picture) {
    ReferencePlane plane{picture.width(), picture.height(), {}};
    for (int y = 0; y < plane.height; ++y) {
        for (int x = 0; x < plane.width; ++x)
            plane.samples.push_back(qGreen(picture.image().pixel(x, y)));
    }
    return plane;
}

TEST(ResampleTest, theWeightsOfEverySampleSumToExactlyOne) {
    for (const double step : {0.3, 0.5, 1.0, 1.37, 2.0, 20.0 / 9, 7.77, 100.0}) {
        const int count = static_cast<int>(500 / step);
        const CubicWeights weights = CubicWeights::make({500, count, step});
        for (int i = 0; i < count; ++i) {
            const auto begin = weights.weights.begin() + std::ptrdiff_t{i} * weights.taps;
            EXPECT_EQ(std::accumulate(begin, begin + weights.taps, 0), 16384) << step << " at " << i;
        }
    }
}

TEST(ResampleTest, aFlatPictureStaysFlatToTheLastBit) {
    for (const QColor& colour : {QColor(Qt::white), QColor(Qt::black), QColor(1, 128, 254), QColor(40, 80, 120, 200)}) {
        const Bitmap flat(97, 61, colour);
        const QRgb expected =
            flat.image().constBits() != nullptr ? reinterpret_cast<const QRgb*>(flat.image().constScanLine(0))[0] : 0;
        for (const PictureSize size :
             {PictureSize{97, 61}, PictureSize{31, 20}, PictureSize{1, 1}, PictureSize{211, 140}}) {
            const Bitmap scaled = resampled(flat, size);
            ASSERT_EQ(scaled.width(), size.width);
            for (int y = 0; y < size.height; ++y) {
                for (int x = 0; x < size.width; ++x)
                    ASSERT_EQ(reinterpret_cast<const QRgb*>(scaled.image().constScanLine(y))[x], expected);
            }
        }
    }
}

TEST(ResampleTest, theSameSizeIsTheSamePicture) {
    const Bitmap picture = testPicture(123, 77);
    EXPECT_EQ(resampled(picture, {123, 77}).image(), picture.image());
}

TEST(ResampleTest, staysWithinTheRoundingOfTheExactCurve) {
    const Bitmap photograph = samplePhotograph({803, 601}, 7);
    for (const PictureSize size :
         {PictureSize{361, 270}, PictureSize{115, 86}, PictureSize{700, 590}, PictureSize{1000, 800}}) {
        const ReferencePlane exact =
            referenceScaled(lumaOf(photograph), size.width, size.height, 803.0 / size.width, 601.0 / size.height);
        EXPECT_GE(peakSignalToNoise(lumaOf(resampled(photograph, size)), exact), 55) << size.width;
    }
}

TEST(ResampleTest, everyKindOfProcessorGivesTheSameBytes) {
    const QTemporaryDir folder;
    const std::filesystem::path path = std::filesystem::path(folder.path().toStdString()) / "a.jpg";
    const auto kernels = allKernels();
    ASSERT_EQ(kernels.front().name, "plain");
    ASSERT_GE(kernels.size(), 2U) << "no vector kernels on this machine";
    for (const PictureSize source : {PictureSize{1600, 1200}, PictureSize{1203, 1601}, PictureSize{37, 19}}) {
        ASSERT_TRUE(writeWholeFile(path, samplePhotographFile(source, 3)));
        for (const PictureSize size : {PictureSize{721, 541}, PictureSize{115, 86}, PictureSize{37, 19}}) {
            QByteArray plain;
            Bitmap plainPixels;
            for (const NamedKernels& one : kernels) {
                auto reader = JpegReader::open(std::move(*PictureInput::open(path)));
                ASSERT_TRUE(reader);
                const auto bytes = readResampledToJpeg(**reader, size, 90, one.kernels);
                ASSERT_TRUE(bytes);
                const Bitmap pixels = resampled(testPicture(source.width, source.height), size, one.kernels);
                if (one.name == "plain") {
                    plain = *bytes;
                    plainPixels = pixels;
                }
                EXPECT_EQ(*bytes, plain) << one.name << ' ' << size.width;
                EXPECT_EQ(pixels.image(), plainPixels.image()) << one.name << ' ' << size.width;
            }
        }
    }
}

TEST(ResampleTest, aScaledDecodeKeepsTwiceThePixelsWanted) {
    EXPECT_EQ(decodeDenominator({4000, 3000}, {1800, 1350}), 1);
    EXPECT_EQ(decodeDenominator({4000, 3000}, {1000, 750}), 2);
    EXPECT_EQ(decodeDenominator({4000, 3000}, {115, 86}), 8);
    EXPECT_EQ(decodeDenominator({4000, 3000}, {251, 188}), 4);
    EXPECT_EQ(decodeDenominator({10, 10}, {1, 1}), 4);
}

TEST(DrawingTest, aTurnedPictureHasItsCornersInTheirPlaces) {
    Bitmap picture(40, 30, Qt::white);
    picture.image().setPixel(0, 0, qRgb(255, 0, 0));
    const std::pair<QuarterTurn, QPoint> cases[] = {{QuarterTurn::None, {0, 0}},
                                                    {QuarterTurn::Right, {29, 0}},
                                                    {QuarterTurn::Half, {39, 29}},
                                                    {QuarterTurn::Left, {0, 39}}};
    for (const auto& [turn, mark] : cases) {
        const Bitmap result = turned(picture, turn);
        EXPECT_EQ(result.image().pixel(mark), qRgb(255, 0, 0)) << static_cast<int>(turn);
    }
}

int inkedRows(const Bitmap& picture) {
    int rows = 0;
    for (int y = 0; y < picture.height(); ++y) {
        bool inked = false;
        for (int x = 0; x < picture.width(); ++x)
            inked = inked || picture.image().pixel(x, y) != qRgb(255, 255, 255);
        rows += inked ? 1 : 0;
    }
    return rows;
}

TEST(DrawingTest, davidIsDrawnAndAFamilyThatDoesNotExistDrawsNothing) {
    const QString text = u"שלום Lumora\r\n2024"_s;
    Bitmap known(200, 80, Qt::white);
    drawText(known, {5, 5}, text, {.family = u"David"_s, .pixelSize = 24});
    EXPECT_GT(inkedRows(known), 24) << "two lines";
    Bitmap unknown(200, 80, Qt::white);
    drawText(unknown, {5, 5}, text, {.family = u"No Such Family"_s, .pixelSize = 24});
    EXPECT_EQ(inkedRows(unknown), 0);
}

} // namespace
} // namespace lumora
