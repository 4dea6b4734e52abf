#include "platform/NewContent.h"

#include "common/WholeFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <utility>

namespace lumora {

Failure systemFailure(int error, const QString& path) {
    return {failureKind(error), QStringLiteral("%1: %2").arg(path, QString::fromLocal8Bit(std::strerror(error)))};
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

Result<Descriptor> openSource(const HostPath& host, const QString& path) {
    Descriptor source(::open(host.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    struct stat status {};
    if (!source.valid() || ::fstat(source.number(), &status) != 0)
        return systemFailure(errno, path);
    if (!S_ISREG(status.st_mode))
        return Failure{Failure::Kind::Unsupported, QStringLiteral("%1: not a file").arg(path)};
    return source;
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

NewContent::NewContent(HostPath target, QString path)
    : m_target(std::move(target))
    , m_path(std::move(path)) {
    std::string name = (m_target.parent_path() / ".lumora-XXXXXX").native();
    m_file = Descriptor(::mkostemp(name.data(), O_CLOEXEC));
    if (m_file.valid())
        m_temporary = name;
    else
        m_error = errno;
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

Result<void> NewContent::commit() {
    if (m_error == 0 && ::fsync(m_file.number()) != 0)
        m_error = errno;
    if (m_error == 0 && m_file.close() != 0)
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

} // namespace lumora
