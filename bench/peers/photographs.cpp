#include "common/HostFile.h"
#include "samples/SamplePhotographs.h"
#include "samples/SamplePictureFiles.h"

#include <cstdio>
#include <cstdlib>

// photographs FOLDER COUNT [WIDTH HEIGHT]: 4000 x 3000 if no size is given; all of them landscape, so that one box
// means the same print to every peer. Each has a small picture in its header, as a camera's.
int main(int argc, char** argv) {
    if (argc != 3 && argc != 5)
        return 2;
    const lumora::PictureSize size{argc == 5 ? std::atoi(argv[3]) : 4000, argc == 5 ? std::atoi(argv[4]) : 3000};
    for (int i = 1; i <= std::atoi(argv[2]); ++i) {
        const std::filesystem::path path = std::filesystem::path(argv[1]) / ("IMG_" + std::to_string(100 + i) + ".jpg");
        const auto seed = static_cast<unsigned>(i);
        const QByteArray small = lumora::samplePhotographFile({160, 120}, seed);
        const auto bytes = lumora::jpegWith(lumora::samplePhotographFile(size, seed), lumora::exif(1, false, small));
        if (const auto written = lumora::writeWholeFile(path, bytes); !written) {
            std::fprintf(stderr, "%s\n", qPrintable(written.failure().message));
            return 1;
        }
    }
    return 0;
}
