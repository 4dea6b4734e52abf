#pragma once

#include <vector>

// The antialiased bicubic (a = -0.5, kernel widened by the shrink, edges repeated) in double precision, written
// straight from its formula: what the fast resampler is measured against.
namespace lumora {

struct ReferencePlane {
    int width = 0;
    int height = 0;
    std::vector<double> samples;
};

// stepX and stepY are the distances of two target samples in source samples.
ReferencePlane referenceScaled(const ReferencePlane& source, int width, int height, double stepX, double stepY);

// In dB for a peak of 255; infinity for equal planes.
double peakSignalToNoise(const ReferencePlane& a, const ReferencePlane& b);

} // namespace lumora
