#include "Scenes.h"

#include "common/HostFile.h"
#include "samples/SamplePhotographs.h"
#include "samples/SamplePictureFiles.h"

#include <atomic>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <string_view>
#include <thread>
#include <vector>

using namespace lumora;

namespace {

using demo::Scene;

// Among the pictures of tests: of one size, so that a scenario finds the red eyes at the same pixels.
constexpr double portraitMegapixels = 3;
constexpr auto hebrewName = u8"סבתא בחוף.jpg";

// IMG_0001.jpg and so on, the last one with a Hebrew name.
Result<void> writeScenes(const std::filesystem::path& folder) {
    constexpr double megapixels = 12;
    std::vector<Result<void>> written(demo::sceneCount, Result<void>());
    std::atomic<int> next{0};
    const auto work = [&] {
        for (int i = next++; i < demo::sceneCount; i = next++) {
            const std::string number = std::to_string(10000 + i + 1).substr(1);
            const auto name = i + 1 < demo::sceneCount ? std::filesystem::path("IMG_" + number + ".jpg")
                                                       : std::filesystem::path(hebrewName);
            written[static_cast<std::size_t>(i)] = saveJpeg(demo::scene(Scene(i), megapixels), folder / name, 92);
        }
    };
    {
        std::jthread second(work);
        work();
    }
    for (const Result<void>& one : written) {
        if (!one)
            return one;
    }
    return {};
}

// What a telephone and a camera write beside ordinary pictures.
Result<void> writePhonePictures(const std::filesystem::path& folder) {
    const auto photograph = [](Scene which) { return demo::scene(which, 1.2).image(); };
    QImage logo = demo::scene(Scene::Snow, 0.81).image().convertToFormat(QImage::Format_ARGB32);
    for (int y = 0; y < logo.height(); ++y) {
        for (int x = 0; x < logo.width(); ++x) {
            if (std::hypot(x - 450, y - 450) > 440)
                logo.setPixelColor(x, y, Qt::transparent);
        }
    }
    const std::pair<const char*, QByteArray> files[] = {
        {"IMG_0001.jpg", saved(photograph(Scene::Cat), "JPG", 92)},
        {"IMG_0002.jpg", saved(photograph(Scene::Beach), "JPG", 92)},
        {"IMG_0003.HEIC", heif(photograph(Scene::Market), {.profile = p3Profile()})},
        {"IMG_0004.JPG", jpegWith(saved(heldFor(photograph(Scene::Kite), 6), "JPG", 92), exif(6))},
        {"IMG_0005.jpg", jpegWith(saved(photograph(Scene::Mountains), "JPG", 92), {}, adobeProfile())},
        {"café.png", saved(logo, "PNG")},
    };
    for (const auto& [name, bytes] : files) {
        if (const Result<void> written = writeWholeFile(folder / name, bytes); !written)
            return written;
    }
    return {};
}

} // namespace

// Fills a folder with generated photographs. FOLDER alone gets a dozen calm scenes; with COUNT pictures full of detail
// for the tests, the last one with a Hebrew name, as customers' files have them, the one before it a face with red
// eyes; with --phone two ordinary pictures and four that are none.
int main(int argc, char** argv) {
    const auto told = [](const Result<void>& written) {
        if (!written)
            std::fprintf(stderr, "%s\n", qUtf8Printable(written.failure().message));
        return written ? 0 : 1;
    };
    const bool phone = argc == 3 && argv[1] == std::string_view("--phone");
    if (phone || argc == 2) {
        std::error_code error;
        std::filesystem::create_directories(argv[argc - 1], error);
        return told(phone ? writePhonePictures(argv[2]) : writeScenes(argv[1]));
    }
    const int count = argc > 2 ? std::atoi(argv[2]) : 0;
    const double megapixels = argc > 3 ? std::atof(argv[3]) : 12;
    if (argc < 2 || argc > 4 || count < 1 || count > 9999 || megapixels < 0.01 || megapixels > 200) {
        std::fprintf(stderr, "usage: %s FOLDER\n       %s FOLDER COUNT [MEGAPIXELS]\n       %s --phone FOLDER\n",
                     argv[0], argv[0], argv[0]);
        return 2;
    }
    try {
        const std::filesystem::path folder = argv[1];
        std::filesystem::create_directories(folder);
        const auto written = writeSamplePhotographs(folder, count, megapixels);
        if (!written)
            return told(written.failure());
        if (count > 1) {
            const auto portrait = demo::scene(Scene::Portrait, portraitMegapixels);
            if (const auto saved = saveJpeg(portrait, written->rbegin()[1], 92); !saved)
                return told(saved);
        }
        std::filesystem::rename(written->back(), folder / hebrewName);
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "%s\n", failure.what());
        return 1;
    }
    return 0;
}
