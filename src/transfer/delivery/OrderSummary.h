#pragma once

#include "imaging/Bitmap.h"

#include <QDate>
#include <QStringList>

namespace lumora {

struct SessionState;

// The lines of an order's summary: date, who, delivery, paper, remarks, total, and four empty lines below.
QStringList OrderSummaryLines(const SessionState& state, const QDate& date);

// The same as a small picture, which travels with the order as its last file.
Bitmap OrderSummaryPicture(const QStringList& lines, Qt::LayoutDirection direction);

} // namespace lumora
