#pragma once

#include <QString>
#include <QStringList>

namespace lumora {

class DrivePath;
class Files;
class OrderFolder;

// What the FTP page lists of an order's folder.
inline const QString ftpOrderPattern = QStringLiteral("*.gbr;*.jpp;*.prk");

// The files of a folder in the order in which FTP sends them: the order log, then the print files. Of an order in
// pieces the sheet and the pieces follow the log; without a sheet the folder itself stands in its place, and its put
// fails. entries: the folder's names that match ftpOrderPattern.
QStringList FtpOrderFiles(const Files& files, const OrderFolder& order, const QStringList& entries, bool inPieces);

// The same for the older bulk path, chosen from the paths that the page of finished orders handed over.
QStringList BulkFiles(const QStringList& handedOver, bool inPieces);

// The files of a folder that HTTP sends: all but serverList, the file that an earlier check downloaded into the folder,
// and the list of broken files that a sending by FTP left there.
QStringList HttpOrderFiles(const Files& files, const DrivePath& folder, const QString& serverList);

} // namespace lumora
