#include "standins/confinement/CallFilter.h"

#include <fcntl.h>
#include <sched.h>
#include <seccomp.h>
#include <sys/ioctl.h>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <initializer_list>
#include <memory>

namespace standins {

namespace {

/// Calls that are to be as in a kernel without them; the C library then takes others. What
/// io_uring does no filter sees, nor the flags of clone3 and openat2; memory in files without a
/// name counts for nobody.
const std::initializer_list<int> Absent = {
    SCMP_SYS(io_uring_setup), SCMP_SYS(io_uring_enter), SCMP_SYS(io_uring_register),
    SCMP_SYS(clone3),         SCMP_SYS(openat2),        SCMP_SYS(memfd_create),
    SCMP_SYS(memfd_secret),
};

const std::initializer_list<int> Forbidden = {
    // Other surroundings.
    SCMP_SYS(unshare),
    SCMP_SYS(setns),
    // Other processes.
    SCMP_SYS(ptrace),
    SCMP_SYS(process_vm_readv),
    SCMP_SYS(process_vm_writev),
    SCMP_SYS(process_madvise),
    SCMP_SYS(process_mrelease),
    SCMP_SYS(kcmp),
    SCMP_SYS(pidfd_open),
    SCMP_SYS(pidfd_getfd),
    SCMP_SYS(pidfd_send_signal),
    SCMP_SYS(tkill),
    SCMP_SYS(setpriority),
    SCMP_SYS(ioprio_set),
    SCMP_SYS(migrate_pages),
    SCMP_SYS(move_pages),
    // What processes of a user share.
    SCMP_SYS(keyctl),
    SCMP_SYS(add_key),
    SCMP_SYS(request_key),
    SCMP_SYS(shmget),
    SCMP_SYS(shmat),
    SCMP_SYS(msgget),
    SCMP_SYS(semget),
    SCMP_SYS(mq_open),
    SCMP_SYS(mq_unlink),
    // Files by paths that Landlock does not look at, or not in all its versions.
    SCMP_SYS(chown),
    SCMP_SYS(fchown),
    SCMP_SYS(lchown),
    SCMP_SYS(fchownat),
    SCMP_SYS(setxattr),
    SCMP_SYS(lsetxattr),
    SCMP_SYS(fsetxattr),
    SCMP_SYS(removexattr),
    SCMP_SYS(lremovexattr),
    SCMP_SYS(fremovexattr),
    SCMP_SYS(truncate),
    SCMP_SYS(inotify_add_watch),
    SCMP_SYS(open_by_handle_at),
    SCMP_SYS(chroot),
    // Doors to the kernel that no document needs.
    SCMP_SYS(bpf),
    SCMP_SYS(perf_event_open),
    SCMP_SYS(userfaultfd),
};

/// New processes, and ways out of the engine's place among them: its watch knows its group.
const std::initializer_list<int> Forking = {
    SCMP_SYS(fork),
    SCMP_SYS(vfork),
    SCMP_SYS(setpgid),
    SCMP_SYS(setsid),
};

/// Calls that are answered as if they had been done: a program may count on them for files of its
/// own, where it makes no difference, and Landlock does not keep them from the files of others.
const std::initializer_list<int> Pretended = {
    SCMP_SYS(chmod),  SCMP_SYS(fchmod),    SCMP_SYS(fchmodat),  SCMP_SYS(utime),
    SCMP_SYS(utimes), SCMP_SYS(futimesat), SCMP_SYS(utimensat),
};

// Calls that came after those known here, and have the same numbers everywhere.
constexpr int FirstUnknown = 452;
constexpr int LastUnknown = 511;

class Filter {
public:
    Filter() : m_context(seccomp_init(SCMP_ACT_ALLOW), seccomp_release), m_isGood(m_context) {}

    void Deny(const std::initializer_list<int>& calls, int error) {
        for (const int call : calls)
            Note(seccomp_rule_add(m_context.get(), SCMP_ACT_ERRNO(error), call, 0));
    }
    /// Denies a call whose argument is so.
    void DenyIf(int call, const scmp_arg_cmp& argument, int error = EPERM) {
        Note(seccomp_rule_add_array(m_context.get(), SCMP_ACT_ERRNO(error), call, 1, &argument));
    }
    bool Load() {
        if (m_isGood)
            Note(seccomp_load(m_context.get()));
        return m_isGood;
    }

private:
    void Note(int result) { m_isGood = m_isGood && result == 0; }

