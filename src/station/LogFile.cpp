#include "station/LogFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

namespace lumora {

LogFile::LogFile(HostPath path, qint64 most)
    : m_path(std::move(path))
    , m_most(most) {}

std::array<HostPath, 2> LogFile::filesAt(const HostPath& path) {
    HostPath before = path;
    before += ".1";
    return {before, path};
}

Result<void> LogFile::open() {
    std::error_code error;
    std::filesystem::create_directories(m_path.parent_path(), error);
    m_file = Descriptor(::open(m_path.c_str(), O_WRONLY | O_APPEND | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0600));
    struct stat facts {};
    if (!m_file.valid() || ::fchmod(m_file.number(), 0600) != 0 || ::fstat(m_file.number(), &facts) != 0)
        return systemFailure(errno, toText(m_path));
    m_size = facts.st_size;
    return {};
}

void LogFile::turnOver() {
    m_file.close();
    std::error_code error;
    std::filesystem::rename(m_path, filesAt(m_path)[0], error);
    // One that can't be set aside must not grow either.
    if (error)
        std::filesystem::remove(m_path, error);
}

Result<void> LogFile::append(const QByteArray& line) {
    if (!m_file.valid()) {
        if (auto opened = open(); !opened)
            return opened;
    }
    if (m_size > 0 && m_size + line.size() > m_most / 2) {
        turnOver();
        if (auto opened = open(); !opened)
            return opened;
    }
    if (::write(m_file.number(), line.constData(), static_cast<std::size_t>(line.size())) != line.size()) {
        const int error = errno;
        m_file.close(); // the next line looks anew where it stands
        return systemFailure(error, toText(m_path));
    }
    m_size += line.size();
    return {};
}

} // namespace lumora
