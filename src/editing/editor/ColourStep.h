#pragma once

#include "editing/render/ColourLevels.h"

namespace lumora {

struct EditFields;

// The steps of the editor's colours, in the gains and the tone flag of a record.
namespace ColourStep {

enum class Tone { Grey, Sepia, Blue, Green };

// Raises all three gains by so many hundredths.
void brighten(EditFields& edit, int hundredths);
// Raise the gain of one colour by six hundredths and lower that of the other.
void addRed(EditFields& edit);
void addBlue(EditFields& edit);
// Sets all gains to that of green, which added colours do not change.
void removeAddedColours(EditFields& edit);
// Sets the gains to those that were measured, held within 1.0 and 1.6 and cut to what the record's columns carry.
void improve(EditFields& edit, const ChannelValues& measured);
void takeTone(EditFields& edit, Tone tone);
void backToColour(EditFields& edit);
// Sets gains, tone, zoom and turn as in a new record.
void undo(EditFields& edit);

} // namespace ColourStep
} // namespace lumora
