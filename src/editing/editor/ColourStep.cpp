#include "editing/editor/ColourStep.h"

#include "common/FixedText.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora::ColourStep {
namespace {

constexpr int step = 6; // hundredths of a gain

void setGains(EditFields& edit, float red, float green, float blue) {
    edit.GainR = red;
    edit.GainG = green;
    edit.GainB = blue;
}

} // namespace

void brighten(EditFields& edit, int hundredths) {
    setGains(edit, EditStep::gain(edit.GainR, hundredths), EditStep::gain(edit.GainG, hundredths),
             EditStep::gain(edit.GainB, hundredths));
}

void addRed(EditFields& edit) {
    setGains(edit, EditStep::gain(edit.GainR, step), edit.GainG, EditStep::gain(edit.GainB, -step));
}

void addBlue(EditFields& edit) {
    setGains(edit, EditStep::gain(edit.GainR, -step), edit.GainG, EditStep::gain(edit.GainB, step));
}

void removeAddedColours(EditFields& edit) {
    setGains(edit, edit.GainG, edit.GainG, edit.GainG);
}

void improve(EditFields& edit, const ChannelValues& measured) {
    const auto held = [](float gain) {
        const QString text = PlainNumber(std::clamp(gain, 1.0F, 1.6F));
        return static_cast<float>(Val(text.left(EditRecord::GainR.width)));
    };
    setGains(edit, held(measured[0]), held(measured[1]), held(measured[2]));
}

void takeTone(EditFields& edit, Tone tone) {
    setGains(edit, 1, 1, 1);
    edit.ToneFlag = 1;
    switch (tone) {
    case Tone::Grey:
        break;
    case Tone::Sepia:
        setGains(edit, EditStep::gain(1, 30), 1, EditStep::gain(1, -20));
        break;
    case Tone::Blue:
        edit.GainB = EditStep::gain(1, 30);
        break;
    case Tone::Green:
        edit.GainG = EditStep::gain(1, 30);
        break;
    }
}

void backToColour(EditFields& edit) {
    setGains(edit, 1, 1, 1);
    edit.ToneFlag = 0;
}

void undo(EditFields& edit) {
    backToColour(edit);
    edit.SpareFlag = 0;
    edit.ZoomPercent = 100;
    edit.RotationCode = 180;
}

} // namespace lumora::ColourStep
