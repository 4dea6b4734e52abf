#include "door/Confinement.h"

#include <QByteArrayList>

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
#include <unistd.h>

namespace lumora {

namespace {

bool limit(__rlimit_resource resource, rlim_t soft, rlim_t hard) {
    const rlimit value{soft, hard};
    return setrlimit(resource, &value) == 0;
}

struct FilterReleaser {
    void operator()(void* filter) const { seccomp_release(filter); }
};

constexpr const char* allowedCalls =
    "read pread64 write lseek close munmap mremap madvise brk futex set_robust_list rseq gettid "
    "getpid sched_yield sched_getaffinity sysinfo rt_sigprocmask rt_sigaction rt_sigreturn "
    "sigaltstack clock_gettime gettimeofday getrandom eventfd2 poll exit exit_group";

} // namespace

bool setLimits(const DoorLimits& limits, int parent) {
    // Addresses count: each thread of a decoder would take 8 MiB of them for its stack and 64 MiB for memory of its
    // own.
    pthread_attr_t attributes;
    if (pthread_attr_init(&attributes) != 0)
        return false;
    const bool stacked = pthread_attr_setstacksize(&attributes, std::size_t(1) << 20) == 0 &&
                         pthread_setattr_default_np(&attributes) == 0;
    mallopt(M_ARENA_MAX, 1);
    pthread_attr_destroy(&attributes);
    const auto seconds = static_cast<rlim_t>(limits.seconds);
    const auto memory = static_cast<rlim_t>(limits.memory);
    // The parent may have ended before its end was asked for.
    return stacked && prctl(PR_SET_PDEATHSIG, SIGKILL) == 0 && getppid() == parent &&
           limit(RLIMIT_CPU, seconds, seconds + 1) && (!memoryIsLimited || limit(RLIMIT_AS, memory, memory)) &&
           limit(RLIMIT_FSIZE, memory, memory) && limit(RLIMIT_CORE, 0, 0);
}

bool enterSandbox() {
    const std::unique_ptr<void, FilterReleaser> owner(seccomp_init(SCMP_ACT_KILL_PROCESS));
    if (!owner)
        return false;
    scmp_filter_ctx filter = owner.get();
    bool ok = seccomp_attr_set(filter, SCMP_FLTATR_CTL_TSYNC, 1) == 0;
    for (const QByteArray& call : QByteArray(allowedCalls).split(' '))
        ok = ok && seccomp_rule_add(filter, SCMP_ACT_ALLOW, seccomp_syscall_resolve_name(call.constData()), 0) == 0;
    if (!memoryIsLimited)
        ok = ok && seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(pipe2), 0) == 0;
    // Memory that can be run is not given, nor is a process; clone3, whose flags can't be looked at, is as on an older
    // system.
    const scmp_arg_cmp notRunnable{2, SCMP_CMP_MASKED_EQ, PROT_EXEC, 0};
    const scmp_arg_cmp ofThread{0, SCMP_CMP_MASKED_EQ, CLONE_THREAD, CLONE_THREAD};
    const scmp_arg_cmp ofName{0, SCMP_CMP_EQ, PR_SET_NAME, 0};
    const scmp_arg_cmp toAsk{2, SCMP_CMP_EQ, 0, 0};
    const scmp_arg_cmp ofItself{0, SCMP_CMP_EQ, static_cast<scmp_datum_t>(getpid()), 0};
    const scmp_arg_cmp toAbort{2, SCMP_CMP_EQ, SIGABRT, 0};
    ok = ok && seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(mmap), 1, notRunnable) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(mprotect), 1, notRunnable) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(clone), 1, ofThread) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(prctl), 1, ofName) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(prlimit64), 1, toAsk) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ALLOW, SCMP_SYS(tgkill), 2, ofItself, toAbort) == 0 &&
         seccomp_rule_add(filter, SCMP_ACT_ERRNO(ENOSYS), SCMP_SYS(clone3), 0) == 0;
    return ok && seccomp_load(filter) == 0;
}

} // namespace lumora
