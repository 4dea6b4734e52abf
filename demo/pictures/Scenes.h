#pragma once

#include "Sheet.h"

namespace lumora::demo {

// Calm scenes as customers bring them, to judge crop, tones and sharpness by: each in its own proportions, about this
// many megapixels large.
enum class Scene { Cake, Market, Bouquet, Cat, Snow, Mountains, Sunset, Kite, Night, Group, Portrait, Beach };
inline constexpr int sceneCount = 12;

Bitmap scene(Scene which, double megapixels);

// Draws it in units; below.
void drawCake(Sheet& sheet);
void drawMarket(Sheet& sheet);
void drawBouquet(Sheet& sheet);
void drawCat(Sheet& sheet);
void drawSnow(Sheet& sheet);
void drawMountains(Sheet& sheet);
void drawSunset(Sheet& sheet);
void drawKite(Sheet& sheet);
void drawNight(Sheet& sheet);
void drawGroup(Sheet& sheet);
void drawPortrait(Sheet& sheet);
void drawBeach(Sheet& sheet);

} // namespace lumora::demo
