#include "common/HostFile.h"
#include "door/DoorDecoder.h"
#include "door/DoorStatus.h"
#include "imaging/files/JpegCheck.h"
#include "imaging/files/PictureFile.h"
#include "samples/SamplePictureFiles.h"
#include "support/JpegQuality.h"

#include <QColorSpace>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <random>
#include <tuple>

#include <lcms2.h>
#include <poll.h>
#include <signal.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

namespace fs = std::filesystem;

class DoorTest : public testing::Test {
protected:
    fs::path in(const std::string& name) const { return fs::path(m_folder.path().toStdString()) / name; }
    fs::path write(const std::string& name, const QByteArray& bytes) const {
        EXPECT_TRUE(writeWholeFile(in(name), bytes));
        return in(name);
    }
    static QByteArray read(const fs::path& path) {
        const auto bytes = readWholeFile(path, u"the result"_s, 1 << 30);
        return bytes ? *bytes : QByteArray();
    }
    Result<DoorDecoder::Made> make(const QByteArray& bytes, const DoorDecoder& decoder) const {
        return decoder.make(write("source", bytes), in("target.jpg"));
    }
    QByteArray made(const QByteArray& bytes, bool* profileIgnored = nullptr) const {
        const auto result = make(bytes, m_decoder);
        EXPECT_TRUE(result) << (result ? "" : result.failure().message.toStdString());
        if (result && profileIgnored != nullptr)
            *profileIgnored = result->profileIgnored;
        return result ? read(in("target.jpg")) : QByteArray();
    }
    // Nothing but the source is left.
    void expectRefused(const QByteArray& bytes, Failure::Kind kind, const DoorDecoder& decoder,
                       const QString& words = {}) const {
        fs::remove(in("target.jpg"));
        const auto result = make(bytes, decoder);
        ASSERT_FALSE(result);
        EXPECT_EQ(result.failure().kind, kind) << result.failure().message.toStdString();
        EXPECT_TRUE(result.failure().message.contains(words)) << result.failure().message.toStdString();
        EXPECT_EQ(std::distance(fs::directory_iterator(in("")), fs::directory_iterator()), 1);
    }

    QTemporaryDir m_folder;
    const DoorDecoder m_decoder{LUMORA_DOOR};
    // What an attacker's decoder carries: a picture, before the name of what it does.
    const QByteArray m_carrier = saved(patches(8, 6), "PNG") + saved(patches(8, 6), "JPG") + '\n';
};

using Lab = cmsCIELab;

// What LittleCMS makes of colours in floating point, of the channels a profile has.
std::vector<Lab> labOf(const QByteArray& profile, cmsUInt32Number format, const std::vector<double>& channels) {
    cmsHPROFILE source = profile.isEmpty()
                             ? cmsCreate_sRGBProfile()
                             : cmsOpenProfileFromMem(profile.constData(), cmsUInt32Number(profile.size()));
    cmsHPROFILE srgb = cmsCreate_sRGBProfile();
    cmsHPROFILE lab = cmsCreateLab4Profile(nullptr);
    constexpr auto flags = cmsFLAGS_NOOPTIMIZE | cmsFLAGS_NOCACHE | cmsFLAGS_BLACKPOINTCOMPENSATION;
    cmsHTRANSFORM first = cmsCreateTransform(source, format, srgb, TYPE_RGB_DBL, INTENT_PERCEPTUAL, flags);
    cmsHTRANSFORM second =
        cmsCreateTransform(srgb, TYPE_RGB_DBL, lab, TYPE_Lab_DBL, INTENT_RELATIVE_COLORIMETRIC, flags);
    const auto count = static_cast<cmsUInt32Number>(channels.size() / T_CHANNELS(format));
    std::vector<double> light(std::size_t(count) * 3);
    cmsDoTransform(first, channels.data(), light.data(), count);
    for (double& value : light)
        value = std::clamp(value, 0.0, 1.0);
    std::vector<Lab> result(count);
    cmsDoTransform(second, light.data(), result.data(), count);
    for (cmsHTRANSFORM transform : {first, second})
        cmsDeleteTransform(transform);
    for (cmsHPROFILE one : {source, srgb, lab})
        cmsCloseProfile(one);
    return result;
}

