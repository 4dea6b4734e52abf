#pragma once

#include <QString>
#include <QStringList>

namespace lumora {

class Files;
class OrderFolder;

// The files of a folder as FTP sends them: the order log first, then the print files, or the sheet and the pieces of an
// order that travels in pieces. Without a sheet such an order has the folder itself in its place, whose put fails.
// entries: the folder's names that match the sending page's pattern.
QStringList FtpOrderFiles(const Files& files, const OrderFolder& order, const QStringList& entries, bool inPieces);

// The same of the lines that the page of finished orders has handed over, for the older bulk path.
QStringList BulkFiles(const QStringList& handedOver, bool inPieces);

// The files of a folder as HTTP sends them: all but serverList, the list that an earlier check has fetched into it and
// that the server never names.
QStringList HttpOrderFiles(const Files& files, const QString& folder, const QString& serverList);

} // namespace lumora
