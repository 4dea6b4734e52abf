// Loaded in front of a program by LD_PRELOAD. Its monotonic clock, its waits and the limits of its sockets run
// MATRIX_CLOCK times as fast; at rename MATRIX_KILL the program is killed, before it or, if the number is negative,
// after it. The targets of all renames are written to the file MATRIX_RENAMES, a line each. A rename to a path that
// ends in MATRIX_FULL finds the disk full.
#include <dlfcn.h>
#include <poll.h>
#include <sys/epoll.h>
#include <sys/socket.h>
#include <sys/syscall.h>
#include <sys/time.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <string_view>

namespace {

long number(const char* name) {
    const char* text = std::getenv(name);
    return text ? std::atol(text) : 0;
}
const long hurry = std::max(1L, number("MATRIX_CLOCK"));
const long killAt = number("MATRIX_KILL");
const char* const renamesFile = std::getenv("MATRIX_RENAMES");
const char* const full = std::getenv("MATRIX_FULL");
std::atomic<long> renames = 0;
constexpr long second = 1'000'000'000;     // nanoseconds
constexpr time_t calendar = 1'000'000'000; // seconds; a later deadline is one of the calendar's clock

timespec divided(const timespec& time, long by) {
    const long long all = (static_cast<long long>(time.tv_sec) * second + time.tv_nsec) / by;
    return {static_cast<time_t>(all / second), static_cast<long>(all % second)};
}

template <class Function>
Function* next(const char* name) {
    return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

} // namespace

extern "C" {

int clock_gettime(clockid_t clock, timespec* now) noexcept {
    const int failed = static_cast<int>(syscall(SYS_clock_gettime, clock, now));
    if (failed == 0 && hurry > 1 && (clock == CLOCK_MONOTONIC || clock == CLOCK_MONOTONIC_COARSE)) {
        const long long all = (static_cast<long long>(now->tv_sec) * second + now->tv_nsec) * hurry;
        *now = {static_cast<time_t>(all / second), static_cast<long>(all % second)};
    }
    return failed;
}

int poll(pollfd* sockets, nfds_t count, int timeout) {
    return next<decltype(poll)>("poll")(sockets, count,
                                        timeout > 0 ? static_cast<int>(std::max(1L, timeout / hurry)) : timeout);
}

int epoll_wait(int waiting, epoll_event* events, int count, int timeout) {
    return next<decltype(epoll_wait)>("epoll_wait")(
        waiting, events, count, timeout > 0 ? static_cast<int>(std::max(1L, timeout / hurry)) : timeout);
}

int ppoll(pollfd* sockets, nfds_t count, const timespec* timeout, const sigset_t* signals) {
    const timespec shorter = timeout ? divided(*timeout, hurry) : timespec{};
    return next<decltype(ppoll)>("ppoll")(sockets, count, timeout ? &shorter : nullptr, signals);
}

int setsockopt(int socket, int level, int option, const void* value, socklen_t size) noexcept {
    if (level == SOL_SOCKET && (option == SO_RCVTIMEO || option == SO_SNDTIMEO) && size == sizeof(timeval)) {
        const auto* given = static_cast<const timeval*>(value);
        const timespec shorter = divided({given->tv_sec, given->tv_usec * 1000}, hurry);
        const timeval passed{shorter.tv_sec,
                             std::max<suseconds_t>(shorter.tv_nsec / 1000, given->tv_sec > 0 ? 1000 : 0)};
        return next<decltype(setsockopt)>("setsockopt")(socket, level, option, &passed, sizeof(passed));
    }
    return next<decltype(setsockopt)>("setsockopt")(socket, level, option, value, size);
}

// The deadlines are times of the monotonic clock above; those of the calendar are far larger.
int pthread_cond_timedwait(pthread_cond_t* condition, pthread_mutex_t* mutex, const timespec* deadline) {
    const timespec real = deadline->tv_sec < calendar ? divided(*deadline, hurry) : *deadline;
    return next<decltype(pthread_cond_timedwait)>("pthread_cond_timedwait")(condition, mutex, &real);
}

int pthread_cond_clockwait(pthread_cond_t* condition, pthread_mutex_t* mutex, clockid_t clock,
                           const timespec* deadline) {
    const timespec real = clock == CLOCK_MONOTONIC ? divided(*deadline, hurry) : *deadline;
    return next<decltype(pthread_cond_clockwait)>("pthread_cond_clockwait")(condition, mutex, clock, &real);
}

int rename(const char* from, const char* to) noexcept {
    const long count = ++renames;
    if (count == killAt)
        raise(SIGKILL);
    if (full && std::string_view(to).ends_with(full)) {
        errno = ENOSPC;
        return -1;
    }
    const int failed = next<decltype(rename)>("rename")(from, to);
    if (std::FILE* file = renamesFile ? std::fopen(renamesFile, "a") : nullptr) {
        std::fprintf(file, "%s\n", to);
        std::fclose(file);
    }
    if (count == -killAt)
        raise(SIGKILL);
    return failed;
}
}
