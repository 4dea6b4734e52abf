#include "common/DrivePathText.h"

#include <algorithm>

namespace lumora {

QString LeafName(const QString& path) {
    const qsizetype at = path.lastIndexOf(u'\\');
    return at < 0 ? notChosen : path.mid(at + 1);
}

QString ParentFolder(const QString& path) {
    const QString trimmed = path.endsWith(u'\\') ? path.chopped(1) : path;
    const qsizetype at = trimmed.lastIndexOf(u'\\');
    return at < 0 ? notChosen : trimmed.left(at);
}

QString FolderOfPath(const QString& path) {
    if (path == notChosen || path.size() < 3)
        return notChosen;
    const qsizetype at = path.lastIndexOf(u'\\');
    return at < 0 ? notChosen : path.left(at);
}

QString MangleFileName(const QString& path) {
    QString name = path;
    return name.replace(u'\\', u']').replace(u':', u';');
}

QString NameWithoutEnding(const QString& path) {
    return LeafName(path).chopped(std::min<qsizetype>(4, LeafName(path).size()));
}

QString JoinDrivePath(const QString& folder, const QString& name) {
    return folder.endsWith(u'\\') ? folder + name : folder + u'\\' + name;
}

} // namespace lumora
