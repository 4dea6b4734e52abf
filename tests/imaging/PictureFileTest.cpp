#include "imaging/files/PictureFile.h"

#include "JpegOfKind.h"
#include "common/HostFile.h"
#include "imaging/files/BmpFile.h"
#include "imaging/scaling/Resample.h"
#include "samples/SamplePictureFiles.h"
#include "support/JpegQuality.h"
#include "support/PictureDifference.h"
#include "support/Take.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <tuple>
#include <utility>

#include <sys/stat.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

namespace fs = std::filesystem;

class PictureFileTest : public testing::Test {
protected:
    fs::path in(const std::string& name) const { return fs::path(m_folder.path().toStdString()) / name; }
    fs::path write(const std::string& name, const QByteArray& bytes) {
        EXPECT_TRUE(writeWholeFile(in(name), bytes));
        return in(name);
    }

    QTemporaryDir m_folder;
};

QByteArray withSize(QByteArray jpeg, int width, int height) {
    const auto frame = jpeg.indexOf("\xFF\xC0");
    const auto put = [&](qsizetype at, int value) {
        jpeg[at] = static_cast<char>(value >> 8);
        jpeg[at + 1] = static_cast<char>(value & 255);
    };
    put(frame + 5, height);
    put(frame + 7, width);
    return jpeg;
}

TEST_F(PictureFileTest, everyKindOfJpegShowsAndScalesTheSamePicture) {
    using Colours = JpegKind::Colours;
    const std::pair<const char*, JpegKind> cases[] = {
        {"4:4:4", {}},
        {"grey", {.colours = Colours::Grey}},
        {"4:2:2", {.across = 2}},
        {"4:4:0", {.down = 2}},
        {"4:2:0", {.across = 2, .down = 2}},
        {"4:1:1", {.across = 4}},
        {"progressive", {.across = 2, .down = 2, .progressive = true}},
        {"restarts", {.across = 2, .down = 2, .restartRows = 1}},
        {"rgb", {.colours = Colours::Rgb}},
        {"cmyk", {.colours = Colours::Inks}},
        {"cmyk inverted", {.colours = Colours::InvertedInks}},
        {"ycck", {.colours = Colours::InvertedYcck}},
    };
    for (const PictureSize size : {PictureSize{640, 480}, PictureSize{641, 479}, PictureSize{333, 517}}) {
        const Bitmap colours = testPicture(size.width, size.height);
        const QImage grey = colours.image().convertToFormat(QImage::Format_Grayscale8);
        const PictureSize third{size.width / 3, size.height / 3};
        const Bitmap originals[] = {colours, Bitmap(grey.convertToFormat(QImage::Format_RGB32))};
        const Bitmap thirds[] = {resampled(originals[0], third), resampled(originals[1], third)};
        for (const auto& [name, kind] : cases) {
            SCOPED_TRACE(name);
            const bool isGrey = kind.colours == Colours::Grey;
            const Bitmap& original = originals[isGrey];
            const Bitmap& wanted = thirds[isGrey];
            const fs::path path = write("one.jpg", jpegOfKind(original, kind));
            ASSERT_EQ(take(readPictureSize(path)), size);
            const QByteArray print = take(scalePictureToJpeg(path, third, 95));
            SmallCopy small{{53, 40}};
            EXPECT_EQ(take(scalePictureToJpeg(path, third, 95, nullptr, &small)), print);
            const bool madeOfPixels = kind.colours >= Colours::Rgb;
            EXPECT_EQ(small.pixels.isNull(), madeOfPixels) << "it would take a decode of its own";
            if (!madeOfPixels) {
                EXPECT_LT(meanDifference(small.pixels, take(loadPictureScaled(path, small.size))), 0.4);
            }
            EXPECT_EQ(print.at(print.indexOf("\xFF\xC0") + 9), 3) << "components";
            EXPECT_EQ(jpegQuality(print), 95);
            const Result<Bitmap> made[] = {loadPicture(path), loadPictureScaled(path, third),
                                           loadPicture(write("print.jpg", print)),
                                           Bitmap(QImage::fromData(print, "JPEG"))};
            for (const auto& [i, most] : {std::pair(0, 4.0), {1, 2.5}, {2, 5.0}, {3, 5.0}}) {
                ASSERT_TRUE(made[i]);
                EXPECT_LT(meanDifference(*made[i], i == 0 ? original : wanted), most) << i;
            }
        }
    }
}

