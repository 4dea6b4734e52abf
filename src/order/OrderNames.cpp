#include "order/OrderNames.h"

#include "common/DrivePathText.h"

namespace lumora {

bool IsSheet(const QString& leaf) {
    return leaf.startsWith(u'!');
}

bool TravelsInPieces(const QString& folder) {
    return folder.endsWith(u'P');
}

QString OrderTextPath(const QString& folder) {
    return JoinDrivePath(folder, LeafName(folder) + QStringLiteral(".txt"));
}

} // namespace lumora
