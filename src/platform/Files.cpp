#include "platform/Files.h"

#include "common/AnsiCodePage.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <memory>
#include <utility>

namespace lumora {
namespace fs = std::filesystem;
namespace {

// No file that is read whole comes near; what is larger was not meant.
constexpr qint64 largestRead = qint64(1) << 30;

Failure failure(Failure::Kind kind, const QString& path, const QString& reason) {
    return {kind, QStringLiteral("%1: %2").arg(path, reason)};
}

Failure systemFailure(int error, const QString& path) {
    auto kind = Failure::Kind::Other;
    switch (error) {
    case ENOENT:
    case ENOTDIR:
        kind = Failure::Kind::NotFound;
        break;
    case EACCES:
    case EPERM:
    case EROFS:
        kind = Failure::Kind::AccessDenied;
        break;
    case ENOSPC:
    case EDQUOT:
        kind = Failure::Kind::NoSpace;
        break;
    case EFBIG:
        kind = Failure::Kind::TooLarge;
        break;
    default:
        break;
    }
    return failure(kind, path, QString::fromLocal8Bit(std::strerror(error)));
}

class Descriptor {
public:
    explicit Descriptor(int number)
        : m_number(number) {}
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    ~Descriptor() { close(); }

    bool valid() const { return m_number >= 0; }
    int number() const { return m_number; }
    int close() { return m_number < 0 ? 0 : ::close(std::exchange(m_number, -1)); }

private:
    int m_number;
};

// For reading only, and only what is a plain file: a pipe would wait for ever.
Result<std::unique_ptr<Descriptor>> openSource(const HostPath& host, const QString& path) {
    auto source = std::make_unique<Descriptor>(::open(host.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    struct stat status {};
    if (!source->valid() || ::fstat(source->number(), &status) != 0)
        return systemFailure(errno, path);
    if (!S_ISREG(status.st_mode))
        return failure(Failure::Kind::Unsupported, path, QStringLiteral("not a file"));
    return source;
}

// The new content of a file, beside it under a hidden name until it is whole.
class NewContent {
public:
    NewContent(HostPath target, QString path)
        : m_target(std::move(target))
        , m_path(std::move(path)) {
        std::string name = (m_target.parent_path() / ".lumora-XXXXXX").native();
        m_file = std::make_unique<Descriptor>(::mkostemp(name.data(), O_CLOEXEC));
        if (m_file->valid())
            m_temporary = name;
        else
            m_error = errno;
    }
    NewContent(const NewContent&) = delete;
    NewContent& operator=(const NewContent&) = delete;
    ~NewContent() {
        if (!m_temporary.empty())
            ::unlink(m_temporary.c_str());
    }

    void append(const char* bytes, std::size_t count) {
        while (m_error == 0 && count > 0) {
            const ssize_t written = ::write(m_file->number(), bytes, count);
            if (written < 0 && errno == EINTR)
                continue;
            if (written < 0) {
                m_error = errno;
                return;
            }
            bytes += written;
            count -= static_cast<std::size_t>(written);
        }
    }

    Result<void> commit() {
        if (m_error == 0 && ::fsync(m_file->number()) != 0)
            m_error = errno;
        if (m_error == 0 && m_file->close() != 0)
            m_error = errno;
        if (m_error == 0 && ::rename(m_temporary.c_str(), m_target.c_str()) != 0)
            m_error = errno;
        if (m_error != 0)
            return systemFailure(m_error, m_path);
        m_temporary.clear();
        // The new name is not on the disk before its folder is; where a file system has no such call the file itself is
        // still whole.
        const Descriptor folder(::open(m_target.parent_path().c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
        if (folder.valid())
            ::fsync(folder.number());
        return {};
    }

private:
    HostPath m_target;
    QString m_path;
    std::unique_ptr<Descriptor> m_file;
    HostPath m_temporary;
    int m_error = 0;
};

// "*" any run of characters, "?" any one.
bool matches(QStringView pattern, QStringView name) {
    qsizetype p = 0;
    qsizetype n = 0;
    qsizetype star = -1;
    qsizetype resume = 0;
    while (n < name.size()) {
        if (p < pattern.size() && pattern[p] == u'*') {
            star = p++;
            resume = n;
        } else if (p < pattern.size() && (pattern[p] == u'?' || pattern[p].toCaseFolded() == name[n].toCaseFolded())) {
            ++p;
            ++n;
        } else if (star >= 0) {
            p = star + 1;
            n = ++resume;
        } else {
            return false;
        }
    }
    while (p < pattern.size() && pattern[p] == u'*')
        ++p;
    return p == pattern.size();
}

bool matchesAny(const QStringList& patterns, const QString& name) {
    return std::any_of(patterns.begin(), patterns.end(), [&](const QString& pattern) {
        return pattern == QLatin1String("*.*") || matches(pattern, name);
    });
}

void sortWithoutCase(QStringList& names) {
    std::sort(names.begin(), names.end(), [](const QString& a, const QString& b) {
        const int order = QString::compare(a, b, Qt::CaseInsensitive);
        return order != 0 ? order < 0 : a < b;
    });
}

enum class Wanted { Files, Folders };

// Names as they are, not yet squeezed into the code page. Hidden ones are left out.
QStringList entries(const HostPath& folder, Wanted wanted) {
    QStringList names;
    std::error_code error;
    for (fs::directory_iterator at(folder, error), end; !error && at != end; at.increment(error)) {
        std::error_code unreadable;
        const bool fits = wanted == Wanted::Files ? at->is_regular_file(unreadable) : at->is_directory(unreadable);
        if (fits && !at->path().filename().native().starts_with('.'))
            names += toDriveName(at->path().filename());
    }
    sortWithoutCase(names);
    return names;
}

void collectInto(QStringList& all, const HostPath& folder, const QString& shown, Files::Depth depth) {
    for (const QString& name : entries(folder, Wanted::Files))
        all += shown + u'\\' + AnsiCodePage::squeeze(name);
    if (depth == Files::Depth::ThisFolder)
        return;
    for (const QString& name : entries(folder, Wanted::Folders)) {
        const HostPath sub = folder / toHostPath(name);
        // A link may lead back up, and the walk would never end.
        if (!fs::is_symlink(sub))
            collectInto(all, sub, shown + u'\\' + AnsiCodePage::squeeze(name), depth);
    }
}

} // namespace

Result<HostPath> Files::host(const QString& path) const {
    if (path.contains(u'?'))
        return failure(Failure::Kind::NotFound, path, QStringLiteral("the name holds a \"?\""));
    if (auto found = m_drives.toHost(path))
        return *found;
    return failure(Failure::Kind::NotFound, path, QStringLiteral("no such drive or path"));
}

bool Files::fileExists(const QString& path) const {
    const auto found = host(path);
    std::error_code error;
    return found && fs::is_regular_file(*found, error);
}

bool Files::folderExists(const QString& path) const {
    const auto found = host(path);
    std::error_code error;
    return found && fs::is_directory(*found, error);
}

Result<void> Files::makeFolder(const QString& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    if (::mkdir(found->c_str(), 0700) == 0 || (errno == EEXIST && folderExists(path)))
        return {};
    return systemFailure(errno, path);
}

Result<void> Files::removeFile(const QString& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    if (::unlink(found->c_str()) != 0)
        return systemFailure(errno, path);
    return {};
}

Result<QByteArray> Files::read(const QString& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    const auto source = openSource(*found, path);
    if (!source)
        return source.failure();
    QByteArray bytes;
    QByteArray part(qsizetype(1) << 16, Qt::Uninitialized);
    for (;;) {
        const ssize_t count = ::read((*source)->number(), part.data(), static_cast<std::size_t>(part.size()));
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return systemFailure(errno, path);
        if (count == 0)
            return bytes;
        if (bytes.size() + count > largestRead)
            return systemFailure(EFBIG, path);
        bytes.append(part.constData(), count);
    }
}

Result<void> Files::writeWhole(const QString& path, const QByteArray& bytes) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    NewContent content(*found, path);
    content.append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    return content.commit();
}

Result<void> Files::copyFile(const QString& source, const QString& target) const {
    const auto from = host(source);
    if (!from)
        return from.failure();
    const auto to = host(target);
    if (!to)
        return to.failure();
    const auto opened = openSource(*from, source);
    if (!opened)
        return opened.failure();
    NewContent content(*to, target);
    QByteArray part(qsizetype(1) << 20, Qt::Uninitialized);
    for (;;) {
        const ssize_t count = ::read((*opened)->number(), part.data(), static_cast<std::size_t>(part.size()));
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return systemFailure(errno, source);
        if (count == 0)
            return content.commit();
        content.append(part.constData(), static_cast<std::size_t>(count));
    }
}

Result<qint64> Files::size(const QString& path) const {
    const auto found = host(path);
    if (!found)
        return found.failure();
    struct stat status {};
    if (::stat(found->c_str(), &status) != 0)
        return systemFailure(errno, path);
    if (!S_ISREG(status.st_mode))
        return failure(Failure::Kind::Unsupported, path, QStringLiteral("not a file"));
    return static_cast<qint64>(status.st_size);
}

QStringList Files::names(const QString& folder, const QString& patterns) const {
    QStringList wanted;
    for (const QString& pattern : patterns.split(u';', Qt::SkipEmptyParts))
        wanted += pattern.trimmed();
    const auto found = host(folder);
    QStringList names;
    if (!found)
        return names;
    for (const QString& name : entries(*found, Wanted::Files)) {
        if (matchesAny(wanted, name))
            names += AnsiCodePage::squeeze(name);
    }
    return names;
}

QStringList Files::folders(const QString& folder) const {
    const auto found = host(folder);
    QStringList names;
    if (!found)
        return names;
    for (const QString& name : entries(*found, Wanted::Folders))
        names += AnsiCodePage::squeeze(name);
    return names;
}

QStringList Files::collect(const QString& folder, Depth depth) const {
    const auto found = host(folder);
    QStringList all;
    if (found)
        collectInto(all, *found, folder.endsWith(u'\\') ? folder.chopped(1) : folder, depth);
    return all;
}

void FileList::setFolder(const QString& folder) {
    m_folder = folder;
    refresh();
}

void FileList::setPattern(const QString& patterns) {
    m_pattern = patterns;
    refresh();
}

void FileList::refresh() {
    m_names = m_files.names(m_folder, m_pattern);
}

} // namespace lumora