std::vector<Lab> labOf(const QByteArray& profile, const std::vector<QRgb>& colours) {
    std::vector<double> channels;
    for (const QRgb c : colours)
        for (const int value : {qRed(c), qGreen(c), qBlue(c)})
            channels.push_back(value / 255.0);
    return labOf(profile, TYPE_RGB_DBL, channels);
}

void expectColours(const QByteArray& jpeg, const std::vector<Lab>& wanted) {
    const QImage picture = QImage::fromData(jpeg, "JPG");
    ASSERT_FALSE(picture.isNull());
    const std::vector<Lab> found = labOf({}, middlesOf(picture));
    ASSERT_EQ(found.size(), wanted.size());
    double sum = 0, worst = 0;
    for (std::size_t i = 0; i < found.size(); ++i) {
        const double difference = cmsDeltaE(&found[i], &wanted[i]);
        sum += difference;
        worst = std::max(worst, difference);
    }
    EXPECT_LT(sum / double(found.size()), 0.7);
    EXPECT_LT(worst, 3);
}

PictureHeader headerOf(const QByteArray& file) {
    return readPictureHeader(PictureBytes([&](qint64 at, qint64 count) { return file.mid(at, count); }));
}

TEST_F(DoorTest, ColoursOfEveryKindOfFileComeOutAsLittleCmsHasThemInFloats) {
    const QImage picture = patches(256, 192);
    QImage tagged = picture;
    tagged.setColorSpace(QColorSpace::fromIccProfile(adobeProfile()));
    const std::vector<QRgb> colours = middlesOf(picture);
    const QByteArray jpeg = saved(picture, "JPG");
    const std::vector<QRgb> stored = middlesOf(QImage::fromData(jpeg));
    const QByteArray png = saved(picture, "PNG");
    const QByteArray proPhoto = rgbProfile({0.7347, 0.2653, 0.1596, 0.8404, 0.0366, 0.0001}, 1.8);
    const QByteArray broken = p3Profile().replace("acsp", "xxxx"), cut = p3Profile().left(300);
    const QByteArray adobeLights = bigEndian({31270, 32900, 64000, 33000, 21000, 71000, 15000, 6000});
    const QByteArray bt2020 = rgbProfile({0.708, 0.292, 0.170, 0.797, 0.131, 0.046}, 0);
    struct Case {
        const char* name;
        QByteArray file;
        std::vector<Lab> wanted;
        bool profileIgnored = false;
    };
    const Case cases[] = {
        {"P3 in parts", jpegWith(jpeg, {}, p3Profile(), 100), labOf(p3Profile(), stored)},
        {"AdobeRGB", jpegWith(jpeg, {}, adobeProfile()), labOf(adobeProfile(), stored)},
        {"ProPhoto behind 64 KB", jpegWith(jpegWith(jpeg, {}, proPhoto), exif(1) + QByteArray(65000, 'x')),
         labOf(proPhoto, stored)},
        {"R03", jpegWith(jpeg, exif(1, true)), labOf(adobeProfile(), stored)},
        {"R03 with a broken profile", jpegWith(jpeg, exif(1, true), broken), labOf(adobeProfile(), stored), true},
        {"P3 that is cut", jpegWith(jpeg, exif(6), cut), {}, true},
        {"PNG", png, labOf({}, colours)},
        {"PNG of 16 bits", saved(tagged.convertToFormat(QImage::Format_RGBA64), "PNG"), labOf(adobeProfile(), colours)},
        {"PNG with a profile", saved(tagged, "PNG"), labOf(adobeProfile(), colours)},
        {"PNG with gAMA and cHRM", pngWith(png, {{"gAMA", bigEndian({45455})}, {"cHRM", adobeLights}}),
         labOf(rgbProfile({0.64, 0.33, 0.21, 0.71, 0.15, 0.06}, 0), colours)},
        {"PNG with gAMA of 1.8", pngWith(png, {{"gAMA", bigEndian({55556})}}),
         labOf(rgbProfile({0.64, 0.33, 0.30, 0.60, 0.15, 0.06}, 1.8), colours)},
        {"PNG of codes before its profile", pngWith(saved(tagged, "PNG"), {{"cICP", QByteArray("\x09\x0D\0\1", 4)}}),
         labOf(bt2020, colours)},
        {"palette", saved(picture.convertToFormat(QImage::Format_Indexed8, Qt::ThresholdDither), "PNG"),
         labOf({}, colours)},
        {"WebP", webPWith(saved(picture, "WEBP"), exif(1), p3Profile()), labOf(p3Profile(), colours)},
        {"TIFF", saved(tagged, "TIFF"), labOf(adobeProfile(), colours)},
        {"BMP", saved(picture, "BMP"), labOf({}, colours)},
        {"GIF", gif(picture), labOf({}, colours)},
        {"HEIC", heif(picture, {}), labOf({}, colours)},
        {"HEIC of P3", heif(picture, {.profile = p3Profile()}), labOf(p3Profile(), colours)},
        {"HEIC of codes", heif(picture, {.codes = {{12, 13}}}), labOf(p3Profile(), colours)},
        {"a profile before codes", heif(picture, {.profile = adobeProfile(), .codes = {{12, 13}}}),
         labOf(adobeProfile(), colours)},
        {"AVIF of codes", heif(picture, {.avif = true, .codes = {{12, 13}}}), labOf(p3Profile(), colours)},
    };
    for (const Case& one : cases) {
        SCOPED_TRACE(one.name);
        bool profileIgnored = false;
        const QByteArray result = made(one.file, &profileIgnored);
        EXPECT_EQ(profileIgnored, one.profileIgnored);
        if (!one.wanted.empty())
            expectColours(result, one.wanted);
    }
}