    std::unique_ptr<void, decltype(&seccomp_release)> m_context;
    bool m_isGood;
};

/// An argument that is an int: the kernel does not look at its upper half.
scmp_arg_cmp Is(unsigned argument, unsigned value) {
    return SCMP_CMP64(argument, SCMP_CMP_MASKED_EQ, 0xFFFFFFFFU, value);
}

scmp_arg_cmp IsNot(unsigned argument, unsigned value) {
    return SCMP_CMP64(argument, SCMP_CMP_NE, value);
}

scmp_arg_cmp HasBits(unsigned argument, unsigned mask, unsigned bits) {
    return SCMP_CMP64(argument, SCMP_CMP_MASKED_EQ, mask, bits);
}

/// A socket without a connection sends to any other.
void DenyNetwork(Filter& filter) {
    constexpr unsigned Type = 0xF;
    filter.DenyIf(SCMP_SYS(socket), IsNot(0, AF_UNIX), EACCES);
    for (const int call : {SCMP_SYS(socket), SCMP_SYS(socketpair)}) {
        filter.DenyIf(call, HasBits(1, Type, SOCK_DGRAM), EACCES);
        filter.DenyIf(call, HasBits(1, Type, SOCK_RAW), EACCES); // is the same among local ones
    }
    filter.Deny({SCMP_SYS(connect)}, ECONNREFUSED);
}

/// A child has another number than this process, and sends itself signals, too, when it aborts.
void DenyForking(Filter& filter) {
    const auto self = static_cast<unsigned>(getpid());
    filter.Deny(Forking, EPERM);
    filter.DenyIf(SCMP_SYS(clone), HasBits(0, CLONE_THREAD, 0));
    for (const int call :
         {SCMP_SYS(kill), SCMP_SYS(tgkill), SCMP_SYS(rt_sigqueueinfo), SCMP_SYS(rt_tgsigqueueinfo)})
        filter.DenyIf(call, IsNot(0, self));
    filter.DenyIf(SCMP_SYS(prctl), Is(0, PR_SET_PDEATHSIG)); // it dies with its supervisor
}

/// Also where it goes by an argument: a signal by an open file; limits; a place among the processes
/// to be run.
void DenyOtherProcesses(Filter& filter) {
    for (const int command : {F_SETOWN, F_SETOWN_EX})
        filter.DenyIf(SCMP_SYS(fcntl), Is(1, static_cast<unsigned>(command)));
    for (const unsigned request : {FIOSETOWN, SIOCSPGRP})
        filter.DenyIf(SCMP_SYS(ioctl), Is(1, request));
    for (const int call :
         {SCMP_SYS(prlimit64), SCMP_SYS(sched_setaffinity), SCMP_SYS(sched_setscheduler),
          SCMP_SYS(sched_setparam), SCMP_SYS(sched_setattr)})
        filter.DenyIf(call, IsNot(0, 0));
}

/// An old Landlock lets whoever may read a file empty it on opening it.
void DenyEmptying(Filter& filter) {
    filter.DenyIf(SCMP_SYS(open), HasBits(1, O_ACCMODE | O_TRUNC, O_RDONLY | O_TRUNC));
    filter.DenyIf(SCMP_SYS(openat), HasBits(2, O_ACCMODE | O_TRUNC, O_RDONLY | O_TRUNC));
}

} // namespace

bool DenyCalls(bool mayFork) {
    Filter filter;
    filter.Deny(Absent, ENOSYS);
    for (int call = FirstUnknown; call <= LastUnknown; ++call)
        filter.Deny({call}, ENOSYS);
    filter.Deny(Forbidden, EPERM);
    filter.Deny(Pretended, 0);
    DenyNetwork(filter);
    DenyOtherProcesses(filter);
    DenyEmptying(filter);
    if (!mayFork)
        DenyForking(filter);
    return filter.Load();
}

} // namespace standins
