// Runs a program as on a system that lacks a call: without CALL PROGRAM [ARGUMENT…]

#include <seccomp.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>

int main(int argc, char** argv) {
    scmp_filter_ctx filter = seccomp_init(SCMP_ACT_ALLOW);
    if (argc < 3 ||
        seccomp_rule_add(filter, SCMP_ACT_ERRNO(ENOSYS), seccomp_syscall_resolve_name(argv[1]),
                         0) != 0 ||
        seccomp_load(filter) != 0)
        return 125;
    execv(argv[2], argv + 2);
    std::perror(argv[2]);
    return 127;
}
