// ours paper KERNELS FOLDER FILE... | ours floor - FOLDER FILE... | ours small THREADS FOLDER FILE... | ours idle - - -
// ours planes - FOLDER FILE... makes what floor reads.
// KERNELS is "best" or a name of allKernels. "floor" decodes to planes and encodes planes of the print's size, no
// scaling between.

#include "imaging/JpegWriter.h"
#include "imaging/Resample.h"

#include <QFile>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <string>

using namespace lumora;

namespace {

PictureSize paperSize(PictureSize source) {
    const int width = source.height >= source.width ? 1200 : 1800;
    return {width, static_cast<int>(std::lround(static_cast<double>(source.height) * width / source.width))};
}

[[noreturn]] void fail(const char* what) {
    std::fprintf(stderr, "%s\n", what);
    std::exit(1);
}

std::unique_ptr<JpegReader> readerOf(const char* file) {
    auto input = PictureInput::open(file);
    if (!input)
        fail(file);
    auto reader = JpegReader::open(std::move(*input));
    if (!reader)
        fail(file);
    return std::move(*reader);
}

void write(const std::string& folder, const char* source, const QByteArray& bytes) {
    const std::string name = folder + "/" + std::filesystem::path(source).filename().string();
    std::FILE* file = std::fopen(name.c_str(), "wb");
    if (file == nullptr || std::fwrite(bytes.constData(), 1, static_cast<std::size_t>(bytes.size()), file) !=
                               static_cast<std::size_t>(bytes.size()))
        fail(name.c_str());
    std::fclose(file);
}

class DroppedPlanes : public PlaneTaker {
public:
    void begin(const std::vector<PlaneLayout>& planes) override {
        m_planes = planes;
        for (const PlaneLayout& plane : planes)
            m_rows.emplace_back(static_cast<std::size_t>(plane.rowsAtOnce) * static_cast<std::size_t>(plane.rowBytes));
    }
    unsigned char* row(int plane, int y) override {
        const auto i = static_cast<std::size_t>(plane);
        return m_rows[i].data() + std::ptrdiff_t{y % m_planes[i].rowsAtOnce} * m_planes[i].rowBytes;
    }
    void rowsReady() override {}

private:
    std::vector<PlaneLayout> m_planes;
    std::vector<std::vector<unsigned char>> m_rows;
};

// The planes of a print as they lie in a file: what the floor encodes.
struct PrintPlanes : PlaneTaker {
    std::vector<PlaneLayout> layouts;
    std::vector<unsigned char> bytes;
    std::size_t starts[3] = {};

    void begin(const std::vector<PlaneLayout>& planes) override {
        layouts = planes;
        std::size_t end = 0;
        for (std::size_t i = 0; i < planes.size(); ++i) {
            starts[i] = end;
            end += static_cast<std::size_t>(planes[i].height + planes[i].rowsAtOnce) *
                   static_cast<std::size_t>(planes[i].rowBytes);
        }
        bytes.resize(end);
    }
    unsigned char* row(int plane, int y) override {
        const auto i = static_cast<std::size_t>(plane);
        return bytes.data() + starts[i] + std::ptrdiff_t{y} * layouts[i].rowBytes;
    }
    void rowsReady() override {}
};

std::string planesFile(const std::string& folder, const char* file) {
    return folder + "/" + std::filesystem::path(file).stem().string() + ".planes";
}

// Into FOLDER the planes of each print, so that the floor has them without work.
void writePlanes(const std::string& folder, const char* file) {
    const auto print = readResampledToJpeg(*readerOf(file), paperSize(readerOf(file)->size()), 100);
    const std::string path = planesFile(folder, file);
    write(folder, "print.jpg", *print);
    PrintPlanes planes;
    if (!readerOf((folder + "/print.jpg").c_str())->readPlanes(1, planes))
        fail(file);
    std::FILE* out = std::fopen(path.c_str(), "wb");
    if (out == nullptr || std::fwrite(planes.bytes.data(), 1, planes.bytes.size(), out) != planes.bytes.size())
        fail(path.c_str());
    std::fclose(out);
}

QByteArray floorOf(const std::string& folder, const char* file) {
    auto reader = readerOf(file);
    const PictureSize size = paperSize(reader->size());
    DroppedPlanes dropped;
    if (!reader->readPlanes(1, dropped))
        fail(file);
    PrintPlanes planes;
    const auto layout = [](int width, int height, int rows) {
        return PlaneLayout{width, height, 1, 1, rows, (width + 7) / 8 * 8};
    };
    planes.begin({layout(size.width, size.height, 16), layout((size.width + 1) / 2, (size.height + 1) / 2, 8),
                  layout((size.width + 1) / 2, (size.height + 1) / 2, 8)});
    std::FILE* in = std::fopen(planesFile(folder, file).c_str(), "rb");
    if (in == nullptr || std::fread(planes.bytes.data(), 1, planes.bytes.size(), in) != planes.bytes.size())
        fail("run the mode planes first");
    std::fclose(in);
    JpegWriter writer(size, 90, JpegWriter::Input::Planes);
    for (int top = 0; top < size.height; top += JpegWriter::lumaRows) {
        JpegWriter::PlaneRows rows{};
        for (int y = 0; y < JpegWriter::lumaRows; ++y)
            rows.luma[static_cast<std::size_t>(y)] = planes.row(0, std::min(top + y, size.height - 1));
        for (int y = 0; y < JpegWriter::chromaRows; ++y) {
            rows.cb[static_cast<std::size_t>(y)] = planes.row(1, std::min(top / 2 + y, (size.height + 1) / 2 - 1));
            rows.cr[static_cast<std::size_t>(y)] = planes.row(2, std::min(top / 2 + y, (size.height + 1) / 2 - 1));
        }
        writer.planeRows(rows);
    }
    return *writer.finish();
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
                write(folder, argv[4 + i], *encodeJpeg(*picture, 75));
            }
        }
    }
    for (int i = 4; i < argc; ++i) {
        if (mode == "paper") {
            auto reader = readerOf(argv[i]);
            const auto bytes = readResampledToJpeg(*reader, paperSize(reader->size()), 90, kernelsNamed(argv[2]));
            if (!bytes)
                fail(argv[i]);
            write(folder, argv[i], *bytes);
        } else if (mode == "floor") {
            write(folder, argv[i], floorOf(folder, argv[i]));
        } else if (mode == "planes") {
            writePlanes(folder, argv[i]);
        }
    }
    // The high-water mark of this program alone; that of the operating system's accounting starts with the parent's.
    std::ifstream status("/proc/self/status");
    for (std::string line; std::getline(status, line);) {
        if (line.starts_with("VmHWM:"))
            std::printf("%s\n", line.c_str() + 6);
    }
    return 0;
}