TEST_F(PictureFileTest, aFaultyFileIsAFailureThatNamesItAndLeavesNoPrint) {
    using Kind = Failure::Kind;
    const Bitmap picture = testPicture(320, 240);
    const QByteArray jpeg = jpegOfKind(picture, {.across = 2, .down = 2});
    const QByteArray progressive = jpegOfKind(picture, {.progressive = true});
    const QByteArray restarts = jpegOfKind(picture, {.restartRows = 1});
    const QByteArray bmp = saved(picture.image(), "BMP");
    const QByteArray png = saved(picture.image(), "PNG");
    QByteArray damaged = restarts;
    const auto hit = damaged.size() * 2 / 3;
    damaged.replace(hit, 40, QByteArray(40, '\xFF'));
    QByteArray endsEarly = jpeg.left(jpeg.size() / 2) + "\xFF\xD9";
    QByteArray noPixelsBmp = bmp;
    noPixelsBmp.replace(18, 4, QByteArray(4, '\0'));
    QByteArray hugeBmp = bmp;
    hugeBmp.replace(18, 8, QByteArray("\x20\x4E\x00\x00\x20\x4E\x00\x00", 8)); // 20000 by 20000

    const std::tuple<const char*, QByteArray, Kind> cases[] = {
        {"empty.jpg", {}, Kind::Damaged},
        {"text.jpg", "no picture at all", Kind::Unsupported},
        {"marker only.jpg", "\xFF\xD8\xFF", Kind::Damaged},
        {"header only.jpg", jpeg.left(200), Kind::Damaged},
        {"cut in half.jpg", jpeg.left(jpeg.size() / 2), Kind::Damaged},
        {"without its last bytes.jpg", jpeg.left(jpeg.size() - 2), Kind::Damaged},
        {"ends early.jpg", endsEarly, Kind::Damaged},
        {"progressive cut.jpg", progressive.left(progressive.size() * 3 / 4), Kind::Damaged},
        {"damaged.jpg", damaged, Kind::Damaged},
        {"0 by 0.jpg", withSize(jpeg, 0, 0), Kind::Damaged},
        {"65500 by 65500.jpg", withSize(jpeg, 65500, 65500), Kind::TooLarge},
        {"65535 by 1.jpg", withSize(jpeg, 65535, 1), Kind::TooLarge},
        {"claims what it can't hold.jpg", withSize(jpeg, 15000, 15000), Kind::Damaged},
        {"cut.png", png.left(png.size() / 2), Kind::Damaged},
        {"cut.bmp", bmp.left(bmp.size() / 2), Kind::Damaged},
        {"no pixels.bmp", noPixelsBmp, Kind::Damaged},
        {"huge.bmp", hugeBmp, Kind::TooLarge},
    };
    for (const auto& [name, bytes, kind] : cases) {
        SCOPED_TRACE(name);
        const fs::path path = write(name, bytes);
        const auto whole = loadPicture(path);
        ASSERT_FALSE(whole);
        EXPECT_EQ(whole.failure().kind, kind) << qPrintable(whole.failure().message);
        EXPECT_TRUE(whole.failure().message.contains(QString::fromUtf8(name)));
        EXPECT_FALSE(loadPictureScaled(path, {40, 30}));
        EXPECT_FALSE(scalePictureToJpeg(path, {40, 30}, 90));
    }
    EXPECT_EQ(QDir(m_folder.path()).entryList({u"*.lumora*"_s}, QDir::Files | QDir::Hidden), QStringList());
}

TEST_F(PictureFileTest, whatIsNoFileIsRefusedAtOnce) {
    ASSERT_EQ(::mkfifo(in("pipe.jpg").c_str(), 0600), 0);
    EXPECT_EQ(loadPicture(in("pipe.jpg")).failure().kind, Failure::Kind::Unsupported);
    EXPECT_EQ(loadPicture(in("")).failure().kind, Failure::Kind::Unsupported);
    EXPECT_EQ(loadPicture(in("missing.jpg")).failure().kind, Failure::Kind::NotFound);
}

