#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>

// The inner loops over rows of 32-bit pixels (blue, green, red, alpha in memory), compiled for every instruction set of
// the machine; all give the same bytes.
namespace lumora {

class ColourMatrix;

// from and to may be the same row. Alpha becomes 255.
void applyMatrixToRow(const ColourMatrix& matrix, const std::uint32_t* from, std::uint32_t* to, int pixels);

// splitRow writes each channel of a row to its own plane, blue first, alpha if there is a fourth plane. joinRow does
// the reverse: no colour exceeds its alpha, and without a fourth plane alpha is 255.
void splitRow(const std::uint32_t* from, int width, std::span<std::uint8_t* const> planes);
void joinRow(std::span<std::uint8_t* const> planes, int width, std::uint32_t* to);

// Converts as many pixels as fill whole vectors and returns their number. factors, 16 fraction bits: red by Cr, green
// by Cr, green by Cb, blue by Cb.
int lumaAndChromaToPixels(const std::uint8_t* y, const std::uint8_t* cb, const std::uint8_t* cr, int width,
                          std::uint32_t* to, const std::array<std::int32_t, 4>& factors);

// sums[x] becomes the sum of the samples x of all rows; at most 257 rows.
void addRows(std::span<const std::uint8_t* const> rows, std::uint16_t* sums, int width);

// A picture with its edge pixels repeated around it, so that a 4x4 sample near the edge needs no test.
struct PaddedPicture {
    const std::uint32_t* origin; // pixel (0, 0)
    std::ptrdiff_t stride;       // in pixels
};

// The first sample position in the source and the step to the next, 32 fraction bits, cut to 8; 0 is the centre of
// pixel 0.
struct SampleLine {
    std::int64_t x;
    std::int64_t y;
    std::int64_t stepX;
    std::int64_t stepY;
};

// Writes a 4x4 cubic sample for each of count positions. The 4x4 pixels around every position must lie inside the
// padding.
void sampleLine(const PaddedPicture& source, SampleLine line, std::uint32_t* out, int count);

} // namespace lumora
