#include "common/WholeFile.h"

#include <QString>

#include <atomic>
#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <string>
#include <sys/stat.h>
#include <unistd.h>

namespace lumora {

namespace {

int writeAll(int file, const QByteArray& bytes) {
    const char* next = bytes.constData();
    qsizetype left = bytes.size();
    while (left > 0) {
        const ssize_t written = ::write(file, next, static_cast<std::size_t>(left));
        if (written < 0 && errno == EINTR)
            continue;
        if (written < 0)
            return errno;
        next += written;
        left -= written;
    }
    return 0;
}

} // namespace

Failure::Kind failureKind(int errorNumber) {
    switch (errorNumber) {
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

Failure fileFailure(const std::filesystem::path& path, const QString& what, int errorNumber) {
    const std::string name = path.string();
    return {failureKind(errorNumber), QStringLiteral("%1: %2: %3")
                                          .arg(QString::fromUtf8(name.data(), static_cast<qsizetype>(name.size())),
                                               what, QString::fromLocal8Bit(std::strerror(errorNumber)))};
}

Result<void> writeWholeFile(const std::filesystem::path& path, const QByteArray& bytes) {
    // The temporary name is short and does not grow from the final one, which may already be as long as a name can be.
    static std::atomic<unsigned> counter{0};
    const auto temporary =
        path.parent_path() / (".lumora-" + std::to_string(::getpid()) + "-" + std::to_string(counter++) + ".tmp");

    const int file = ::open(temporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
    if (file < 0)
        return fileFailure(path, QStringLiteral("can't be written"), errno);
    int error = writeAll(file, bytes);
    if (error == 0 && ::fsync(file) != 0)
        error = errno;
    if (::close(file) != 0 && error == 0)
        error = errno;
    if (error == 0 && ::rename(temporary.c_str(), path.c_str()) != 0)
        error = errno;
    if (error != 0) {
        ::unlink(temporary.c_str());
        return fileFailure(path, QStringLiteral("can't be written"), error);
    }
    return {};
}

} // namespace lumora
