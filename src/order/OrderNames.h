#pragma once

#include <QString>

// Names in and of an order's folder, by which the lab tells what is what.
namespace lumora {

// The order sheet: its leaf name begins with "!".
bool IsSheet(const QString& leaf);

// An order in pieces: the last letter of its folder's path or leaf name is "P".
bool TravelsInPieces(const QString& folder);

// The order's text, which has the leaf name of its folder.
QString OrderTextPath(const QString& folder);

} // namespace lumora
