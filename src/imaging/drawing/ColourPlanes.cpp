#include "imaging/drawing/ColourPlanes.h"

#include "imaging/scaling/PixelRows.h"

#include <algorithm>
#include <array>

namespace lumora {

namespace {

constexpr int one = 1 << 16;
constexpr int half = one / 2;

constexpr int fixed(double value) {
    return static_cast<int>(value * one + (value < 0 ? -0.5 : 0.5));
}

} // namespace

void lumaAndChroma(const QRgb* line, int width, unsigned char* y, unsigned char* cb, unsigned char* cr) {
    // The coefficients of a row sum to exactly 1 (luma) or 0 (chroma), so that grey stays grey.
    constexpr int yr = fixed(0.299);
    constexpr int yb = fixed(0.114);
    constexpr int yg = one - yr - yb;
    constexpr int bg = fixed(-0.331264);
    constexpr int rb = fixed(-0.081312);
    for (int x = 0; x < width; ++x) {
        const int r = qRed(line[x]);
        const int g = qGreen(line[x]);
        const int b = qBlue(line[x]);
        y[x] = static_cast<unsigned char>((yr * r + yg * g + yb * b + half) >> 16);
        cb[x] =
            static_cast<unsigned char>(std::min(255, ((-half - bg) * r + bg * g + half * b + 128 * one + half) >> 16));
        cr[x] =
            static_cast<unsigned char>(std::min(255, (half * r + (-half - rb) * g + rb * b + 128 * one + half) >> 16));
    }
}

void pixelsOf(const unsigned char* y, const unsigned char* cb, const unsigned char* cr, int width, QRgb* line) {
    constexpr std::array<std::int32_t, 4> factors{fixed(1.402), fixed(-0.714136), fixed(-0.344136), fixed(1.772)};
    for (int x = lumaAndChromaToPixels(y, cb, cr, width, line, factors); x < width; ++x) {
        const int luma = y[x] * one + half;
        const int blue = cb[x] - 128;
        const int red = cr[x] - 128;
        const int r = (luma + factors[0] * red) >> 16;
        const int g = (luma + factors[1] * red + factors[2] * blue) >> 16;
        const int b = (luma + factors[3] * blue) >> 16;
        line[x] = qRgb(std::clamp(r, 0, 255), std::clamp(g, 0, 255), std::clamp(b, 0, 255));
    }
}

} // namespace lumora
