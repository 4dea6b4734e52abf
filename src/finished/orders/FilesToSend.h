#pragma once

#include "platform/files/Files.h"
#include "session/SessionState.h"

#include <cstdint>
#include <optional>
#include <vector>

namespace lumora {

// The files of one order folder and which of them are marked to be sent. Reading the folder again takes all marks away.
class FilesToSend {
public:
    // Whole files: what the lab prints from. Of an order that travels in pieces the list shows pieces and texts too.
    static inline const QString wholeFiles = QStringLiteral("*.jpp;*.jpg");
    static inline const QString withPieces = QStringLiteral("*.prk;*.jpp;*.txt");

    explicit FilesToSend(const Files& files)
        : m_files(files) {}

    void setFolder(const QString& folder);
    void setPattern(const QString& patterns);
    void refresh();

    const QString& folder() const { return m_folder; }
    // Leaf names, sorted without regard to case in one order over all patterns.
    const QStringList& names() const { return m_names; }
    bool isMarked(int index) const;
    int markedCount() const;

    // An index out of range does nothing.
    void turnMark(int index);
    // Of an order in pieces only those and the sheet, whose name begins with "!", are marked.
    void markAll(Travel Mefurak);

    // Pictures in the marked files, told by the first two characters of each name; texts hold none.
    std::int16_t familyCount() const;

    // Full paths of what a new sending takes: the order's text, if there is one, and then the marked files. Empty when
    // that is nothing, even where a sheet lies there. A sheet that is not marked goes last.
    QStringList resendList() const;
    // Full paths of what goes as mail packages, one each: a sheet that is not marked, then the marked files.
    QStringList mailList() const;

private:
    QStringList markedNames() const;
    QStringList markedPaths() const;
    std::optional<QString> unmarkedSheet() const;

    const Files& m_files;
    QString m_folder;
    QString m_pattern = wholeFiles;
    QStringList m_names;
    std::vector<bool> m_marked;
};

} // namespace lumora
