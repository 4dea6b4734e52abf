// ours MODE VARIANT FOLDER FILE... does to the files what MODE says and writes into FOLDER.
// paper KERNELS: KERNELS is "best" or a name of allKernels. floor -: decodes to planes and encodes planes of the
// print's size, no scaling between. planes -: makes what floor reads. small THREADS, drafts -: pictures of cells. idle
// -: nothing, without files.

#include "Floor.h"
#include "door/PictureDraft.h"
#include "imaging/scaling/Resample.h"

#include <cmath>
#include <cstdlib>
#include <cstring>
#include <string>

using namespace lumora;

namespace {

PictureSize paperSize(PictureSize source) {
    const int width = source.height >= source.width ? 1200 : 1800;
    return {width, static_cast<int>(std::lround(static_cast<double>(source.height) * width / source.width))};
}

std::filesystem::path target(const std::string& folder, const char* source, const char* ending = ".jpg") {
    return folder + "/" + std::filesystem::path(source).stem().string() + ending;
}

const ResampleKernels& kernelsNamed(const std::string& name) {
    if (name == "best")
        return bestKernels();
    static const auto all = allKernels();
    for (const NamedKernels& one : all) {
        if (one.name == name)
            return one.kernels;
    }
    fail("no such kernels on this machine");
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 4)
        return 2;
    const std::string mode = argv[1];
    const std::string folder = argv[3];
    if (mode == "small") {
        // One thread is one call a picture; two are what a page does.
        const std::vector<std::filesystem::path> paths(argv + 4, argv + argc);
        const int atOnce = std::strcmp(argv[2], "1") == 0 ? 1 : static_cast<int>(paths.size());
        for (std::size_t i = 0; i < paths.size(); i += static_cast<std::size_t>(atOnce)) {
            const auto pictures = loadSmallPictures({paths.begin() + static_cast<std::ptrdiff_t>(i),
                                                     paths.begin() + static_cast<std::ptrdiff_t>(i) + atOnce},
                                                    115);
            for (const auto& picture : pictures) {
                if (!picture)
                    fail("not read");
                writeBytes(target(folder, argv[4 + i]), *encodeJpeg(*picture, 75));
            }
        }
    }
    for (int i = 4; i < argc; ++i) {
        if (mode == "drafts")
            writeBytes(target(folder, argv[i]), *encodeJpeg(pictureDraft(argv[i], 115, Held::Upright), 75));
        if (mode == "paper") {
            auto reader = readerOf(argv[i]);
            const auto bytes = readResampledToJpeg(*reader, paperSize(reader->size()), 90, kernelsNamed(argv[2]));
            if (!bytes)
                fail(argv[i]);
            writeBytes(target(folder, argv[i]), *bytes);
        } else if (mode == "floor") {
            writeBytes(target(folder, argv[i]),
                       floorOf(argv[i], paperSize(readerOf(argv[i])->size()), target(folder, argv[i], ".planes")));
        } else if (mode == "planes") {
            writeFloorPlanes(*readResampledToJpeg(*readerOf(argv[i]), paperSize(readerOf(argv[i])->size()), 100),
                             target(folder, argv[i], ".planes"));
        }
    }
    printPeakMemory();
    return 0;
}
