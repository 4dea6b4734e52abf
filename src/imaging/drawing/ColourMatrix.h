#pragma once

#include "imaging/Bitmap.h"

#include <array>

namespace lumora {

// The colour part of a 5x5 matrix: a row vector (red, green, blue) times the matrix, on 0 to 255, alpha unchanged. The
// result of each channel is the floor of the exact value, held within 0 to 255.
class ColourMatrix {
public:
    // Changes nothing.
    ColourMatrix();

    // Gains on the diagonal and crossGain everywhere else: every colour and brightness step of the editor.
    static ColourMatrix fromGains(float red, float green, float blue, float crossGain);

    // Every channel becomes weight times (red + green + blue).
    static ColourMatrix grey(float weight);

    // True when no pixel can change: the cross gain of a thousandth adds at most half a step, and the floor drops it.
    bool changesNothing() const;

    // entry(row, column): how much of input channel row goes into output channel column; 0 red, 1 green, 2 blue.
    float entry(int row, int column) const { return m_entries[static_cast<std::size_t>(row * 3 + column)]; }

    Bitmap applied(const Bitmap& picture) const;
    // In place; the picture has no transparency.
    void apply(Bitmap& picture) const;

private:
    std::array<float, 9> m_entries;
};

} // namespace lumora
