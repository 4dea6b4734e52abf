#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

// The three inner loops of the resampler. Every set of them gives the same bytes: plain C++ and each vector width of
// this machine.
namespace lumora {

struct ResampleKernels {
    // Rows in a block: the loops below work on this many rows of the target at once.
    static constexpr int rows = 8;
    // Buffers are this many samples longer than what is counted, and may be read and written so far.
    static constexpr int slack = 64;

    // target[i] = (sum over k of source[k][i] * weights[k] + 128) >> 8: bytes and weights of 14 fraction bits to 6
    // fraction bits. taps is even.
    using BlendRows = void (*)(const std::uint8_t* const* source, const std::int16_t* weights, int taps, int width,
                               std::int16_t* target);

    // Eight rows of 16 bits, stride samples apart, to columns: the samples x and x + 1 of row 0, of row 1, ... of row 7
    // for each even x.
    using PackColumns = void (*)(const std::int16_t* source, std::ptrdiff_t stride, int width, std::int16_t* target);

    // Eight rows of bytes, stride apart, from the packed columns. For target sample i: pairs pairs of columns from pair
    // firstPair[i] on, with the weights from 2 * pairs * i on. count is a multiple of 8.
    using BlendColumns = void (*)(const std::int16_t* columns, const std::int32_t* firstPair,
                                  const std::int16_t* weights, int pairs, int count, std::uint8_t* target,
                                  std::ptrdiff_t stride);

    BlendRows blendRows;
    PackColumns packColumns;
    BlendColumns blendColumns;
};

// What this machine runs fastest.
const ResampleKernels& bestKernels();

const ResampleKernels& plainKernels();

// All that this machine can run, with their names ("plain", "SSE2", "AVX2"), for tests and benchmarks. Not while other
// threads use bestKernels for the first time.
struct NamedKernels {
    std::string name;
    ResampleKernels kernels;
};
std::vector<NamedKernels> allKernels();

} // namespace lumora
