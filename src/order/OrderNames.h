#pragma once

#include <QString>

// Names in and of an order's folder, by which the lab tells what is what.
namespace lumora {

// An order's name: TimeOfJob, which ends in "^", and the order number. The number alone is read back from a name.
QString OrderName(const QString& TimeOfJob, const QString& number);
QString OrderNumberOf(const QString& name);

// The order sheet: its leaf name begins with "!". ending with its dot: ".jpp", or ".jpg" for who takes a plain picture.
QString SheetName(const QString& number, const QString& serial, const QString& ending);
bool IsSheet(const QString& leaf);

// An order in pieces: the last letter of its folder's path or leaf name is "P".
bool TravelsInPieces(const QString& folder);

} // namespace lumora
