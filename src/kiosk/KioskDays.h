#pragma once

#include <QDate>

namespace lumora {

// The days that a kiosk has lived through. A clock that is set wrong makes no time pass: a step of the date counts when
// it is as long as a machine may be off, and any other date is believed once it has gone on by itself for a few days.
struct KioskDays {
    static constexpr int longestStep = 4; // days; a long weekend
    static constexpr int daysUntilBelieved = 4;

    int lived = 0;
    QDate reached;  // the last day that was believed
    QDate doubted;  // another one that the clock has told since
    int doubts = 0; // days that it went on from there

    // False while the date is not believed.
    bool see(const QDate& today);
    bool operator==(const KioskDays&) const = default;
};

} // namespace lumora
