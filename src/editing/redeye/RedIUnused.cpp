// What the page must have and nothing calls: the hand-placed variant by a press on the patch.
#include "editing/redeye/RedI.h"

#include <cmath>

namespace lumora {

void RedI::Image1_MouseUp() {
    correctByHand();
}

// By the right button, in four passes round this point of the patch.
void RedI::Image1_MouseDown(Button button, QPointF at) {
    constexpr int passes = 4;
    if (button == Button::Right)
        correctByHand(passes, QPoint(static_cast<int>(std::floor(at.x())), static_cast<int>(std::floor(at.y()))));
}

} // namespace lumora
