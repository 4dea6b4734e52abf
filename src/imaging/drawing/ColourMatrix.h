#pragma once

#include "imaging/Bitmap.h"

#include <array>

namespace lumora {

// The colour part of a 5x5 matrix: a row vector (red, green, blue), each 0 to 255, times the matrix; alpha is
// unchanged. Each resulting channel is rounded down and held within 0 to 255.
class ColourMatrix {
public:
    // The identity.
    ColourMatrix();

    // The gains on the diagonal and crossGain in every other entry: all colour and brightness steps of the editor.
    static ColourMatrix fromGains(float red, float green, float blue, float crossGain);

    // Every channel becomes weight * (red + green + blue).
    static ColourMatrix grey(float weight);

    // True when no pixel changes: the diagonal is 1 and each other entry at most 0.0015, so that a channel grows by
    // less than one step and is rounded down again.
    bool changesNothing() const;

    // The share of input channel row in output channel column; 0 red, 1 green, 2 blue.
    float entry(int row, int column) const { return m_entries[static_cast<std::size_t>(row * 3 + column)]; }

    Bitmap applied(const Bitmap& picture) const;
    // Changes picture itself, which must have no transparency.
    void apply(Bitmap& picture) const;

private:
    std::array<float, 9> m_entries;
};

} // namespace lumora
