#pragma once

#include <QString>

namespace lumora {

// What a lab wants of a machine that customers use one after another, [Kiosk] of its file.
struct KioskRules {
    bool on = false;       // Mode
    int idleSeconds = 90;  // without a sign of life; then the customer is asked
    QString code;          // of the staff, as "lumora --kiosk-code" prints it; empty: there is no way in
    int keepDays = 30;     // of the print files of an order that has arrived
    int keepLogDays = 365; // of its folder
    QString printer;       // the print queue of the slips; empty: there are none

    bool operator==(const KioskRules&) const = default;
};

} // namespace lumora
