#pragma once

#include <QDate>
#include <QString>
#include <QStringList>

// Names of an order and of the files in its folder, as the lab's tools expect them.
namespace lumora {

// TimeOfJob, YYYY_MM_DD_SSS_ssss^: the day, the code of how the order started in exactly three characters, the mark of
// the machine's volume.
QString BuildTimeOfJob(const QDate& day, const QString& kodMishloach, const QString& ser);

// The order name: TimeOfJob, which ends in "^", then the order number. OrderNumberOf gives the number of an order name.
QString OrderName(const QString& TimeOfJob, const QString& number);
QString OrderNumberOf(const QString& name);

// The leaf name of the order sheet, "!number_serial" and ending: ".jpp", or ".jpg" for the copy that is no print file.
QString SheetName(const QString& number, const QString& serial, const QString& ending);
bool IsSheet(const QString& leaf);

// The leaf names of these paths, in their order.
QStringList LeafNames(const QStringList& paths);

// True when the folder's path or leaf name ends in "P": the order is sent in pieces.
bool TravelsInPieces(const QString& folder);

} // namespace lumora
