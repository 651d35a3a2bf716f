#include "standins/office/host/SiblingFork.h"

#include <sched.h>
#include <sys/prctl.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>

namespace fs = std::filesystem;

namespace standins {

pid_t ForkSibling() {
    // The C library keeps its thread's number, and has told the kernel where: there the child's
    // number goes, or abort() would send its signal to the parent's thread.
    int* number = nullptr;
    if (prctl(PR_GET_TID_ADDRESS, &number) != 0)
        return -1;
    constexpr unsigned long Flags =
        CLONE_PARENT | CLONE_CHILD_SETTID | CLONE_CHILD_CLEARTID | SIGCHLD;
    return static_cast<pid_t>(syscall(SYS_clone, Flags, nullptr, nullptr, number, 0));
}

int CountThreads() {
    std::error_code error;
    const fs::directory_iterator threads("/proc/self/task", error);
    return static_cast<int>(std::distance(begin(threads), end(threads)));
}

} // namespace standins
