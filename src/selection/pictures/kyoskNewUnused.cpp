// The page of pictures: events that no view offers. The program itself calls none of them but the ticks of the timers,
// which move what no view draws.
#include "selection/pictures/kyoskNew.h"

#include <algorithm>

namespace lumora {

void kyoskNew::removeDuplicates() {
    m_choice.removeDuplicates();
    showChoice();
    Label1.text = QString::number(List1.count());
}

void kyoskNew::answerOffer(int yes) {
    if (yes == 0)
        chooseWholeFolder();
    else
        chooseByHand();
}

void kyoskNew::moveLabel35() {
    label35Left = std::min(label35Left + 10, 300);
    if (label35Left == 300)
        Timer1.stop();
    Q_EMIT changed();
}

void kyoskNew::movePointers() {
    pointerStep = (pointerStep + 1) % 4;
    Q_EMIT changed();
}

} // namespace lumora
