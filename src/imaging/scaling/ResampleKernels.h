#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

// The three inner loops of the resampler, in plain C++ and for each vector width. All give the same bytes.
namespace lumora {

struct ResampleKernels {
    // The kernels work on blocks of this many target rows.
    static constexpr int rows = 8;
    // Buffers must be this many samples longer than the counts say; the kernels read and write that far.
    static constexpr int slack = 64;

    // target[i] = (sum over k of source[k][i] * weights[k] + 128) >> 8: bytes by weights of 14 fraction bits to 6
    // fraction bits. taps is even.
    using BlendRows = void (*)(const std::uint8_t* const* source, const std::int16_t* weights, int taps, int width,
                               std::int16_t* target);

    // Turns eight rows of 16-bit samples, stride samples apart, into columns: for each even x the samples x and x + 1
    // of row 0, row 1, ... row 7.
    using PackColumns = void (*)(const std::int16_t* source, std::ptrdiff_t stride, int width, std::int16_t* target);

    // Makes eight rows of bytes, stride apart, from the packed columns. Target sample i takes pairs pairs of columns
    // from pair firstPair[i] on, with the weights from 2 * pairs * i on. count is a multiple of 8.
    using BlendColumns = void (*)(const std::int16_t* columns, const std::int32_t* firstPair,
                                  const std::int16_t* weights, int pairs, int count, std::uint8_t* target,
                                  std::ptrdiff_t stride);

    BlendRows blendRows;
    PackColumns packColumns;
    BlendColumns blendColumns;
};

// The fastest kernels that this machine can run.
const ResampleKernels& bestKernels();

const ResampleKernels& plainKernels();

// All kernels that this machine can run, with their names ("plain", "SSE2", "AVX2"), for tests and benchmarks. Not
// thread-safe with the first call of bestKernels().
struct NamedKernels {
    std::string name;
    ResampleKernels kernels;
};
std::vector<NamedKernels> allKernels();

} // namespace lumora
