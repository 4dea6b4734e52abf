#include "transfer/delivery/OrderFiles.h"

#include "common/DrivePath.h"
#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/PieceName.h"
#include "platform/files/Files.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// A shorter path is no folder.
constexpr int shortestFolder = 4;

} // namespace

QStringList FtpOrderFiles(const Files& files, const OrderFolder& order, const QStringList& entries, bool inPieces) {
    QStringList paths;
    if (const DrivePath log = order.logPath(); files.fileExists(log))
        paths += log.text();
    const auto append = [&](const QString& name) { paths += order.filePath(name).text(); };
    if (inPieces) {
        const auto sheet = std::find_if(entries.begin(), entries.end(), IsSheet);
        append(sheet == entries.end() ? QString() : *sheet);
    }
    for (const QString& name : entries) {
        if (!inPieces || IsPiece(name))
            append(name);
    }
    return paths;
}

QStringList BulkFiles(const QStringList& handedOver, bool inPieces) {
    if (!inPieces)
        return handedOver;
    QStringList texts;
    QStringList pieces;
    QString sheet;
    for (const QString& path : handedOver) {
        if (path.endsWith(u"txt"_s))
            texts += path;
        else if (path.endsWith(u"prk"_s))
            pieces += path;
        if (sheet.isEmpty() && IsSheet(LeafName(path)))
            sheet = path;
    }
    if (!sheet.isEmpty())
        texts += sheet;
    return texts + pieces;
}

QStringList HttpOrderFiles(const Files& files, const DrivePath& folder, const QString& serverList) {
    const DrivePath path(folder.text().trimmed());
    if (path.text().size() < shortestFolder)
        return {};
    QStringList paths = files.collect(path, Files::Depth::ThisFolder);
    const QString broken = OrderFolder(path).brokenFilesPath().leaf();
    paths.removeIf([&](const QString& each) {
        const QString name = LeafName(each);
        return name.compare(serverList, Qt::CaseInsensitive) == 0 || name.compare(broken, Qt::CaseInsensitive) == 0;
    });
    return paths;
}

} // namespace lumora
