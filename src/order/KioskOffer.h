#pragma once

#include "order/UnfinishedOrders.h"

#include <QString>

namespace lumora {

// What a kiosk does with orders that were not finished. Nobody sees whose they are: an order is taken up by whoever
// knows the end of its telephone, and its customer is waited for only for a while. The two calls that change orders
// return the first failure and go on behind it; the next start page tries again.

constexpr int telephoneEnd = 3; // digits that are asked for

// Those whose customer may still come. Not among them: one whose customer was waited for, and one whose state is only
// guessed, about which the staff decides.
QList<UnfinishedOrder> OfferedOnKiosk(const QList<UnfinishedOrder>& orders, const Files& files);

// The digits are the last ones of the order's telephone; of an album's also of the photographer's.
bool IsEndOfTelephone(const OrderState& order, const QString& digits);

// Nobody has taken them up: they are offered no more.
Result<void> LetLapse(const QList<UnfinishedOrder>& orders, const Files& files);
// Throws those away that have lapsed before they were prepared. What is prepared stays: it is sent by itself, or the
// staff sends it.
Result<void> ThrowLapsedAway(const QList<UnfinishedOrder>& orders, const Files& files);

} // namespace lumora
