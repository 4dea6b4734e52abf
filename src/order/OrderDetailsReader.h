#pragma once

namespace lumora {

class DrivePath;
class Files;
struct OrderDetails;

// Reads nine fields of details from an order log: eight texts and the total. A key that the log lacks leaves its field
// unchanged. If the log can't be read, the texts become "NO details" and the total 0.
void ReadOrderDetails(const Files& files, const DrivePath& path, OrderDetails& details);

// The same for an order of an earlier day: the nine fields are cleared first, so that no other customer's stay. From an
// album's log come the photographer, the size, the mail address and the total.
void ReadResentDetails(const Files& files, const DrivePath& path, OrderDetails& details);

// What a report tells of an order that is sent again: the fields of ReadResentDetails(), the delivery address, and an
// album's remarks.
void ReadReportDetails(const Files& files, const DrivePath& path, OrderDetails& details);

} // namespace lumora
