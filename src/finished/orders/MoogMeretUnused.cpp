// Events of the page of finished orders whose controls nobody sees. The page itself calls the verbs.
#include "finished/orders/MoogMeret.h"

namespace lumora {

void MoogMeret::Command3_Click() {
    if (mayAct())
        listOrderInHand();
}

void MoogMeret::Command12_Click() {
    stepWalk();
}

void MoogMeret::Command13_Click() {
    beginWalk();
}

void MoogMeret::Command20_Click() {
    listPackages();
}

void MoogMeret::Dir1_Change(const DrivePath& folder) {
    if (mayAct())
        openFolder(folder);
}

} // namespace lumora
