#include "editing/render/FrameLists.h"

#include "common/DrivePathText.h"
#include "platform/files/Files.h"

namespace lumora {

QStringList FrameLists::categories() const {
    QStringList found;
    for (const QString& name : m_files.folders(m_folder)) {
        if (name.size() <= longestCategory)
            found += name;
    }
    return found;
}

QStringList FrameLists::names(const QString& category, ListFile kind) const {
    QStringList found;
    const QString pattern = kind == ListFile::Png ? QStringLiteral("*.png") : QStringLiteral("*.bmp");
    for (const QString& leaf : m_files.names(JoinDrivePath(m_folder, category), pattern)) {
        const QString name = leaf.chopped(4);
        if (!name.isEmpty() && name.size() <= longestName && !name.startsWith(u'k', Qt::CaseInsensitive))
            found += name;
    }
    return found;
}

QString FrameLists::listFile(const QString& category, const QString& name) const {
    const QString folder = JoinDrivePath(m_folder, category);
    for (const QString& ending : {QStringLiteral(".png"), QStringLiteral(".bmp")}) {
        if (const QStringList found = m_files.names(folder, name + ending); !found.isEmpty())
            return JoinDrivePath(folder, found.first());
    }
    return {};
}

} // namespace lumora