TEST_F(DoorTest, GreysAndInksFollowTheirProfiles) {
    const QImage picture = patches(256, 192);
    const QImage grey = QImage::fromData(saved(picture.convertToFormat(QImage::Format_Grayscale8), "JPG"));
    std::vector<double> channels;
    for (const QRgb c : middlesOf(grey))
        channels.push_back(qRed(c) / 255.0);
    const QByteArray profile = greyProfile(1.4);
    expectColours(made(jpegWith(saved(grey.convertToFormat(QImage::Format_Grayscale8), "JPG"), {}, profile)),
                  labOf(profile, TYPE_GRAY_DBL, channels));

    channels.clear();
    for (const QRgb c : middlesOf(picture))
        for (const int light : {qRed(c), qGreen(c), qBlue(c), 0xE0})
            channels.push_back(100 - light / 2.55);
    const QByteArray inks = inksProfile();
    expectColours(made(inksJpeg(picture, inks)), labOf(inks, TYPE_CMYK_DBL, channels));

    // Without one, and with one of light, the inks are turned to light as ever.
    const auto plain = loadPicture(write("inks.jpg", inksJpeg(picture, {})));
    ASSERT_TRUE(plain);
    bool profileIgnored = false;
    expectColours(made(inksJpeg(picture, p3Profile()), &profileIgnored), labOf({}, middlesOf(plain->image())));
    EXPECT_TRUE(profileIgnored);
}

TEST_F(DoorTest, WhatCanBeSeenThroughLiesOnWhite) {
    QImage picture(64, 64, QImage::Format_ARGB32);
    picture.fill(QColor(200, 40, 0, 102));
    const QImage deep = picture.convertToFormat(QImage::Format_RGBA64);
    for (const QByteArray& file : {saved(picture, "PNG"), saved(deep, "PNG"), saved(picture, "WEBP"),
                                   saved(picture, "TIFF"), heif(picture, {}), heif(picture, {.avif = true})}) {
        const QRgb seen = QImage::fromData(made(file)).pixel(32, 32);
        EXPECT_NEAR(qRed(seen), 233, 2);
        EXPECT_NEAR(qGreen(seen), 169, 2);
        EXPECT_NEAR(qBlue(seen), 153, 2);
    }
}

