#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>

// The inner loops over rows of 32-bit pixels (blue, green, red, alpha in memory), written once for every instruction
// set of the machine; each gives the same bytes.
namespace lumora {

class ColourMatrix;

// from and to may be the same row. Alpha becomes 255.
void applyMatrixToRow(const ColourMatrix& matrix, const std::uint32_t* from, std::uint32_t* to, int pixels);

// A row of pixels to a row of bytes for each channel, blue first, alpha only with a fourth plane; and back, where
// without one alpha becomes 255 and no colour lies above its alpha.
void splitRow(const std::uint32_t* from, int width, std::span<std::uint8_t* const> planes);
void joinRow(std::span<std::uint8_t* const> planes, int width, std::uint32_t* to);

// The part of a row that fills whole vectors; the return is how many pixels that was. factors of 16 fraction bits: red
// by Cr, green by Cr and by Cb, blue by Cb.
int lumaAndChromaToPixels(const std::uint8_t* y, const std::uint8_t* cb, const std::uint8_t* cr, int width,
                          std::uint32_t* to, const std::array<std::int32_t, 4>& factors);

// A picture with its edge pixels repeated around it, so that a 4x4 sample near the edge needs no test.
struct PaddedPicture {
    const std::uint32_t* origin; // pixel (0, 0)
    std::ptrdiff_t stride;       // in pixels
};

// Sample positions in the source, 32 fraction bits, cut to 8; 0 is the centre of pixel 0.
struct SampleLine {
    std::int64_t x;
    std::int64_t y;
    std::int64_t stepX;
    std::int64_t stepY;
};

// A 4x4 cubic sample for each of count pixels along the line. Every position must have its 4x4 pixels inside the
// padding.
void sampleLine(const PaddedPicture& source, SampleLine line, std::uint32_t* out, int count);

} // namespace lumora
