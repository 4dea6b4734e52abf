#include "Portrait.h"

#include "samples/SamplePhotographs.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>

using namespace lumora;

namespace {

// Of one size, so that a scenario finds the red eyes at the same pixels.
constexpr int portraitWidth = 1500;

} // namespace

// Fills a folder with generated photographs for the demo and the tests. The last one has a Hebrew name, as customers'
// files do; the one before it is a face with red eyes.
int main(int argc, char** argv) {
    const int count = argc > 2 ? std::atoi(argv[2]) : 12;
    const double megapixels = argc > 3 ? std::atof(argv[3]) : 12;
    if (argc < 2 || argc > 4 || count < 1 || count > 9999 || megapixels < 0.01 || megapixels > 200) {
        std::fprintf(stderr, "usage: %s FOLDER [COUNT [MEGAPIXELS]]\n", argv[0]);
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
