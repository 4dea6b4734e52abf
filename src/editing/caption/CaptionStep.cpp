#include "editing/caption/CaptionStep.h"

#include "common/FixedText.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

namespace lumora::CaptionStep {

using namespace Qt::StringLiterals;

void begin(EditFields& edit) {
    edit.TextFont = u"David"_s;
    edit.TextFontSize = 24;
    colour(edit, qRgb(255, 255, 30));
    edit.TextX = 100;
    edit.TextY = 100;
    edit.TextOn = 1;
}

void move(EditFields& edit, int right, int down) {
    edit.TextX = HoldIn16Bits(edit.TextX + right);
    edit.TextY = HoldIn16Bits(edit.TextY + down);
}

void resize(EditFields& edit, int points) {
    edit.TextFontSize = HoldIn16Bits(edit.TextFontSize + points);
}

void nextStyle(EditFields& edit) {
    edit.TextStyle = edit.TextStyle > 2 ? std::int16_t{0} : HoldIn16Bits(edit.TextStyle + 1);
}

void turn(EditFields& edit) {
    edit.TextVertical = edit.TextVertical == EditRecord::runsDown ? std::int16_t{0} : EditRecord::runsDown;
}

void colour(EditFields& edit, QRgb colour) {
    edit.TextRed = static_cast<std::int16_t>(qRed(colour));
    edit.TextGreen = static_cast<std::int16_t>(qGreen(colour));
    edit.TextBlue = static_cast<std::int16_t>(qBlue(colour));
}

} // namespace lumora::CaptionStep
