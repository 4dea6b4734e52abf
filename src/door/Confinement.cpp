#include "door/Confinement.h"

#include <cerrno>
#include <memory>

#include <malloc.h>
#include <pthread.h>
#include <sched.h>
#include <seccomp.h>
#include <signal.h>
#include <sys/mman.h>
#include <sys/prctl.h>
#include <sys/resource.h>

namespace lumora {

namespace {

// The sanitizers map terabytes for their own use.
#if defined(__SANITIZE_ADDRESS__)
constexpr bool memoryIsOurs = false;
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
constexpr bool memoryIsOurs = false;
#else
constexpr bool memoryIsOurs = true;
#endif
#else
constexpr bool memoryIsOurs = true;
#endif

bool limit(__rlimit_resource resource, rlim_t soft, rlim_t hard) {
    const rlimit value{soft, hard};
    return setrlimit(resource, &value) == 0;
}

struct FilterReleaser {
    void operator()(void* filter) const { seccomp_release(filter); }
};

constexpr int always[] = {
    SCMP_SYS(read),
    SCMP_SYS(pread64),
    SCMP_SYS(write),
    SCMP_SYS(lseek),
    SCMP_SYS(close),
    SCMP_SYS(munmap),
    SCMP_SYS(mremap),
    SCMP_SYS(madvise),
    SCMP_SYS(brk),
    SCMP_SYS(futex),
    SCMP_SYS(set_robust_list),
    SCMP_SYS(rseq),
    SCMP_SYS(gettid),
    SCMP_SYS(getpid),
    SCMP_SYS(sched_yield),
    SCMP_SYS(sched_getaffinity),
    SCMP_SYS(sysinfo),
    SCMP_SYS(rt_sigprocmask),
    SCMP_SYS(rt_sigaction),
    SCMP_SYS(rt_sigreturn),
    SCMP_SYS(sigaltstack),
    SCMP_SYS(clock_gettime),
    SCMP_SYS(gettimeofday),
    SCMP_SYS(getrandom),
    SCMP_SYS(eventfd2),
    SCMP_SYS(poll),
    SCMP_SYS(exit),
    SCMP_SYS(exit_group),
};

} // namespace

bool limitMyself(const DoorLimits& limits) {
    // Addresses count: each thread of a decoder would take 8 MiB of them for its stack and 64 MiB for memory of its
    // own.
    pthread_attr_t attributes;
    pthread_attr_init(&attributes);
    const bool stacked = pthread_attr_setstacksize(&attributes, std::size_t(1) << 20) == 0 &&
                         pthread_setattr_default_np(&attributes) == 0 && mallopt(M_ARENA_MAX, 1) == 1;
    pthread_attr_destroy(&attributes);
    const auto seconds = static_cast<rlim_t>(limits.seconds);
    const auto memory = static_cast<rlim_t>(limits.memory);
    return stacked && prctl(PR_SET_PDEATHSIG, SIGKILL) == 0 && limit(RLIMIT_CPU, seconds, seconds + 1) &&
           (!memoryIsOurs || limit(RLIMIT_AS, memory, memory)) && limit(RLIMIT_FSIZE, memory, memory) &&
           limit(RLIMIT_CORE, 0, 0);
}

bool confineMyself() {
    const std::unique_ptr<void, FilterReleaser> owner(seccomp_init(SCMP_ACT_KILL_PROCESS));
    if (!owner)
        return false;
    scmp_filter_ctx filter = owner.get();
    bool ok = seccomp_attr_set(filter, SCMP_FLTATR_CTL_TSYNC, 1) == 0;
    for (const int call : always)
        ok = ok && seccomp_rule_add(filter, SCMP_ACT_ALLOW, call, 0) == 0;
    // Memory that can be run is not given, nor is a process; clone3, whose flags can't be looked at, is as on an older
    // system.
    const auto notRunnable = SCMP_A2(SCMP_CMP_MASKED_EQ, PROT_EXEC, 0);
    const auto ofThread = SCMP_A0(SCMP_CMP_MASKED_EQ, CLONE_THREAD, CLONE_THREAD);
    const auto ofName = SCMP_A0(SCMP_CMP_EQ, PR_SET_NAME);
    const auto toAsk = SCMP_A2(SCMP_CMP_EQ, 0);
    ok = ok && seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(mmap), 1, notRunnable) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(mprotect), 1, notRunnable) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(clone), 1, ofThread) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(prctl), 1, ofName) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(prlimit64), 1, toAsk) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ERRNO(ENOSYS), SCMP_SYS(clone3), 0) == 0;
    return ok && seccomp_load(filter) == 0;
}

} // namespace lumora
