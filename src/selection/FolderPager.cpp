#include "selection/FolderPager.h"

#include <algorithm>

namespace lumora {

QStringList FillPage(const QStringList& items, int& currentIndex, const std::function<QString(const QString&)>& read) {
    QStringList page;
    for (int i = 0; i < cellsOfPage; ++i) {
        if (const QString text = read(items.value(currentIndex)); !text.isEmpty())
            page += text;
        if (currentIndex >= items.size() - 1)
            break;
        ++currentIndex;
    }
    return page;
}

void FolderPager::clear() {
    m_paths.clear();
    m_known.clear();
    m_atEnd = false;
}

int FolderPager::addFolder(const DrivePath& folder, const QStringList& names) {
    const int lastBefore = m_paths.lastIndex();
    for (const QString& name : names) {
        // Only a root ends in a backslash: "1.jpg" of the folder "a" is not the file "a1.jpg".
        if (folder.text().endsWith(u'\\') && IsInFolderList(folder.text() + name))
            continue;
        const QString path = (folder / name).text();
        m_paths.append(path);
        m_known.insert(path);
    }
    const int added = m_paths.lastIndex() - lastBefore;
    if (added > 0) {
        m_paths.setCurrentIndex(std::max(lastBefore, 0));
        m_atEnd = false;
    }
    return added;
}

void FolderPager::takeBack(const QStringList& paths) {
    clear();
    m_paths.append(paths);
    m_known = QSet<QString>(paths.begin(), paths.end());
    m_paths.setCurrentIndex(0);
}

QStringList FolderPager::FillPageList() {
    int index = m_paths.currentIndex();
    m_atEnd = index + cellsOfPage >= m_paths.count();
    const QStringList page = FillPage(m_paths.items(), index, [](const QString& path) { return path; });
    m_paths.setCurrentIndex(index);
    return page;
}

void FolderPager::PageBack() {
    const int index = m_paths.currentIndex();
    m_paths.setCurrentIndex(index < 2 * cellsOfPage ? 0 : index - 2 * cellsOfPage);
}

} // namespace lumora