TEST_F(DoorTest, EveryOrientationComesOutUpright) {
    const QByteArray tiffUpright("\x12\1\3\0\1\0\0\0\1", 9);
    constexpr int asStored = 0;
    const QByteArray bareGamma = rgbProfile({0.64, 0.33, 0.30, 0.60, 0.15, 0.06}, 2.2);
    for (const QSize size : {QSize(128, 96), QSize(122, 94), QSize(121, 95)}) {
        const QImage upright = patches(size.width(), size.height());
        for (int orientation = 1; orientation <= 8; ++orientation) {
            const QImage held = heldFor(upright, orientation);
            const bool wholeBlocks = size.width() == 128 || orientation == 5;
            const QByteArray jpeg = saved(held, "JPG", 83);
            const QByteArray tag = exif(orientation);
            std::vector<std::tuple<const char*, QByteArray, int>> cases{
                {"JPEG of other colours", jpegWith(jpeg, tag, bareGamma), 95},
                {"PNG", pngWith(saved(held, "PNG"), {{"eXIf", tag}}), 95},
                {"WebP", webPWith(saved(held, "WEBP"), tag, bareGamma), 95},
                {"TIFF", saved(held, "TIFF").replace(tiffUpright, tiffUpright.left(8) + char(orientation)), 95},
            };
            // The tag of such a file is only told.
            if (size.width() != 122)
                cases.push_back(
                    {"HEIC", heif(held, {.orientation = orientation, .exif = QByteArray(4, '\0') + exif(6)}), 95});
            if (size.width() == 121)
                cases.push_back({"AVIF", heif(held, {.avif = true, .orientation = orientation}), 95});
            if (orientation > 1)
                cases.push_back({"JPEG", jpegWith(jpeg, tag), wholeBlocks ? asStored : 97});
            for (const auto& [name, file, quality] : cases) {
                SCOPED_TRACE(testing::Message() << name << " " << orientation << " " << size.width());
                const QByteArray result = made(file);
                const QImage found = QImage::fromData(result);
                ASSERT_EQ(found.size(), size);
                const PictureHeader::Place small = headerOf(result).thumbnail;
                // What is encoded anew has a small picture.
                EXPECT_EQ(small.length == 0 ? asStored : jpegQuality(result.mid(small.at + small.length)), quality);
                int far = 0;
                const std::vector<QRgb> wanted = middlesOf(upright), seen = middlesOf(found);
                for (std::size_t i = 0; i < seen.size(); ++i)
                    far += std::abs(qGreen(seen[i]) - qGreen(wanted[i])) > 12 ? 1 : 0;
                EXPECT_EQ(far, 0);
            }
        }
    }
}

TEST_F(DoorTest, EachFileGetsNoMoreThanItNeeds) {
    const QByteArray jpeg = saved(patches(64, 48), "JPG");
    const QByteArray png = saved(patches(64, 48), "PNG");
    const QByteArray srgb = srgbProfile("Wide Colours");
    const std::tuple<const char*, QByteArray, DoorNeed> cases[] = {
        {"plain.jpg", jpeg, DoorNeed::Nothing},
        {"CAMERA.JPG", jpegWith(jpeg, exif(1)), DoorNeed::Nothing},
        {"srgb.jpg", jpegWith(jpeg, {}, srgb, 200), DoorNeed::Nothing},
        {"bare-gamma.jpg", jpegWith(jpeg, {}, rgbProfile({0.64, 0.33, 0.30, 0.60, 0.15, 0.06}, 2.2)), DoorNeed::Decode},
        {"broken.jpg", jpegWith(jpeg, {}, srgb.left(200)), DoorNeed::Nothing},
        {"orientation-9.jpg", jpegWith(jpeg, exif(9)), DoorNeed::Nothing},
        {"no-tiff.jpg", jpegWith(jpeg, exif(6).replace(0, 4, "IIII")), DoorNeed::Nothing},
        {"inks.jpg", inksJpeg(patches(64, 48), {}), DoorNeed::Nothing},
        {"mixed.Jpg", jpeg, DoorNeed::Copy},
        {"turned.png", jpegWith(jpeg, exif(8), srgb), DoorNeed::Turn},
        {"r03-and-srgb.jpg", jpegWith(jpeg, exif(1, true), srgb), DoorNeed::Nothing},
        {"lies.jpg", png, DoorNeed::Decode},
    };
    for (const auto& [name, file, need] : cases) {
        const auto found = DoorDecoder::needOf(write(name, file));
        ASSERT_TRUE(found) << name;
        EXPECT_EQ(*found, need) << name;
    }
    EXPECT_EQ(made(jpeg), jpeg);
    std::vector<std::pair<const char*, QByteArray>> chunks(5000, {"IDAT", {}});
    chunks.emplace_back("eXIf", exif(6));
    EXPECT_EQ(headerOf(pngWith(png, chunks)).orientation, 6) << "behind the pixels of a large picture";
}

TEST_F(DoorTest, ATurnWithoutALossMayBeLargerThanAPictureThatIsDecoded) {
    QImage large(12000, 9008, QImage::Format_Grayscale8);
    large.fill(90);
    EXPECT_EQ(headerOf(made(jpegWith(saved(large, "JPG"), exif(6)))).size, (PictureSize{9008, 12000}));
}

