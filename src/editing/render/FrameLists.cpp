#include "editing/render/FrameLists.h"

#include "platform/files/Files.h"

namespace lumora {

using namespace Qt::StringLiterals;

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
    const QString pattern = kind == ListFile::Png ? u"*.png"_s : u"*.bmp"_s;
    for (const QString& leaf : m_files.names(m_folder / category, pattern)) {
        const QString name = leaf.chopped(4);
        if (!name.isEmpty() && name.size() <= longestName && !name.startsWith(u'k', Qt::CaseInsensitive))
            found += name;
    }
    return found;
}

DrivePath FrameLists::listFile(const QString& category, const QString& name) const {
    const DrivePath folder = m_folder / category;
    for (const QString& ending : {u".png"_s, u".bmp"_s}) {
        if (const QStringList found = m_files.names(folder, name + ending); !found.isEmpty())
            return folder / found.first();
    }
    return {};
}

} // namespace lumora
