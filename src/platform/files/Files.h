#pragma once

#include "common/Result.h"
#include "platform/files/Drives.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

namespace lumora {

// Files and folders under drive paths. A failure's message names the path and the reason. Folders are made with mode
// 0700, since the workspace holds customers' personal data.
class Files {
public:
    explicit Files(const Drives& drives)
        : m_drives(drives) {}

    const Drives& drives() const { return m_drives; }

    // A path that holds a "?" counts as absent, here and in every call below: the "?" is what a character outside the
    // code page has become.
    bool fileExists(const QString& path) const;
    bool folderExists(const QString& path) const;

    // An existing folder is success. The parent must exist.
    Result<void> makeFolder(const QString& path) const;
    Result<void> removeFile(const QString& path) const;

    Result<QByteArray> read(const QString& path) const;

    // To a temporary file in the same folder, synced, then renamed: a crash or a full disk leaves the old file or the
    // new one and never half a file.
    Result<void> writeWhole(const QString& path, const QByteArray& bytes) const;

    // The same without waiting for the disk: for files that are written at every touch and that nothing needs after a
    // crash of the machine.
    Result<void> writePassing(const QString& path, const QByteArray& bytes) const;

    // Copies whole, in the same way. The source is opened for reading only.
    Result<void> copyFile(const QString& source, const QString& target) const;

    Result<qint64> size(const QString& path) const;

    // Leaf names of the files that match one of the patterns, joined by ";" ("*.gbr;*.jpp"); "*.*" and "*" match every
    // name. Letter case does not count. Hidden files (a leading dot) and folders are left out. Sorted by name without
    // regard to case, "!" before digits before letters. A name with a character outside the code page comes with "?" in
    // its place. A folder that is missing or may not be read gives no names.
    QStringList names(const QString& folder, const QString& patterns) const;

    // Leaf names of the sub-folders, sorted in the same way.
    QStringList folders(const QString& folder) const;

    // folder + "\" + name for each file. unreadable takes a line for each folder that may not be read; without it those
    // are passed over.
    enum class Depth { ThisFolder, WithSubfolders };
    QStringList collect(const QString& folder, Depth depth, QStringList* unreadable = nullptr) const;

    // The place on this machine, for who reads or writes a file in parts.
    Result<HostPath> host(const QString& path) const;

private:
    const Drives& m_drives;
};

// The working file list of a page: a folder and a pattern, and a snapshot of the matching names that stays as it is
// until the folder or the pattern is set or refresh is called.
class FileList {
public:
    explicit FileList(const Files& files, QString pattern = QStringLiteral("*.*"))
        : m_files(files)
        , m_pattern(std::move(pattern)) {}

    void setFolder(const QString& folder);
    void setPattern(const QString& patterns);
    void refresh();

    const QString& folder() const { return m_folder; }
    int count() const { return static_cast<int>(m_names.size()); }
    QString name(int index) const { return m_names.value(index); }
    const QStringList& names() const { return m_names; }

private:
    const Files& m_files;
    QString m_folder;
    QString m_pattern;
    QStringList m_names;
};

} // namespace lumora
