#include "kiosk/KioskDays.h"

#include <utility>

namespace lumora {

namespace {

bool isStep(const QDate& from, const QDate& to) {
    const qint64 days = from.daysTo(to);
    return days >= 0 && days <= KioskDays::longestStep;
}

} // namespace

bool KioskDays::see(const QDate& today) {
    if (!reached.isValid())
        reached = today;
    if (isStep(reached, today)) {
        lived += static_cast<int>(reached.daysTo(today));
        reached = today;
        doubted = QDate();
        return true;
    }
    if (!doubted.isValid() || !isStep(doubted, today))
        doubts = 0;
    else if (today > doubted)
        ++doubts;
    doubted = today;
    if (doubts < daysUntilBelieved)
        return false;
    reached = std::exchange(doubted, QDate());
    return true;
}

} // namespace lumora
