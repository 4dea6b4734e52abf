#pragma once

#include "imaging/Bitmap.h"

#include <QDate>
#include <QStringList>

namespace lumora {

struct SessionState;

// The lines of an order's summary: date, customer, delivery, paper, remarks, total, then four empty lines.
QStringList OrderSummaryLines(const SessionState& state, const QDate& date);

// The lines as a small picture, the last file of the order.
Bitmap OrderSummaryPicture(const QStringList& lines, Qt::LayoutDirection direction);

} // namespace lumora
