#include "finished/orders/FilesToSend.h"

#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/PieceName.h"
#include "order/PrintCode.h"

#include <algorithm>

namespace lumora {

void FilesToSend::setFolder(const DrivePath& folder) {
    m_folder = folder;
    refresh();
}

void FilesToSend::setPattern(const QString& patterns) {
    m_pattern = patterns;
    refresh();
}

void FilesToSend::refresh() {
    m_names = m_files.names(m_folder, m_pattern);
    m_marked.assign(static_cast<std::size_t>(m_names.size()), false);
}

bool FilesToSend::isMarked(int index) const {
    return index >= 0 && index < m_names.size() && m_marked[static_cast<std::size_t>(index)];
}

int FilesToSend::markedCount() const {
    return static_cast<int>(std::count(m_marked.begin(), m_marked.end(), true));
}

void FilesToSend::turnMark(int index) {
    if (index >= 0 && index < m_names.size())
        m_marked[static_cast<std::size_t>(index)].flip();
}

void FilesToSend::markAll(Travel Mefurak) {
    std::transform(m_names.begin(), m_names.end(), m_marked.begin(), [Mefurak](const QString& name) {
        return Mefurak == Travel::Whole || IsPiece(name) || IsSheet(name);
    });
}

QStringList FilesToSend::markedNames() const {
    QStringList names;
    for (int i = 0; i < m_names.size(); ++i) {
        if (isMarked(i))
            names.append(m_names[i]);
    }
    return names;
}

std::int16_t FilesToSend::familyCount() const {
    return sumOfCopies(markedNames(), CopiesIn::FileNames);
}

QStringList FilesToSend::markedPaths() const {
    QStringList paths = markedNames();
    const QString broken = OrderFolder(m_folder).brokenFilesPath().leaf();
    paths.removeIf([&](const QString& name) { return name.compare(broken, Qt::CaseInsensitive) == 0; });
    for (QString& path : paths)
        path = (m_folder / path).text();
    return paths;
}

std::optional<QString> FilesToSend::unmarkedSheet() const {
    if (m_names.isEmpty() || isMarked(0) || !IsSheet(m_names.first()))
        return std::nullopt;
    return (m_folder / m_names.first()).text();
}

QStringList FilesToSend::resendList() const {
    const DrivePath log = OrderFolder(m_folder).logPath();
    QStringList list = markedPaths();
    // The log may be marked too; a name that is sent twice never counts as arrived twice.
    list.removeAll(log.text());
    if (m_files.fileExists(log))
        list.prepend(log.text());
    if (const auto sheet = unmarkedSheet(); sheet && !list.isEmpty())
        list.append(*sheet);
    return list;
}

QStringList FilesToSend::mailList() const {
    QStringList list = markedPaths();
    if (const auto sheet = unmarkedSheet())
        list.prepend(*sheet);
    return list;
}

} // namespace lumora
