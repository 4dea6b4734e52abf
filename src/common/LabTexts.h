#pragma once

#include <QString>

namespace lumora {

// Texts of the lab that lie on this machine as HTML, [Texts] of its file: whole paths; empty: the program has its own
// help, and the lab's site has the other two.
struct LabTexts {
    QString terms;
    QString priceList;
    QString help;

    bool operator==(const LabTexts&) const = default;
};

} // namespace lumora
