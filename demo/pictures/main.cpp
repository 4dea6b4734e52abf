#include "Portrait.h"

#include "common/HostFile.h"
#include "samples/SamplePhotographs.h"
#include "samples/SamplePictureFiles.h"

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string_view>

using namespace lumora;

namespace {

// Of one size, so that a scenario finds the red eyes at the same pixels.
constexpr int portraitWidth = 1500;

// What a telephone and a camera write beside ordinary pictures.
Result<void> writePhonePictures(const std::filesystem::path& folder) {
    unsigned seed = 1;
    const auto photograph = [&seed](int width, int height) {
        return samplePhotograph({width, height}, seed++).image();
    };
    QImage logo = photograph(900, 900).convertToFormat(QImage::Format_ARGB32);
    for (int y = 0; y < logo.height(); ++y) {
        for (int x = 0; x < logo.width(); ++x) {
            if (std::hypot(x - 450, y - 450) > 440)
                logo.setPixelColor(x, y, Qt::transparent);
        }
    }
    const std::pair<const char*, QByteArray> files[] = {
        {"IMG_0001.jpg", saved(photograph(1350, 900), "JPG", 92)},
        {"IMG_0002.jpg", saved(photograph(1350, 900), "JPG", 92)},
        {"IMG_0003.HEIC", heif(photograph(1350, 900), {.profile = p3Profile()})},
        {"IMG_0004.JPG", jpegWith(saved(heldFor(photograph(896, 1344), 6), "JPG", 92), exif(6))},
        {"IMG_0005.jpg", jpegWith(saved(photograph(1350, 900), "JPG", 92), {}, adobeProfile())},
        {"café.png", saved(logo, "PNG")},
    };
    for (const auto& [name, bytes] : files) {
        if (const Result<void> written = writeWholeFile(folder / name, bytes); !written)
            return written;
    }
    return {};
}

} // namespace

// Fills a folder with generated photographs for the demo and the tests. The last one has a Hebrew name, as customers'
// files do; the one before it is a face with red eyes. With --phone: two ordinary pictures and four that are none.
int main(int argc, char** argv) {
    if (argc == 3 && argv[1] == std::string_view("--phone")) {
        std::error_code error;
        std::filesystem::create_directories(argv[2], error);
        const auto written = writePhonePictures(argv[2]);
        if (!written)
            std::fprintf(stderr, "%s\n", qUtf8Printable(written.failure().message));
        return written ? 0 : 1;
    }
    const int count = argc > 2 ? std::atoi(argv[2]) : 12;
    const double megapixels = argc > 3 ? std::atof(argv[3]) : 12;
    if (argc < 2 || argc > 4 || count < 1 || count > 9999 || megapixels < 0.01 || megapixels > 200) {
        std::fprintf(stderr, "usage: %s FOLDER [COUNT [MEGAPIXELS]]\n       %s --phone FOLDER\n", argv[0], argv[0]);
        return 2;
    }
    try {
        const std::filesystem::path folder = argv[1];
        std::filesystem::create_directories(folder);
        const auto written = writeSamplePhotographs(folder, count, megapixels);
        if (!written) {
            std::fprintf(stderr, "%s\n", qUtf8Printable(written.failure().message));
            return 1;
        }
        if (count > 1) {
            const auto saved = saveJpeg(demo::portrait(portraitWidth), written->rbegin()[1], 92);
            if (!saved) {
                std::fprintf(stderr, "%s\n", qUtf8Printable(saved.failure().message));
                return 1;
            }
        }
        std::filesystem::rename(written->back(), folder / u8"סבתא בחוף.jpg");
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "%s\n", failure.what());
        return 1;
    }
    return 0;
}
