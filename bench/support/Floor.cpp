#include "Floor.h"

#include "imaging/files/JpegWriter.h"

#include <QTemporaryDir>

#include <cstdio>
#include <cstdlib>
#include <fstream>

namespace lumora {

namespace {

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

} // namespace

void fail(const std::string& what) {
    std::fprintf(stderr, "%s\n", what.c_str());
    std::exit(1);
}

std::unique_ptr<JpegReader> readerOf(const std::filesystem::path& file) {
    auto input = PictureInput::open(file);
    if (!input)
        fail(file);
    auto reader = JpegReader::open(std::move(*input));
    if (!reader)
        fail(file);
    return std::move(*reader);
}

WholePlanes wholePlanesOf(const std::filesystem::path& file) {
    WholePlanes planes;
    if (!readerOf(file)->readPlanes(1, planes))
        fail(file);
    return planes;
}

void writeBytes(const std::filesystem::path& path, const QByteArray& bytes) {
    std::FILE* file = std::fopen(path.c_str(), "wb");
    if (file == nullptr || std::fwrite(bytes.constData(), 1, static_cast<std::size_t>(bytes.size()), file) !=
                               static_cast<std::size_t>(bytes.size()))
        fail(path);
    std::fclose(file);
}

void writeFloorPlanes(const QByteArray& print, const std::filesystem::path& path) {
    const QTemporaryDir folder;
    const std::filesystem::path jpeg = folder.path().toStdString() + "/print.jpg";
    writeBytes(jpeg, print);
    PrintPlanes planes;
    if (!readerOf(jpeg)->readPlanes(1, planes))
        fail(jpeg);
    writeBytes(path, QByteArray::fromRawData(reinterpret_cast<const char*>(planes.bytes.data()),
                                             static_cast<qsizetype>(planes.bytes.size())));
}

QByteArray floorOf(const std::filesystem::path& source, PictureSize size, const std::filesystem::path& path) {
    DroppedPlanes dropped;
    if (!readerOf(source)->readPlanes(1, dropped))
        fail(source);
    PrintPlanes planes;
    const auto layout = [](int width, int height, int rows) {
        return PlaneLayout{width, height, 1, 1, rows, (width + 7) / 8 * 8};
    };
    planes.begin({layout(size.width, size.height, 16), layout((size.width + 1) / 2, (size.height + 1) / 2, 8),
                  layout((size.width + 1) / 2, (size.height + 1) / 2, 8)});
    std::FILE* in = std::fopen(path.c_str(), "rb");
    if (in == nullptr || std::fread(planes.bytes.data(), 1, planes.bytes.size(), in) != planes.bytes.size())
        fail(path.string() + ": make the planes first");
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

void printPeakMemory() {
    std::ifstream status("/proc/self/status");
    for (std::string line; std::getline(status, line);) {
        if (line.starts_with("VmHWM:"))
            std::printf("%s\n", line.c_str() + 6);
    }
}

} // namespace lumora
