#pragma once

#include "imaging/Bitmap.h"

#include <cstdlib>

namespace lumora {

// The mean difference of two pictures, 0 to 255 a channel; 1000 when their sizes differ.
inline double meanDifference(const Bitmap& a, const Bitmap& b) {
    if (a.image().size() != b.image().size())
        return 1000;
    double sum = 0;
    for (int i = 0; i < a.width() * a.height(); ++i) {
        const QRgb p = a.image().pixel(i % a.width(), i / a.width());
        const QRgb q = b.image().pixel(i % a.width(), i / a.width());
        sum += std::abs(qRed(p) - qRed(q)) + std::abs(qGreen(p) - qGreen(q)) + std::abs(qBlue(p) - qBlue(q));
    }
    return sum / (3.0 * a.width() * a.height());
}

} // namespace lumora
