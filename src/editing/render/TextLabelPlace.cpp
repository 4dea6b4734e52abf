#include "editing/render/TextLabelPlace.h"

#include "common/FixedText.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora::TextLabelPlace {
namespace {

using EditRecord::alignCentre;
using EditRecord::alignFar;
using EditRecord::runsDown;

// Width of a blank and height of a line of the label's font, in em. A point is 96/72 pixels.
constexpr double blankWidth = 0.28;
constexpr double lineHeight = 1.17;
constexpr double pixelsOfPoint = 96.0 / 72.0;

} // namespace

QString blanks(const EditFields& edit) {
    return edit.TextVertical == runsDown ? QString() : QString(2 * edit.TextBody.size(), u' ');
}

TextLabelBox boxOf(const EditFields& edit) {
    TextLabelBox box{double(edit.TextX), double(edit.TextY), 0, 0};
    if (edit.TextVertical == runsDown) {
        box.width = 35;
        box.height = 3 + 25.0 * double(edit.TextBody.size());
        box.left -= box.width;
        if (edit.TextAlign == alignCentre)
            box.top -= box.height / 2;
        else if (edit.TextAlign == alignFar)
            box.top -= box.height;
        return box;
    }
    const double em = std::max<int>(edit.TextFontSize, 8) * 0.7 * pixelsOfPoint;
    box.width = double(blanks(edit).size()) * blankWidth * em;
    box.height = lineHeight * em;
    if (edit.TextAlign == alignCentre)
        box.left -= box.width / 2;
    else if (edit.TextAlign == alignFar)
        box.left -= box.width;
    return box;
}

QPoint anchorOf(const TextLabelBox& box, const EditFields& edit) {
    double x = box.left;
    double y = box.top;
    if (edit.TextVertical == runsDown) {
        x += box.width + (edit.TextAlign == alignCentre || edit.TextAlign == alignFar ? 0 : 3);
        if (edit.TextAlign == alignCentre)
            y += box.height / 2;
        else if (edit.TextAlign == alignFar)
            y += box.height;
    } else if (edit.TextAlign == alignCentre) {
        x += box.width / 2;
    } else if (edit.TextAlign == alignFar) {
        x += box.width + 3;
    }
    return {HoldIn16Bits(x), HoldIn16Bits(y)};
}

} // namespace lumora::TextLabelPlace
