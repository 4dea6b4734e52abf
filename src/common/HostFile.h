#pragma once

#include "common/Result.h"

#include <QByteArray>
#include <QString>

#include <filesystem>
#include <limits>

// Files of this machine, read and written whole. A failure's message names the path, or what the caller calls it.
namespace lumora {

// A path as it is shown to a person.
QString shownPath(const std::filesystem::path& path);

// The failure of an errno: "PATH: reason", or "PATH: what: reason".
Failure systemFailure(int error, const QString& path);
Failure fileFailure(const std::filesystem::path& path, const QString& what, int error);

// Where a file is made of another one, a failure to write it must not pass for one of the source: full, or other.
Failure targetFailure(Failure failure);

// A file descriptor that is closed at the end.
class Descriptor {
public:
    explicit Descriptor(int number = -1)
        : m_number(number) {}
    Descriptor(Descriptor&& other) noexcept;
    Descriptor& operator=(Descriptor&& other) noexcept;
    ~Descriptor() { close(); }

    bool valid() const { return m_number >= 0; }
    int number() const { return m_number; }
    int close();

private:
    int m_number;
};

// Opens a plain file for reading only. Anything else is a failure, since opening a pipe would wait for ever.
Result<Descriptor> openSource(const std::filesystem::path& host, const QString& path);

// Has the machine read a file that is wanted soon; does not wait for it.
void readAhead(const std::filesystem::path& host);

// The next bytes of an open file, up to the capacity given; 0 at the end.
Result<std::size_t> readSome(const Descriptor& source, char* bytes, std::size_t capacity, const QString& path);

// The next read begins behind the first offset bytes.
Result<void> skipTo(const Descriptor& source, qint64 offset, const QString& path);

// Reads the whole file; more than largest bytes is a failure. path appears in the message.
Result<QByteArray> readWholeFile(const std::filesystem::path& host, const QString& path, qint64 largest);

// The new content of a file, beside it under a hidden name until it is whole: a crash or a full disk leaves the old
// file or the new one. Nothing stays behind when it is not committed.
class NewContent {
public:
    NewContent(std::filesystem::path target, QString path);
    NewContent(const NewContent&) = delete;
    NewContent& operator=(const NewContent&) = delete;
    ~NewContent();

    // A failure is kept until commit and what is appended behind it is dropped.
    void append(const char* bytes, std::size_t count);
    bool failed() const { return m_error != 0; }
    // The time that the file will have, instead of that of its writing.
    void setTime(std::filesystem::file_time_type time);

    // Syncs and renames. A passing file, which is of no use after a crash, need not wait for the disk. Where the
    // folder's sync alone has failed, the new content stands under its name.
    enum class Durability { Synced, Passing };
    Result<void> commit(Durability durability = Durability::Synced);

private:
    std::filesystem::path m_target;
    QString m_path;
    std::filesystem::path m_temporary;
    Descriptor m_file;
    int m_error = 0;
};

inline constexpr qint64 toTheEnd = std::numeric_limits<qint64>::max();
// Removes hidden temporary files that ended programs left in this folder and below, if they are older than before;
// links are not followed. Returns their number. No program may be writing in the folder.
int removeLeftovers(const std::filesystem::path& folder, std::filesystem::file_time_type before);

// Appends the next bytes of the source, up to count of them, and tells how many there were. Stops early when the target
// has failed, which its commit tells.
Result<qint64> appendFrom(const Descriptor& source, qint64 count, NewContent& target, const QString& path);

// Writes a whole file as NewContent does.
Result<void> writeWholeFile(const std::filesystem::path& path, const QByteArray& bytes);

} // namespace lumora
