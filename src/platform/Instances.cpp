#include "platform/Instances.h"

#include <fcntl.h>

#include <cerrno>
#include <cstring>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr char lockFile[] = ".lumora-runs";

struct flock wholeFile(short kind) {
    struct flock lock = {};
    lock.l_type = kind;
    lock.l_whence = SEEK_SET;
    return lock;
}

} // namespace

Instances::Instances(const HostPath& dataFolder, Lock lock)
    : m_file(::open((dataFolder / lockFile).c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600)) {
    struct flock mine = wholeFile(lock == Lock::Exclusive ? F_WRLCK : F_RDLCK);
    if (m_file.valid() && ::fcntl(m_file.number(), F_OFD_SETLK, &mine) == 0)
        return;
    const int why = errno;
    m_refused = m_file.valid() && (why == EAGAIN || why == EACCES);
    if (!m_refused)
        m_fault = Failure{Failure::Kind::AccessDenied,
                          toText(dataFolder / lockFile) + u": "_s + QString::fromLocal8Bit(std::strerror(why))};
}

bool Instances::another() const {
    struct flock others = wholeFile(F_WRLCK);
    return m_file.valid() && ::fcntl(m_file.number(), F_OFD_GETLK, &others) == 0 && others.l_type != F_UNLCK;
}

} // namespace lumora
