#include "imaging/scaling/Resample.h"

#include "JpegOfKind.h"
#include "common/HostFile.h"
#include "imaging/drawing/Drawing.h"
#include "imaging/scaling/PlaneScaler.h"
#include "samples/ReferenceScaling.h"
#include "samples/SamplePhotographs.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <numeric>

namespace lumora {
namespace {

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

TEST(ResampleTest, staysWithinTheRoundingOfTheExactCurve) {
    const Bitmap photograph = samplePhotograph({803, 601}, 7);
    for (const PictureSize size :
         {PictureSize{361, 270}, PictureSize{115, 86}, PictureSize{700, 590}, PictureSize{1000, 800}}) {
        const ReferencePlane exact =
            referenceScaled(lumaOf(photograph), size.width, size.height, 803.0 / size.width, 601.0 / size.height);
        EXPECT_GE(peakSignalToNoise(lumaOf(resampled(photograph, size)), exact), 55) << size.width;
    }
}

TEST(ResampleTest, everyVectorKernelOfThisMachineGivesTheBytesOfThePlainOne) {
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
    const PictureSize camera{4000, 3000};
    for (const auto& [wanted, eighths] :
         {std::pair(PictureSize{1800, 1350}, 1), {{1000, 750}, 2}, {{251, 188}, 4}, {{115, 86}, 8}})
        EXPECT_EQ(decodeDenominator(camera, wanted), eighths) << wanted.width;
    EXPECT_EQ(decodeDenominator({10, 10}, {1, 1}), 4);
}

TEST(DrawingTest, aTurnedPictureHasItsCornersInTheirPlaces) {
    Bitmap picture(40, 30, Qt::white);
    picture.image().setPixelColor(0, 0, Qt::red);
    for (const auto& [turn, mark] : {std::pair(QuarterTurn::None, QPoint(0, 0)),
                                     {QuarterTurn::Right, {29, 0}},
                                     {QuarterTurn::Half, {39, 29}},
                                     {QuarterTurn::Left, {0, 39}}})
        EXPECT_EQ(turned(picture, turn).image().pixelColor(mark), QColor(Qt::red)) << static_cast<int>(turn);
}

} // namespace
} // namespace lumora
