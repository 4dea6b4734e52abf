#include "door/Orientation.h"

#include "imaging/drawing/Drawing.h"

#include <utility>

namespace lumora {

Bitmap upright(Bitmap picture, int orientation) {
    if (orientation == 2 || orientation == 7)
        picture = Bitmap(std::move(picture.image()).mirrored(true, false));
    else if (orientation == 4 || orientation == 5)
        picture = Bitmap(std::move(picture.image()).mirrored(false, true));
    if (orientation == 3)
        return turned(picture, QuarterTurn::Half);
    if (orientation >= 5)
        return turned(picture, orientation == 8 ? QuarterTurn::Left : QuarterTurn::Right);
    return picture;
}

} // namespace lumora