TEST_F(DoorTest, TheSmallPictureInTheHeaderIsFoundAndWritten) {
    const QByteArray small = saved(patches(32, 24), "JPG");
    const QByteArray camera = jpegWith(saved(patches(64, 48), "JPG"), exif(3, false, small));
    const PictureHeader header = headerOf(camera);
    EXPECT_EQ(camera.mid(header.thumbnail.at, header.thumbnail.length), small);
    EXPECT_EQ(header.size, (PictureSize{64, 48}));

    const QByteArray result = made(saved(patches(320, 240), "PNG"));
    const PictureHeader own = headerOf(result);
    const QImage drawn = QImage::fromData(result.mid(own.thumbnail.at, own.thumbnail.length));
    ASSERT_EQ(drawn.size(), QSize(160, 120));
    expectColours(saved(drawn, "JPG"), labOf({}, middlesOf(patches(320, 240))));
}

TEST_F(DoorTest, ADraftIsTheSmallPictureOfTheFileUprightAndInSrgb) {
    const QImage picture = patches(256, 192);
    for (const bool avif : {false, true}) {
        const HeifKind kind{.avif = avif, .profile = p3Profile(), .orientation = 6, .small = 128};
        const auto draft = m_decoder.draft(write("source", heif(heldFor(picture, 6), kind)));
        ASSERT_TRUE(draft);
        EXPECT_EQ(QImage::fromData(*draft).size(), QSize(128, 96));
        expectColours(*draft, labOf(p3Profile(), middlesOf(picture)));
    }
    for (const QByteArray& without : {heif(picture, {}), saved(picture, "PNG")})
        EXPECT_EQ(m_decoder.draft(write("source", without)).failure().kind, Failure::Kind::Unsupported);
}

TEST_F(DoorTest, FilesThatAreCutShortAreDamagedAndLeaveNothing) {
    for (const auto& [name, file] : samplePictureFiles()) {
        for (const int percent : {30, 60, 95}) {
            SCOPED_TRACE(testing::Message() << name << " " << percent);
            expectRefused(file.left(file.size() * percent / 100), Failure::Kind::Damaged, m_decoder);
        }
    }
}

QByteArray damaged(QByteArray bytes, std::mt19937& random) {
    const auto place = [&](qsizetype size) { return static_cast<qsizetype>(random() % static_cast<unsigned>(size)); };
    for (unsigned left = 1 + random() % 3; left > 0 && bytes.size() > 1; --left) {
        // Headers are short and decide much.
        const qsizetype at = place(random() % 2 == 0 ? std::min<qsizetype>(bytes.size(), 700) : bytes.size());
        const unsigned way = random() % 8;
        if (way == 0)
            bytes.truncate(at);
        else if (way == 1)
            bytes.remove(at, 1 + place(64));
        else if (way == 2)
            bytes.insert(at, bytes.mid(place(bytes.size()), 1 + place(64)));
        else
            bytes[at] = static_cast<char>(random() % 4 == 0 ? 0xFF : random());
    }
    return bytes;
}

// Each repetition plays others.
TEST_F(DoorTest, DamagedFilesGiveAWholePictureOrAFailureAndNothingElse) {
    static std::mt19937 random(1);
    const auto files = samplePictureFiles();
    for (std::size_t i = 0; i < 100; ++i) {
        const auto& [name, whole] = files[i % files.size()];
        SCOPED_TRACE(testing::Message() << name << " " << i);
        fs::remove(in("target.jpg"));
        const auto result = make(damaged(whole, random), m_decoder);
        EXPECT_EQ(fs::exists(in("target.jpg")), result.ok());
        const auto draft = m_decoder.draft(in("source"));
        EXPECT_TRUE(!draft || !QImage::fromData(*draft).isNull());
        EXPECT_EQ(std::distance(fs::directory_iterator(in("")), fs::directory_iterator()), result ? 2 : 1);
        if (result && *DoorDecoder::needOf(in("source")) >= DoorNeed::Turn) {
            EXPECT_TRUE(checkJpegDecodes(in("target.jpg")));
        }
    }
}

