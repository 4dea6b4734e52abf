#include "Scenes.h"

#include <array>

namespace lumora::demo {
namespace {

struct Kind {
    double across, down; // proportions
    double units;        // across
    void (*draw)(Sheet&);
    Film film;
};

const Kind& kindOf(Scene which) {
    static const std::array<Kind, sceneCount> kinds = {{
        {4, 3, 1200, drawCake, {0.18F, 0.45F, 0.42F, 6}},
        {4, 3, 1200, drawMarket, {0.16F, 0.15F, 0.22F, 4.5F}},
        {3, 4, 900, drawBouquet, {0.12F, 0.15F, 0.26F, 4.5F}},
        {4, 3, 1200, drawCat, {0.2F, 0.35F, 0.24F, 5.5F}},
        {1, 1, 1000, drawSnow, {0.1F, -0.1F, 0.18F, 4.5F}},
        {4, 3, 1200, drawMountains, {0.16F, 0, 0.22F, 4}},
        {4, 3, 1200, drawSunset, {0.14F, 0.2F, 0.25F, 5.5F}},
        {3, 4, 900, drawKite, {0.14F, 0.3F, 0.2F, 4}},
        {4, 3, 1200, drawNight, {0.1F, 0.2F, 0.3F, 8}},
        {4, 3, 1200, drawGroup, {0.1F, 0.2F, 0.22F, 4.5F}},
        {3, 4, 900, drawPortrait, {0.12F, 0.15F, 0.4F, 6}},
        {4, 3, 1200, drawBeach, {0.12F, 0.2F, 0.18F, 4}},
    }};
    return kinds[static_cast<std::size_t>(which)];
}

} // namespace

Bitmap scene(Scene which, double megapixels) {
    const Kind& kind = kindOf(which);
    const double side = std::sqrt(megapixels * 1e6 / (kind.across * kind.down));
    const auto even = [side](double share) { return std::max(2, static_cast<int>(std::lround(share * side / 2)) * 2); };
    Sheet sheet(even(kind.across), even(kind.down), kind.units, 40 + static_cast<std::uint32_t>(which));
    kind.draw(sheet);
    return sheet.developed(kind.film);
}

} // namespace lumora::demo
