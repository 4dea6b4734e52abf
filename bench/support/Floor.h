#pragma once

#include "imaging/files/JpegReader.h"
#include "samples/ReferenceScaling.h"

#include <QByteArray>

#include <algorithm>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

// What the benchmarks share: planes as they come out of a file, and the floor below every way to make a print.
namespace lumora {

// Decoded and forgotten.
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

// Kept whole.
class WholePlanes : public PlaneTaker {
public:
    void begin(const std::vector<PlaneLayout>& planes) override {
        m_layouts = planes;
        for (const PlaneLayout& plane : planes)
            m_rows.emplace_back(static_cast<std::size_t>(plane.height + plane.rowsAtOnce) *
                                static_cast<std::size_t>(plane.rowBytes));
    }
    unsigned char* row(int plane, int y) override {
        const auto i = static_cast<std::size_t>(plane);
        return m_rows[i].data() + std::ptrdiff_t{y} * m_layouts[i].rowBytes;
    }
    void rowsReady() override {}

    const std::vector<PlaneLayout>& layouts() const { return m_layouts; }
    ReferencePlane plane(int index) {
        const PlaneLayout& layout = m_layouts[static_cast<std::size_t>(index)];
        ReferencePlane plane{layout.width, layout.height, {}};
        for (int y = 0; y < layout.height; ++y)
            plane.samples.insert(plane.samples.end(), row(index, y), row(index, y) + layout.width);
        return plane;
    }

private:
    std::vector<PlaneLayout> m_layouts;
    std::vector<std::vector<unsigned char>> m_rows;
};

// Ends the program with this line where the file can't be read.
[[noreturn]] void fail(const std::string& what);
std::unique_ptr<JpegReader> readerOf(const std::filesystem::path& file);

WholePlanes wholePlanesOf(const std::filesystem::path& file);

// The floor of a print: the whole source decoded to planes and thrown away, and the print's ready-made planes encoded
// at quality 90. writeFloorPlanes keeps the planes of a finished print as a file, so that the floor has them without
// work.
void writeFloorPlanes(const QByteArray& print, const std::filesystem::path& planes);
QByteArray floorOf(const std::filesystem::path& source, PictureSize print, const std::filesystem::path& planes);

void writeBytes(const std::filesystem::path& file, const QByteArray& bytes);

// The high-water mark of this program alone; that of the operating system's accounting starts with the parent's.
void printPeakMemory();

} // namespace lumora
