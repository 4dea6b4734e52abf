#include "order/BrokenFiles.h"

#include "common/AnsiCodePage.h"
#include "common/DrivePath.h"
#include "order/OrderFolder.h"
#include "platform/files/Files.h"
#include "session/TextList.h"

#include <algorithm>

namespace lumora {

Result<void> WriteBrokenFiles(const Files& files, const OrderFolder& folder, const TextList& broken) {
    QByteArray bytes;
    for (const QString& path : broken.items())
        bytes += AnsiCodePage::encode(path) + "\r\n";
    return files.writeWhole(folder.brokenFilesPath(), bytes);
}

QStringList ReadBrokenFiles(const Files& files, const OrderFolder& folder) {
    const DrivePath path = folder.brokenFilesPath();
    if (!files.fileExists(path))
        return {};
    const auto bytes = files.read(path);
    if (!bytes)
        return {};
    QStringList paths;
    for (QByteArray line : bytes->split('\n')) {
        if (line.endsWith('\r'))
            line.chop(1);
        if (!line.isEmpty())
            paths.append(AnsiCodePage::decode(line));
    }
    return paths;
}

bool IsBroken(const TextList& broken, const QString& leafName) {
    return std::any_of(broken.items().begin(), broken.items().end(),
                       [&](const QString& path) { return LeafName(path) == leafName; });
}

} // namespace lumora
