#pragma once

#include "platform/files/Files.h"
#include "session/SessionState.h"

#include <cstdint>
#include <optional>
#include <vector>

namespace lumora {

// The files of one order folder, and which of them are marked for sending. Reading the folder again clears all marks.
class FilesToSend {
public:
    // The files that the lab prints from. The list of an order in pieces has pieces and texts too.
    static inline const QString wholeFiles = QStringLiteral("*.jpp;*.jpg");
    static inline const QString withPieces = QStringLiteral("*.prk;*.jpp;*.txt");

    explicit FilesToSend(const Files& files)
        : m_files(files) {}

    void setFolder(const DrivePath& folder);
    void setPattern(const QString& patterns);
    void refresh();

    const DrivePath& folder() const { return m_folder; }
    // Leaf names that match any pattern, sorted without regard to case.
    const QStringList& names() const { return m_names; }
    bool isMarked(int index) const;
    int markedCount() const;

    // Does nothing with an index out of range.
    void turnMark(int index);
    // Of an order in pieces it marks only the pieces and the sheet, whose name begins with "!".
    void markAll(Travel Mefurak);

    // Sum of the copies in the first two characters of the marked names; texts count 0.
    std::int16_t familyCount() const;

    // Full paths for a new sending: the order's log, if there is one, the marked files, then a sheet that is not
    // marked. Empty when there is neither a log nor a marked file. The list of broken files, which is of no order,
    // never travels.
    QStringList resendList() const;
    // Full paths for the mail, one package each: a sheet that is not marked, then the marked files.
    QStringList mailList() const;

private:
    QStringList markedNames() const;
    QStringList markedPaths() const;
    std::optional<QString> unmarkedSheet() const;

    const Files& m_files;
    DrivePath m_folder;
    QString m_pattern = wholeFiles;
    QStringList m_names;
    std::vector<bool> m_marked;
};

} // namespace lumora
