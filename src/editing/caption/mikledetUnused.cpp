// What the page must have and nothing calls: the font list, and two buttons that do nothing.
#include "editing/caption/mikledet.h"

namespace lumora {

using namespace Qt::StringLiterals;

void mikledet::Command10_Click() {
    Combo1List.clear();
    Combo1List.append(u"David"_s);
    chooseFont(0);
}

void mikledet::Command13_Click() {}
void mikledet::Command14_Click() {}

} // namespace lumora
