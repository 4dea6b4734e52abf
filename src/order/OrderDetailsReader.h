#pragma once

#include <QString>

namespace lumora {

class Files;
struct OrderDetails;

// Takes nine fields of the details from an order log; a key that the log lacks leaves its field as it is. Without the
// file the texts become "NO details" and the total 0. The value of a line is taken whole, less its outer quotes.
void ReadOrderDetails(const Files& files, const QString& path, OrderDetails& details);

// The same for an order of an earlier day: the nine fields are cleared first, so that nothing of another customer is
// told. The log of an album has none of the nine keys; its photographer, size, address and total take their places.
void ReadResentDetails(const Files& files, const QString& path, OrderDetails& details);

} // namespace lumora
