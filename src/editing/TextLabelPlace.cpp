#include "editing/TextLabelPlace.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora::TextLabelPlace {
namespace {

constexpr int vertical = 3;
constexpr int centre = 1;
constexpr int far = 2;

// Of the label's own font, in its em: a blank and a line. Its size is in points, 96 pixels to 72 of them.
constexpr double blankWidth = 0.28;
constexpr double lineHeight = 1.17;
constexpr double pixelsOfPoint = 96.0 / 72.0;

} // namespace

QString blanks(const EditFields& edit) {
    return edit.TextVertical == vertical ? QString() : QString(2 * edit.TextBody.size(), u' ');
}

TextLabelBox boxOf(const EditFields& edit) {
    TextLabelBox box{double(edit.TextX), double(edit.TextY), 0, 0};
    if (edit.TextVertical == vertical) {
        box.width = 35;
        box.height = 3 + 25.0 * double(edit.TextBody.size());
        box.left -= box.width;
        if (edit.TextAlign == centre)
            box.top -= box.height / 2;
        else if (edit.TextAlign == far)
            box.top -= box.height;
        return box;
    }
    const double em = std::max<int>(edit.TextFontSize, 8) * 0.7 * pixelsOfPoint;
    box.width = double(blanks(edit).size()) * blankWidth * em;
    box.height = lineHeight * em;
    if (edit.TextAlign == centre)
        box.left -= box.width / 2;
    else if (edit.TextAlign == far)
        box.left -= box.width;
    return box;
}

QPoint anchorOf(const TextLabelBox& box, const EditFields& edit) {
    double x = box.left;
    double y = box.top;
    if (edit.TextVertical == vertical) {
        x += box.width + (edit.TextAlign == centre || edit.TextAlign == far ? 0 : 3);
        if (edit.TextAlign == centre)
            y += box.height / 2;
        else if (edit.TextAlign == far)
            y += box.height;
    } else if (edit.TextAlign == centre) {
        x += box.width / 2;
    } else if (edit.TextAlign == far) {
        x += box.width + 3;
    }
    return {HoldIn16Bits(x), HoldIn16Bits(y)};
}

} // namespace lumora::TextLabelPlace
