#pragma once

#include "common/DrivePath.h"
#include "session/TextList.h"

#include <QSet>

#include <functional>

namespace lumora {

// How many small pictures a page has.
inline constexpr int cellsOfPage = 12;

// Reads a page from the list's current index on: up to twelve texts, without those that read gives as empty. After a
// full page the index is that of the next page's first item; at the end of the list it stays at the last item, so that
// a further page shows that item alone.
QStringList FillPage(const QStringList& items, int& currentIndex, const std::function<QString(const QString&)>& read);

// All paths of the folders picked so far; its current index is the reading position of the paging.
class FolderPager {
public:
    const TextList& paths() const { return m_paths; }
    int count() const { return m_paths.count(); }
    bool isEmpty() const { return m_paths.isEmpty(); }
    QString item(int index) const { return m_paths.item(index); }
    int currentIndex() const { return m_paths.currentIndex(); }
    void setCurrentIndex(int index) { m_paths.setCurrentIndex(index); }
    // The page read last has the last picture.
    bool isAtEnd() const { return m_atEnd; }

    void clear();

    // Adds the files of a folder and returns how many it added. A drive root that is picked twice is listed once, any
    // other folder twice: a file is left out when folder and name, joined without a separator, are in the list. When
    // the list grew, the reading position becomes the last of the old items, or the first picture.
    int addFolder(const DrivePath& folder, const QStringList& names);

    // All paths at once, from the first one on.
    void takeBack(const QStringList& paths);

    bool IsInFolderList(const QString& path) const { return m_known.contains(path); }

    // The next page.
    QStringList FillPageList();
    // Goes back by 24 items, the page in view and the one before it, or to the first item.
    void PageBack();

private:
    TextList m_paths;
    QSet<QString> m_known; // the list's items, so that adding a folder of thousands stays quick
    bool m_atEnd = false;
};

} // namespace lumora
