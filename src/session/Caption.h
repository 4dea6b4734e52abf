#pragma once

#include <QString>

namespace lumora {

// What a view shows of one control: a label, a button, a panel, a text box. A check box or an option adds its value.
struct Caption {
    QString text;
    bool visible = true;
    bool enabled = true;
    QString hint; // tool tip
};

struct CheckCaption : Caption {
    bool checked = false;
};

} // namespace lumora