TEST_F(PictureFileTest, theContentAndNotTheEndingSaysWhatAFileIs) {
    const Bitmap picture = testPicture(60, 40);
    for (const char* format : {"BMP", "PNG"}) {
        const fs::path path = write("misnamed.jpg", saved(picture.image(), format));
        EXPECT_EQ(take(readPictureSize(path)), (PictureSize{60, 40}));
        EXPECT_EQ(meanDifference(take(loadPicture(path)), picture), 0) << format;
        EXPECT_TRUE(scalePictureToJpeg(path, {30, 20}, 90));
    }
    EXPECT_TRUE(loadPicture(write("really a jpeg.bmp", jpegOfKind(picture, {}))));
}

TEST_F(PictureFileTest, aWhiteOrTransparentPictureIsWhiteToItsEdgesAtEverySize) {
    const fs::path white = write("white.jpg", *encodeJpeg(Bitmap(403, 301, Qt::white), 92));
    const fs::path glass = write("glass.png", saved(Bitmap(403, 301, QColor(255, 0, 0, 0)).image(), "PNG"));
    for (const PictureSize size : {PictureSize{403, 301}, PictureSize{201, 150}, PictureSize{115, 86},
                                   PictureSize{13, 9}, PictureSize{1, 1}, PictureSize{500, 400}}) {
        const Bitmap wanted(size.width, size.height, Qt::white);
        for (const fs::path& path : {white, glass}) {
            const Bitmap printed = take(loadPicture(write("p.jpg", take(scalePictureToJpeg(path, size, 90)))));
            EXPECT_EQ(meanDifference(printed, wanted), 0) << path;
        }
        EXPECT_EQ(meanDifference(take(loadPictureScaled(white, size)), wanted), 0);
    }
    const fs::path clear = write("clear.jpg", *encodeJpeg(Bitmap(16, 16, QColor(255, 0, 0, 0)), 92));
    EXPECT_EQ(meanDifference(*loadPicture(clear), Bitmap(16, 16, Qt::white)), 0);
}

TEST_F(PictureFileTest, aBitmapFileOfAnyWidthIsReadByOthers) {
    for (const int width : {60, 61, 62, 63}) {
        const Bitmap picture = testPicture(width, 40);
        ASSERT_TRUE(saveBmp(picture, in("work.bmp")));
        EXPECT_EQ(meanDifference(Bitmap(QImage(QString::fromStdString(in("work.bmp")))), picture), 0) << width;
    }
}

TEST_F(PictureFileTest, qualityIsHeldBetween1And100) {
    const Bitmap picture = testPicture(200, 100);
    for (const auto& [asked, written] :
         {std::pair(-5, 1), {0, 1}, {30, 30}, {70, 70}, {90, 90}, {100, 100}, {150, 100}})
        EXPECT_EQ(jpegQuality(*encodeJpeg(picture, asked)), written) << asked;
    EXPECT_FALSE(encodeJpeg(Bitmap(), 90));
}

TEST_F(PictureFileTest, theSmallPictureFillsItsCellByTheLongerSide) {
    for (const auto& [large, small] : {std::pair(PictureSize{4000, 3000}, PictureSize{115, 86}),
                                       {{3000, 4000}, {86, 115}},
                                       {{500, 500}, {115, 115}},
                                       {{60000, 10}, {115, 1}},
                                       {{10, 60000}, {1, 115}},
                                       {{40, 30}, {115, 86}}})
        EXPECT_EQ(smallPictureSize(large, 115), small) << large.width << " x " << large.height;
}

TEST_F(PictureFileTest, smallPicturesComeInOrderWithAFailureInItsPlace) {
    std::vector<fs::path> paths;
    for (int i = 0; i < 9; ++i)
        paths.push_back(
            write(std::to_string(i) + ".jpg",
                  i == 4 ? QByteArray("broken") : *encodeJpeg(Bitmap(300 + i, 200, QColor(20 * i, 0, 0)), 95)));
    const auto pictures = loadSmallPictures(paths, 90);
    ASSERT_EQ(pictures.size(), paths.size());
    for (int i = 0; i < 9; ++i) {
        ASSERT_EQ(pictures[static_cast<std::size_t>(i)].ok(), i != 4);
        if (i != 4) {
            EXPECT_NEAR(qRed(pictures[static_cast<std::size_t>(i)]->image().pixel(40, 30)), 20 * i, 2);
        }
    }
    EXPECT_TRUE(loadSmallPictures({}, 90).empty());
}

} // namespace
} // namespace lumora
