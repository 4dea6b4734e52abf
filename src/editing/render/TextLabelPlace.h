#pragma once

#include <QPoint>
#include <QString>

namespace lumora {

struct EditFields;

// The box that marks where a caption falls, in logical pixels of the paper.
struct TextLabelBox {
    double left = 0;
    double top = 0;
    double width = 0;
    double height = 0;
};

// Where the box of a caption stands, and the caption's anchor from where the box was dragged to. Across, the box is as
// long as two blanks a letter in 0.7 of the caption's size; down, 35 wide and 25 a letter long.
namespace TextLabelPlace {

// The blanks that stand in the box; none for a caption that runs down.
QString blanks(const EditFields& edit);

TextLabelBox boxOf(const EditFields& edit);

// The anchor in whole pixels, ties to even. A caption that ends at its anchor comes back 3 pixels further right, as
// does one that runs down from it.
QPoint anchorOf(const TextLabelBox& box, const EditFields& edit);

} // namespace TextLabelPlace
} // namespace lumora
