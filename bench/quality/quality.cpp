// Luma of prints against an antialiased bicubic in double precision: before encoding, and what quality 90 loses beside
// the exact picture encoded in the same way.

#include "Floor.h"
#include "imaging/files/JpegWriter.h"
#include "imaging/scaling/PlaneScaler.h"
#include "imaging/scaling/Resample.h"

#include <QTemporaryDir>

#include <algorithm>
#include <cmath>
#include <cstdio>

using namespace lumora;

namespace {

ReferencePlane lumaOfJpeg(const QByteArray& bytes) {
    const QTemporaryDir folder;
    const std::filesystem::path path = folder.path().toStdString() + "/a.jpg";
    writeBytes(path, bytes);
    return wholePlanesOf(path).plane(0);
}

// The exact planes, rounded, through the same encoder.
QByteArray encodeExact(const ReferencePlane& luma, const ReferencePlane& cb, const ReferencePlane& cr) {
    JpegWriter writer({luma.width, luma.height}, 90, JpegWriter::Input::Planes);
    const auto padded = [](const ReferencePlane& plane) {
        std::vector<std::vector<unsigned char>> rows;
        for (int y = 0; y < plane.height; ++y) {
            auto& row = rows.emplace_back();
            for (int x = 0; x < plane.width + 8; ++x)
                row.push_back(static_cast<unsigned char>(std::lround(
                    plane.samples[static_cast<std::size_t>(y) * plane.width + std::min(x, plane.width - 1)])));
        }
        return rows;
    };
    auto lumaRows = padded(luma);
    auto cbRows = padded(cb);
    auto crRows = padded(cr);
    for (int top = 0; top < luma.height; top += JpegWriter::lumaRows) {
        JpegWriter::PlaneRows rows{};
        for (int y = 0; y < JpegWriter::lumaRows; ++y)
            rows.luma[static_cast<std::size_t>(y)] =
                lumaRows[static_cast<std::size_t>(std::min(top + y, luma.height - 1))].data();
        for (int y = 0; y < JpegWriter::chromaRows; ++y) {
            const auto at = static_cast<std::size_t>(std::min(top / 2 + y, cb.height - 1));
            rows.cb[static_cast<std::size_t>(y)] = cbRows[at].data();
            rows.cr[static_cast<std::size_t>(y)] = crRows[at].data();
        }
        writer.planeRows(rows);
    }
    return *writer.finish();
}

} // namespace

int main(int argc, char** argv) {
    std::printf("%-20s %12s %12s %12s %8s\n", "picture", "before JPEG", "exact at 90", "ours at 90", "lost dB");
    double worst = 1000;
    double mostLost = 0;
    for (int i = 1; i < argc; ++i) {
        WholePlanes whole = wholePlanesOf(argv[i]);
        if (whole.layouts().size() != 3) {
            std::fprintf(stderr, "%s: can't be read as planes\n", argv[i]);
            return 1;
        }
        const PlaneLayout luma = whole.layouts()[0];
        const int width = luma.height >= luma.width ? 1200 : 1800;
        const int height = static_cast<int>(std::lround(static_cast<double>(luma.height) * width / luma.width));
        const double stepX = static_cast<double>(luma.width) / width;
        const double stepY = static_cast<double>(luma.height) / height;
        const auto exact = [&](int plane) {
            const PlaneLayout& layout = whole.layouts()[static_cast<std::size_t>(plane)];
            const int pitch = plane == 0 ? 1 : 2;
            return referenceScaled(whole.plane(plane), (width + pitch - 1) / pitch, (height + pitch - 1) / pitch,
                                   stepX * pitch / layout.pitchX, stepY * pitch / layout.pitchY);
        };
        const ReferencePlane reference = exact(0);

        PlaneScaler scaler({luma.width, width, stepX}, {luma.height, height, stepY}, luma.rowsAtOnce, luma.rowBytes);
        ReferencePlane ours{width, height, {}};
        for (int y = 0; y < luma.height; ++y) {
            std::copy_n(whole.row(0, y), luma.width, scaler.inputRow(y));
            scaler.rowsReady(y + 1);
        }
        for (int y = 0; y < height; ++y)
            ours.samples.insert(ours.samples.end(), scaler.outputRow(y), scaler.outputRow(y) + width);

        const auto print = scalePictureToJpeg(argv[i], {width, height}, 90);
        if (!print)
            return 1;
        const double before = peakSignalToNoise(ours, reference);
        const double ceiling = peakSignalToNoise(lumaOfJpeg(encodeExact(reference, exact(1), exact(2))), reference);
        const double printed = peakSignalToNoise(lumaOfJpeg(*print), reference);
        std::printf("%-20s %12.2f %12.3f %12.3f %8.3f\n", std::filesystem::path(argv[i]).filename().c_str(), before,
                    ceiling, printed, ceiling - printed);
        worst = std::min(worst, before);
        mostLost = std::max(mostLost, ceiling - printed);
    }
    std::printf("worst %.2f dB before JPEG (goal 55), at most %.3f dB lost (goal 0.05)\n", worst, mostLost);
    return 0;
}
