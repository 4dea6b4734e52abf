#pragma once

namespace lumora {

struct EditFields;

// The steps of the editor's colours, in the gains and the tone flag of a record.
namespace ColourStep {

enum class Tone { Grey, Sepia, Blue, Green };

// All three gains by so many hundredths.
void brighten(EditFields& edit, int hundredths);
// More of one colour and as much less of its opposite.
void addRed(EditFields& edit);
void addBlue(EditFields& edit);
// All gains become that of green, which added colours leave alone.
void removeAddedColours(EditFields& edit);
void takeTone(EditFields& edit, Tone tone);
void backToColour(EditFields& edit);
// Gains, tone, zoom and turn as in a new record.
void undo(EditFields& edit);

} // namespace ColourStep
} // namespace lumora
