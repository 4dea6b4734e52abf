#pragma once

#include <QString>
#include <QStringList>

#include <cstdint>

namespace lumora {

class Files;
struct OrderDetails;

// Takes nine fields of the details from an order log; a key that the log lacks leaves its field as it is. Without the
// file the texts become "NO details" and the total 0. The value of a line is taken whole, less its outer quotes. An
// album's log has none of the nine keys: its photographer, size, address and total go where the fields are empty.
void ReadOrderDetails(const Files& files, const QString& path, OrderDetails& details);

// Clears the nine fields, so that a resend of an older order shows nothing of another customer.
void ClearReadDetails(OrderDetails& details);

// The copies of all files of an order: the first two characters of each leaf name, but for texts. The sheet and names
// that begin with letters add 0. Held at 32767.
std::int16_t CopiesCount(const QStringList& leafNames);

} // namespace lumora
