#include "common/HostFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cerrno>
#include <cstring>
#include <string>
#include <string_view>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr std::string_view temporaryPrefix = ".lumora-";
constexpr std::string_view temporaryEnding = ".tmp";

Failure::Kind kindOf(int error) {
    switch (error) {
    case ENOENT:
    case ENOTDIR:
        return Failure::Kind::NotFound;
    case EACCES:
    case EPERM:
    case EROFS:
        return Failure::Kind::AccessDenied;
    case ENOSPC:
    case EDQUOT:
        return Failure::Kind::NoSpace;
    case EFBIG:
        return Failure::Kind::TooLarge;
    default:
        return Failure::Kind::Other;
    }
}

} // namespace

QString shownPath(const std::filesystem::path& path) {
    return QString::fromLocal8Bit(path.c_str());
}

Failure systemFailure(int error, const QString& path) {
    return {kindOf(error), u"%1: %2"_s.arg(path, QString::fromLocal8Bit(std::strerror(error)))};
}

Failure fileFailure(const std::filesystem::path& path, const QString& what, int error) {
    return systemFailure(error, u"%1: %2"_s.arg(shownPath(path), what));
}

Failure targetFailure(Failure failure) {
    if (failure.kind != Failure::Kind::NoSpace)
        failure.kind = Failure::Kind::Other;
    return failure;
}

Descriptor::Descriptor(Descriptor&& other) noexcept
    : m_number(std::exchange(other.m_number, -1)) {}

Descriptor& Descriptor::operator=(Descriptor&& other) noexcept {
    if (this != &other) {
        close();
        m_number = std::exchange(other.m_number, -1);
    }
    return *this;
}

int Descriptor::close() {
    return m_number < 0 ? 0 : ::close(std::exchange(m_number, -1));
}

Result<Descriptor> openSource(const std::filesystem::path& host, const QString& path) {
    Descriptor source(::open(host.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    struct stat status {};
    if (!source.valid() || ::fstat(source.number(), &status) != 0)
        return systemFailure(errno, path);
    if (!S_ISREG(status.st_mode))
        return Failure{Failure::Kind::Unsupported, u"%1: not a file"_s.arg(path)};
    return source;
}

void readAhead(const std::filesystem::path& host) {
    const Descriptor source(::open(host.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    if (source.valid())
        static_cast<void>(::posix_fadvise(source.number(), 0, 0, POSIX_FADV_WILLNEED));
}

Result<std::size_t> readSome(const Descriptor& source, char* bytes, std::size_t capacity, const QString& path) {
    for (;;) {
        const ssize_t count = ::read(source.number(), bytes, capacity);
        if (count >= 0)
            return static_cast<std::size_t>(count);
        if (errno != EINTR)
            return systemFailure(errno, path);
    }
}

Result<void> skipTo(const Descriptor& source, qint64 offset, const QString& path) {
    if (::lseek(source.number(), offset, SEEK_SET) < 0)
        return systemFailure(errno, path);
    return {};
}

Result<QByteArray> readWholeFile(const std::filesystem::path& host, const QString& path, qint64 largest) {
    const auto source = openSource(host, path);
    if (!source)
        return source.failure();
    QByteArray bytes;
    QByteArray part(qsizetype(1) << 16, Qt::Uninitialized);
    for (;;) {
        const auto count = readSome(*source, part.data(), static_cast<std::size_t>(part.size()), path);
        if (!count)
            return count.failure();
        if (*count == 0)
            return bytes;
        bytes.append(part.constData(), static_cast<qsizetype>(*count));
        if (bytes.size() > largest)
            return systemFailure(EFBIG, path);
    }
}

// The temporary name is short and does not grow from the final one, which may already be as long as a name can be.
NewContent::NewContent(std::filesystem::path target, QString path)
    : m_target(std::move(target))
    , m_path(std::move(path)) {
    static std::atomic<unsigned> counter{0};
    do {
        m_temporary = m_target.parent_path() / (std::string(temporaryPrefix) + std::to_string(::getpid()) + "-" +
                                                std::to_string(counter++) + std::string(temporaryEnding));
        m_file = Descriptor(::open(m_temporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666));
    } while (!m_file.valid() && errno == EEXIST);
    if (!m_file.valid()) {
        m_error = errno;
        m_temporary.clear();
    }
}

NewContent::~NewContent() {
    if (!m_temporary.empty())
        ::unlink(m_temporary.c_str());
}

void NewContent::append(const char* bytes, std::size_t count) {
    while (m_error == 0 && count > 0) {
        const ssize_t written = ::write(m_file.number(), bytes, count);
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

void NewContent::setTime(std::filesystem::file_time_type time) {
    std::error_code refused;
    if (m_error == 0)
        std::filesystem::last_write_time(m_temporary, time, refused);
    if (refused)
        m_error = refused.value();
}

Result<void> NewContent::commit(Durability durability) {
    const bool synced = durability == Durability::Synced;
    if (synced && m_error == 0 && ::fsync(m_file.number()) != 0)
        m_error = errno;
    if (m_error == 0 && m_file.close() != 0)
        m_error = errno;
    if (m_error == 0 && ::rename(m_temporary.c_str(), m_target.c_str()) != 0)
        m_error = errno;
    if (m_error != 0)
        return systemFailure(m_error, m_path);
    m_temporary.clear();
    if (!synced)
        return {};
    // The new name is not on the disk before its folder is. Not every file system can sync a folder, so that only a
    // fault of the disk counts.
    const Descriptor folder(::open(m_target.parent_path().c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (folder.valid() && ::fsync(folder.number()) != 0 && (errno == EIO || errno == ENOSPC || errno == EDQUOT))
        return systemFailure(errno, m_path);
    return {};
}

int removeLeftovers(const std::filesystem::path& folder, std::filesystem::file_time_type before) {
    namespace fs = std::filesystem;
    int removed = 0;
    std::error_code error;
    for (fs::recursive_directory_iterator at(folder, fs::directory_options::skip_permission_denied, error), end;
         !error && at != end; at.increment(error)) {
        const std::string name = at->path().filename().native();
        if (!name.starts_with(temporaryPrefix) || !name.ends_with(temporaryEnding))
            continue;
        std::error_code gone;
        if (at->is_regular_file(gone) && at->last_write_time(gone) < before && !gone && fs::remove(at->path(), gone))
            ++removed;
    }
    return removed;
}

Result<qint64> appendFrom(const Descriptor& source, qint64 count, NewContent& target, const QString& path) {
    QByteArray part(static_cast<qsizetype>(std::clamp<qint64>(count, 1, qint64(1) << 20)), Qt::Uninitialized);
    qint64 done = 0;
    while (done < count && !target.failed()) {
        const qint64 wanted = std::min<qint64>(part.size(), count - done);
        const auto read = readSome(source, part.data(), static_cast<std::size_t>(wanted), path);
        if (!read)
            return read.failure();
        if (*read == 0)
            break;
        target.append(part.constData(), *read);
        done += static_cast<qint64>(*read);
    }
    return done;
}

Result<void> writeWholeFile(const std::filesystem::path& path, const QByteArray& bytes) {
    NewContent content(path, u"%1: can't be written"_s.arg(shownPath(path)));
    content.append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    return content.commit();
}

} // namespace lumora