TEST_F(DoorTest, ARefusalTellsWhyAndLeavesNothing) {
    const QByteArray png = saved(patches(1200, 900), "PNG");
    QByteArray large = saved(patches(64, 48), "BMP");
    large.replace(18, 8, QByteArray("\xE0\x2E\0\0\x10\x27\0\0", 8));
    expectRefused({}, Failure::Kind::Damaged, m_decoder);
    expectRefused("no picture", Failure::Kind::Unsupported, m_decoder);
    expectRefused(large, Failure::Kind::TooLarge, m_decoder);
    const QString dynamic = u"high dynamic range"_s;
    expectRefused(pngWith(png, {{"cICP", QByteArray("\x09\x10\0\1", 4)}}), Failure::Kind::Unsupported, m_decoder,
                  dynamic);
    for (const int curve : {16, 18})
        expectRefused(heif(patches(64, 64), {.codes = {{9, curve}}}), Failure::Kind::Unsupported, m_decoder, dynamic);
    const QByteArray heic = heif(patches(64, 64), {});
    const QByteArray huge = QByteArray(heic).replace(heic.indexOf("ispe") + 8, 4, bigEndian({70000}));
    expectRefused(huge, Failure::Kind::TooLarge, m_decoder);
    expectRefused(QByteArray(heic).replace(heic.indexOf("infe") + 12, 4, "vvc1"), Failure::Kind::Unsupported,
                  m_decoder);
    EXPECT_EQ(DoorDecoder::needOf("/proc/self/mem").failure().kind, Failure::Kind::NotFound) << "no address 0";
    if (memoryIsLimited)
        expectRefused(png, Failure::Kind::TooLarge, DoorDecoder(LUMORA_DOOR, {30, 32 << 20}));
    expectRefused(png, Failure::Kind::NoProgram, DoorDecoder(in("nowhere")));
}

TEST_F(DoorTest, ADecoderThatWasTakenOverDoesNoHarm) {
    using Kind = Failure::Kind;
    const auto after = [](int seconds) { return DoorDecoder(LUMORA_DOOR_MISBEHAVING, {seconds, qint64(256) << 20}); };
    const DoorDecoder decoder = after(30);
    EXPECT_TRUE(make(m_carrier + "behaves", decoder));
    const std::pair<Kind, std::vector<const char*>> ends[] = {
        {Kind::TimedOut, {"loops", "waits"}},
        {Kind::TooLarge, {"is killed", memoryIsLimited ? "eats memory" : "is killed"}},
        {Kind::Other, {"reads a file", "opens the net", "begins a process", "aborts its parent", "runs its own code"}},
        {Kind::NotFound, {"says that it read nothing"}},
        {Kind::Damaged, {"aborts", "says done of rubbish", "says done of a PNG", "says done of half"}},
    };
    // A signal that comes again and again begins no wait anew.
    ::signal(SIGALRM, [](int) {});
    ::ualarm(300'000, 300'000);
    for (const auto& [kind, deeds] : ends) {
        for (const char* deed : deeds) {
            SCOPED_TRACE(deed);
            expectRefused(m_carrier + deed, kind, kind == Kind::TimedOut ? after(1) : decoder);
        }
    }
    ::ualarm(0, 0);
    ::signal(SIGCHLD, SIG_IGN);
    expectRefused(m_carrier + "behaves", Kind::Other, decoder, u"end"_s); // nobody keeps its status
    ::signal(SIGCHLD, SIG_DFL);
}

TEST_F(DoorTest, ADecoderEndsWithItsParentAndBeginsForNoOther) {
    const std::string source = "3<'" + write("source", m_carrier + "waits").string() + "' 4>/dev/null >&4 2>&4 ";
    const std::string parent = "'" LUMORA_DOOR_MISBEHAVING "' --child 60 1073741824 $$ " + source + "& echo $! >'" +
                               in("id").string() + "'; until grep -q 'Seccomp:.2' /proc/$!/status; do :; done; " +
                               "kill -KILL $$";
    EXPECT_NE(std::system(parent.c_str()), 0);
    const Descriptor child(static_cast<int>(::syscall(SYS_pidfd_open, read(in("id")).toInt(), 0)));
    pollfd ended{child.number(), POLLIN, 0};
    EXPECT_TRUE(!child.valid() || ::poll(&ended, 1, 20'000) == 1);
    for (const auto& [id, status] : {std::pair("$$", DoorStatus::NotRead), {"1", DoorStatus::NotConfined}}) {
        const auto call = std::string("'" LUMORA_DOOR "' --child 5 1073741824 ") + id + " 3</proc/self/mem; exit $?";
        EXPECT_EQ(static_cast<DoorStatus>(WEXITSTATUS(std::system(call.c_str()))), status);
    }
}

} // namespace
} // namespace lumora
