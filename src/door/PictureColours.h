#pragma once

#include <array>

namespace lumora {

struct Chromaticity {
    double x = 0;
    double y = 0;
};

// Colours that a file names without a profile: the light of its white, red, green and blue, and its curve.
struct PictureColours {
    enum class Curve { Srgb, Rec709, Gamma };

    Chromaticity white{0.3127, 0.3290};
    std::array<Chromaticity, 3> primaries{{{0.64, 0.33}, {0.30, 0.60}, {0.15, 0.06}}};
    Curve curve = Curve::Srgb;
    double gamma = 0;
};

inline PictureColours adobeRgbColours() {
    PictureColours colours;
    colours.primaries[1] = {0.21, 0.71};
    colours.curve = PictureColours::Curve::Gamma;
    colours.gamma = 563.0 / 256;
    return colours;
}

} // namespace lumora
