#include "imaging/scaling/ResampleKernels.h"

#include <algorithm>

namespace lumora {

namespace {

void blendRows(const std::uint8_t* const* source, const std::int16_t* weights, int taps, int width,
               std::int16_t* target) {
    for (int x = 0; x < width; ++x) {
        std::int32_t sum = 128;
        for (int k = 0; k < taps; ++k)
            sum += source[k][x] * weights[k];
        target[x] = static_cast<std::int16_t>(sum >> 8);
    }
}

void packColumns(const std::int16_t* source, std::ptrdiff_t stride, int width, std::int16_t* target) {
    for (int x = 0; x < width; x += 2) {
        for (int row = 0; row < ResampleKernels::rows; ++row) {
            *target++ = source[row * stride + x];
            *target++ = source[row * stride + x + 1];
        }
    }
}

void blendColumns(const std::int16_t* columns, const std::int32_t* firstPair, const std::int16_t* weights, int pairs,
                  int count, std::uint8_t* target, std::ptrdiff_t stride) {
    for (int x = 0; x < count; ++x, weights += std::ptrdiff_t{2} * pairs) {
        for (int row = 0; row < ResampleKernels::rows; ++row) {
            const std::int16_t* pair = columns + (std::ptrdiff_t{firstPair[x]} * ResampleKernels::rows + row) * 2;
            std::int32_t sum = 1 << 19;
            for (int k = 0; k < pairs; ++k, pair += ResampleKernels::rows * 2)
                sum += pair[0] * weights[2 * k] + pair[1] * weights[2 * k + 1];
            target[row * stride + x] = static_cast<std::uint8_t>(std::clamp(sum >> 20, 0, 255));
        }
    }
}

} // namespace

const ResampleKernels& plainKernels() {
    static constexpr ResampleKernels kernels{blendRows, packColumns, blendColumns};
    return kernels;
}

} // namespace lumora
