#pragma once

#include <QByteArray>

#include <algorithm>
#include <iterator>

namespace lumora {

// The first quality from 1 to 100 that gives the first quantisation table of a JPEG file, or -1: the luma table of
// ITU-T T.81, table K.1, in the order of the file, scaled as encoders commonly scale it.
inline int jpegQuality(const QByteArray& jpeg) {
    constexpr int luma[] = {16, 11, 12,  14,  12,  10, 16, 14,  13,  14,  18,  17,  16, 19,  24,  40,
                            26, 24, 22,  22,  24,  49, 35, 37,  29,  40,  58,  51,  61, 60,  57,  51,
                            56, 55, 64,  72,  92,  78, 64, 68,  87,  69,  55,  56,  80, 109, 81,  87,
                            95, 98, 103, 104, 103, 62, 77, 113, 121, 112, 100, 120, 92, 101, 103, 99};
    const auto at = jpeg.indexOf("\xFF\xDB") + 5; // behind marker, length and number of the table
    if (at < 5 || jpeg.size() < at + 64)
        return -1;
    for (int quality = 1; quality <= 100; ++quality) {
        const int percent = quality < 50 ? 5000 / quality : 200 - 2 * quality;
        const auto scaled = [&](int step) { return std::clamp((step * percent + 50) / 100, 1, 255); };
        if (std::equal(std::begin(luma), std::end(luma), jpeg.begin() + at,
                       [&](int step, char found) { return scaled(step) == static_cast<unsigned char>(found); }))
            return quality;
    }
    return -1;
}

} // namespace lumora
