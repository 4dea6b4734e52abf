#include "finished/FilesToSend.h"

#include "common/DrivePathText.h"
#include "common/PieceName.h"
#include "transfer/OrderDetailsReader.h"

#include <QRegularExpression>

#include <algorithm>

namespace lumora {

namespace {

bool isSheet(const QString& name) {
    return name.startsWith(u'!');
}

} // namespace

void FilesToSend::setFolder(const QString& folder) {
    m_folder = folder;
    refresh();
}

void FilesToSend::setPattern(const QString& patterns) {
    m_pattern = patterns;
    refresh();
}

void FilesToSend::refresh() {
    m_names.clear();
    m_names.append(m_files.names(m_folder, m_pattern));
    m_marked.assign(static_cast<std::size_t>(m_names.count()), false);
}

bool FilesToSend::isMarked(int index) const {
    return index >= 0 && index < m_names.count() && m_marked[static_cast<std::size_t>(index)];
}

int FilesToSend::markedCount() const {
    return static_cast<int>(std::count(m_marked.begin(), m_marked.end(), true));
}

void FilesToSend::turnMark(int index) {
    m_names.setCurrentIndex(index);
    if (m_names.currentIndex() >= 0)
        m_marked[static_cast<std::size_t>(index)].flip();
}

void FilesToSend::markAll(std::int16_t Mefurak) {
    for (int i = 0; i < m_names.count(); ++i)
        m_marked[static_cast<std::size_t>(i)] = Mefurak <= 0 || IsPiece(m_names.item(i)) || isSheet(m_names.item(i));
}

QStringList FilesToSend::markedNames() const {
    QStringList names;
    for (int i = 0; i < m_names.count(); ++i) {
        if (isMarked(i))
            names.append(m_names.item(i));
    }
    return names;
}

std::int16_t FilesToSend::familyCount() const {
    return CopiesCount(markedNames());
}

QStringList FilesToSend::markedPaths() const {
    QStringList paths = markedNames();
    for (QString& path : paths)
        path = JoinDrivePath(m_folder, path);
    return paths;
}

std::optional<QString> FilesToSend::unmarkedSheet() const {
    if (m_names.isEmpty() || isMarked(0) || !isSheet(m_names.item(0)))
        return std::nullopt;
    return JoinDrivePath(m_folder, m_names.item(0));
}

QStringList FilesToSend::resendList() const {
    const QString text = JoinDrivePath(m_folder, LeafName(m_folder) + QStringLiteral(".txt"));
    QStringList list = markedPaths();
    // It may be among the marked files, and a name that stands twice in an order never arrives twice.
    list.removeAll(text);
    if (m_files.fileExists(text))
        list.prepend(text);
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

std::optional<FinishedOrder> FinishedOrderOf(const QString& folderName) {
    static const QRegularExpression form(QStringLiteral("^(\\d{4}_\\d{2}_\\d{2})_.*\\^(\\d+)(P?)$"));
    const QRegularExpressionMatch match = form.match(folderName);
    const QDate date = QDate::fromString(match.captured(1), QStringLiteral("yyyy_MM_dd"));
    if (!date.isValid())
        return std::nullopt;
    return FinishedOrder{date, match.captured(2), !match.captured(3).isEmpty()};
}

bool TravelsInPieces(const QString& folderName) {
    return folderName.endsWith(u'P');
}

} // namespace lumora
