#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"
#include "kiosk/KioskDays.h"

#include <QMap>
#include <QString>

namespace lumora {

class OrderFolder;
struct OrderState;
struct Platform;
struct SessionState;

// How long a kiosk keeps orders of which each file is proven to lie on the server: print files for KeepDays, the folder
// with sheet and log for KeepLogDays. The days of an order are counted from the day on which it was first seen as
// arrived, by the days that the kiosk has lived through, never by a date alone; where what was counted is lost they
// begin anew. No other order is touched.
class OrderKeeping {
public:
    OrderKeeping(const SessionState& state, const Platform& platform);

    // Once a day: sees it and removes what is due. The first failure; what failed is tried again with the next look.
    // Only while no order is in hand; nothing is removed while another program runs in the data folder.
    Result<void> look();

private:
    DrivePath path() const;
    void read();
    Result<void> write() const;
    bool mayGo(const OrderState& order) const;
    Result<void> removePrints(const OrderFolder& folder) const;

    const SessionState& m_state;
    const Platform& m_platform;
    QDate m_lookedAt;
    KioskDays m_days;
    QMap<QString, int> m_arrived; // days lived when the order of that folder was first seen as arrived
};

} // namespace lumora
