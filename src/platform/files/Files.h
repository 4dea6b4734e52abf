#pragma once

#include "common/Result.h"
#include "platform/files/Drives.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

namespace lumora {

// Files and folders under drive paths. The message of a failure holds the path and the reason. Folders get the mode
// 0700, since the workspace holds customers' personal data.
class Files {
public:
    explicit Files(const Drives& drives)
        : m_drives(drives) {}

    const Drives& drives() const { return m_drives; }

    // A path with "?" counts as absent in all calls: "?" replaces a character outside the code page.
    bool fileExists(const DrivePath& path) const;
    bool folderExists(const DrivePath& path) const;

    // Succeeds when the folder exists. The parent must exist.
    Result<void> makeFolder(const DrivePath& path) const;
    // True if this call made the folder, false if the name exists already: of two programs only one gets true.
    Result<bool> makeNewFolder(const DrivePath& path) const;
    Result<void> removeFile(const DrivePath& path) const;
    // Removes a folder with all that it holds, hidden entries too; a link is removed, not what it leads to. Refused for
    // a drive and for a folder that lies directly on one.
    Result<void> removeTree(const DrivePath& path) const;

    Result<QByteArray> read(const DrivePath& path) const;

    // Writes a temporary file in the same folder, syncs and renames it: after a crash or on a full disk the path holds
    // the old file or the new one, never part of one.
    Result<void> writeWhole(const DrivePath& path, const QByteArray& bytes) const;

    // The same without the sync, for files written at every touch that are not needed after a crash of the machine.
    Result<void> writePassing(const DrivePath& path, const QByteArray& bytes) const;

    // Copies in the same way. The source is opened for reading only.
    Result<void> copyFile(const DrivePath& source, const DrivePath& target) const;

    // The target holds what the source holds now: a second name of the file where the disk allows it, else a copy. For
    // files that are only ever replaced as a whole.
    Result<void> keepCopy(const DrivePath& source, const DrivePath& target) const;

    Result<qint64> size(const DrivePath& path) const;
    // What a file in the folder may still take, in bytes.
    Result<qint64> freeBytes(const DrivePath& folder) const;

    // Leaf names of the files that match one of the patterns, separated by ";" ("*.gbr;*.jpp"); "*.*" and "*" match
    // all. Letter case does not count. Hidden files (a leading dot) and folders are left out. Sorted without regard to
    // case, "!" before digits before letters. A character outside the code page is "?". Empty when the folder can't be
    // read.
    QStringList names(const DrivePath& folder, const QString& patterns) const;
    // The same with the characters outside the code page as they are.
    QStringList storedNames(const DrivePath& folder, const QString& patterns) const;

    // Leaf names of the sub-folders, sorted likewise.
    QStringList folders(const DrivePath& folder) const;

    // folder + "\" + name for each file. Folders that can't be read are skipped and appended to unreadable, if given.
    enum class Depth { ThisFolder, WithSubfolders };
    QStringList collect(const DrivePath& folder, Depth depth, QStringList* unreadable = nullptr) const;

    // The path on this machine, for reading or writing parts of a file.
    Result<HostPath> host(const DrivePath& path) const;

private:
    const Drives& m_drives;
};

// The file list of a page: the names in a folder that match a pattern, read when the folder or the pattern is set and
// by refresh().
class FileList {
public:
    enum class Names { InCodePage, Stored };
    explicit FileList(const Files& files, QString pattern = QStringLiteral("*.*"), Names as = Names::InCodePage)
        : m_files(files)
        , m_pattern(std::move(pattern))
        , m_as(as) {}

    void setFolder(const DrivePath& folder);
    void setPattern(const QString& patterns);
    void refresh();

    const DrivePath& folder() const { return m_folder; }
    int count() const { return static_cast<int>(m_names.size()); }
    QString name(int index) const { return m_names.value(index); }
    const QStringList& names() const { return m_names; }

private:
    const Files& m_files;
    DrivePath m_folder;
    QString m_pattern;
    Names m_as;
    QStringList m_names;
};

} // namespace lumora
