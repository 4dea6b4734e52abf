// edited_quality ZOOM pixels FOLDER_OF_RESULTS FRAMES FILE...: the luma of what a program drew ("pixels", so without
// tone, frame and caption) against the turned, antialiased bicubic in double precision, in dB a picture. The kernel
// lies along the picture's own axes, widened by the shrink; the part of the paper that the picture leaves free does not
// count.
#include "Floor.h"
#include "Job.h"

#include <QImage>

#include <array>
#include <cstdio>

using namespace lumora;

namespace {

double cubic(double x) {
    x = std::abs(x);
    if (x < 1)
        return (1.5 * x - 2.5) * x * x + 1;
    return x < 2 ? ((-0.5 * x + 2.5) * x - 4) * x + 2 : 0;
}

struct Taps {
    int first = 0;
    int count = 0;
    std::array<double, 64> weights{};

    Taps(double centre, double widened) {
        first = static_cast<int>(std::floor(centre - 2 * widened)) + 1;
        count = static_cast<int>(std::ceil(centre + 2 * widened)) - first;
        double sum = 0;
        for (int i = 0; i < count; ++i)
            sum += weights.at(static_cast<std::size_t>(i)) = cubic((first + i - centre) / widened);
        for (int i = 0; i < count; ++i)
            weights.at(static_cast<std::size_t>(i)) /= sum;
    }
};

double exactAt(const ReferencePlane& luma, double u, double v, double widenedX, double widenedY) {
    const Taps across(u, widenedX);
    const Taps down(v, widenedY);
    double total = 0;
    for (int j = 0; j < down.count; ++j) {
        const double* row =
            luma.samples.data() + std::ptrdiff_t{std::clamp(down.first + j, 0, luma.height - 1)} * luma.width;
        double sum = 0;
        for (int i = 0; i < across.count; ++i)
            sum += across.weights[static_cast<std::size_t>(i)] * row[std::clamp(across.first + i, 0, luma.width - 1)];
        total += sum * down.weights[static_cast<std::size_t>(j)];
    }
    return total;
}

} // namespace

int main(int argc, char** argv) {
    const Job job = Job::of(argc, argv);
    for (const auto& file : job.files) {
        const QImage drawn =
            QImage(QString::fromStdString(job.target(file).string())).convertToFormat(QImage::Format_RGB32);
        if (drawn.width() != Job::paperWidth || drawn.height() != Job::paperHeight)
            fail(job.target(file));
        const ReferencePlane luma = wholePlanesOf(file).plane(0);
        const double angle = Job::degrees * std::acos(-1.0) / 180;
        const double stepX = double(luma.width) / job.width();
        const double stepY = double(luma.height) / job.height();
        double squares = 0;
        double counted = 0;
        // Every third pixel each way, a step that meets every phase, is plenty.
        for (int y = 1; y < Job::paperHeight; y += 3) {
            const auto* row = reinterpret_cast<const QRgb*>(drawn.constScanLine(y));
            for (int x = 1; x < Job::paperWidth; x += 3) {
                const double dx = x + 0.5 - Job::paperWidth / 2;
                const double dy = y + 0.5 - Job::paperHeight / 2;
                const double u = std::cos(angle) * dx + std::sin(angle) * dy + job.width() / 2;
                const double v = -std::sin(angle) * dx + std::cos(angle) * dy + job.height() / 2;
                if (u < 2 || v < 2 || u > job.width() - 2 || v > job.height() - 2)
                    continue;
                const double exact =
                    exactAt(luma, u * stepX - 0.5, v * stepY - 0.5, std::max(1.0, stepX), std::max(1.0, stepY));
                const double found = 0.299 * qRed(row[x]) + 0.587 * qGreen(row[x]) + 0.114 * qBlue(row[x]);
                squares += (found - exact) * (found - exact);
                ++counted;
            }
        }
        std::printf("%.2f\n", 10 * std::log10(255.0 * 255.0 * counted / squares));
    }
    return 0;
}
