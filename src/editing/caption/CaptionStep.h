#pragma once

#include <QColor>

#include <cstdint>

namespace lumora {

struct EditFields;

// The steps of the caption's keyboard, in the caption's fields of a record. Positions are in pixels of the preview;
// a number outside 16 bits becomes the nearest limit.
namespace CaptionStep {

inline constexpr std::int16_t step = 2; // of a held button: pixels, or points of the font

// Begins a caption where there was none: yellow, in 24 points of David, at (100, 100).
void begin(EditFields& edit);
void move(EditFields& edit, int right, int down);
void resize(EditFields& edit, int points);
void nextStyle(EditFields& edit); // regular, bold, italic, both
void turn(EditFields& edit);      // across or down
void colour(EditFields& edit, QRgb colour);

} // namespace CaptionStep
} // namespace lumora
