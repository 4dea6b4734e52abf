#include "samples/ReferenceScaling.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace lumora {

namespace {

double kernel(double x) {
    x = std::abs(x);
    return x < 1 ? 1.5 * x * x * x - 2.5 * x * x + 1 : x < 2 ? -0.5 * x * x * x + 2.5 * x * x - 4 * x + 2 : 0;
}

struct Taps {
    int first = 0;
    std::vector<double> weights;
};

Taps tapsOf(int index, double step) {
    const double wide = std::max(step, 1.0);
    const double centre = (index + 0.5) * step - 0.5;
    Taps taps;
    taps.first = static_cast<int>(std::ceil(centre - 2 * wide));
    double sum = 0;
    for (int k = taps.first; k <= centre + 2 * wide; ++k) {
        taps.weights.push_back(kernel((k - centre) / wide));
        sum += taps.weights.back();
    }
    for (double& weight : taps.weights)
        weight /= sum;
    return taps;
}

// One step of the two: scaled across, and turned over its diagonal.
ReferencePlane scaledAndTurned(const ReferencePlane& source, int width, double step) {
    ReferencePlane target{source.height, width, std::vector<double>(static_cast<std::size_t>(width) * source.height)};
    for (int x = 0; x < width; ++x) {
        const Taps taps = tapsOf(x, step);
        for (int y = 0; y < source.height; ++y) {
            double& sum = target.samples[static_cast<std::size_t>(x) * source.height + y];
            for (std::size_t k = 0; k < taps.weights.size(); ++k) {
                const int at = std::clamp(taps.first + static_cast<int>(k), 0, source.width - 1);
                sum += taps.weights[k] * source.samples[static_cast<std::size_t>(y) * source.width + at];
            }
        }
    }
    return target;
}

} // namespace

ReferencePlane referenceScaled(const ReferencePlane& source, int width, int height, double stepX, double stepY) {
    ReferencePlane target = scaledAndTurned(scaledAndTurned(source, width, stepX), height, stepY);
    for (double& sample : target.samples)
        sample = std::clamp(sample, 0.0, 255.0);
    return target;
}

double peakSignalToNoise(const ReferencePlane& a, const ReferencePlane& b) {
    if (a.samples.size() != b.samples.size() || a.samples.empty())
        return 0;
    double sum = 0;
    for (std::size_t i = 0; i < a.samples.size(); ++i)
        sum += (a.samples[i] - b.samples[i]) * (a.samples[i] - b.samples[i]);
    return sum == 0 ? std::numeric_limits<double>::infinity()
                    : 10 * std::log10(255.0 * 255.0 * static_cast<double>(a.samples.size()) / sum);
}

} // namespace lumora
