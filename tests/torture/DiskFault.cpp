#include "DiskFault.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <cstdarg>
#include <cstdio>

namespace {

std::atomic<int> calls{0};
std::atomic<int> failing{0};
std::atomic<int> synced{0};
std::atomic<lumora::DiskFault::Kind> kindOfFault{};

bool fails(bool takesSpace) {
    const int nth = failing;
    const int call = ++calls;
    const bool full = kindOfFault == lumora::DiskFault::Kind::FullDisk;
    const bool again = full ? takesSpace : kindOfFault == lumora::DiskFault::Kind::Twice && call == nth + 1;
    if (nth == 0 || call < nth || (call > nth && !again))
        return false;
    errno = full || nth % 2 == 1 ? ENOSPC : EIO;
    return true;
}

} // namespace

extern "C" {

int __real_open(const char*, int, ...);
ssize_t __real_write(int, const void*, size_t);
int __real_close(int);
int __real_rename(const char*, const char*);
int __real_link(const char*, const char*);
int __real_mkdir(const char*, mode_t);
int __real_unlink(const char*);

int __wrap_open(const char* path, int flags, ...) {
    if ((flags & O_CREAT) == 0)
        return __real_open(path, flags);
    va_list further;
    va_start(further, flags);
    const auto mode = va_arg(further, mode_t);
    va_end(further);
    return fails(true) ? -1 : __real_open(path, flags, mode);
}
// What fails has written a half.
ssize_t __wrap_write(int file, const void* bytes, size_t count) {
    const bool failed = fails(true);
    const int why = errno;
    const ssize_t written = __real_write(file, bytes, failed ? count / 2 : count);
    if (failed)
        errno = why;
    return failed ? -1 : written;
}
int __wrap_fsync(int) {
    ++synced;
    return fails(false) ? -1 : 0;
}
int __wrap_close(int file) {
    const bool changes = (::fcntl(file, F_GETFL) & O_ACCMODE) != O_RDONLY;
    const int closed = __real_close(file);
    return changes && fails(false) ? -1 : closed;
}
int __wrap_rename(const char* from, const char* to) {
    return fails(false) ? -1 : __real_rename(from, to);
}
int __wrap_link(const char* from, const char* to) {
    return fails(true) ? -1 : __real_link(from, to);
}
int __wrap_mkdir(const char* path, mode_t mode) {
    return fails(true) ? -1 : __real_mkdir(path, mode);
}
int __wrap_unlink(const char* path) {
    return fails(false) ? -1 : __real_unlink(path);
}
}

namespace lumora {

DiskFault::DiskFault(int nth, Kind kind) {
    kindOfFault = kind;
    calls = synced = 0;
    failing = nth;
}

DiskFault::~DiskFault() {
    failing = 0;
}

bool DiskFault::met() const {
    return calls >= failing;
}

int DiskFault::syncs() const {
    return synced;
}

} // namespace lumora
