#include "standins/supervisor/EngineProcess.h"

#include "standins/shared/ChildProcess.h"
#include "standins/shared/DefaultSignals.h"
#include "standins/shared/ProcessTable.h"

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <cstdlib>

namespace standins {

namespace {

/// @return false when the system has no more descriptors
bool TakeDescriptors(const std::vector<int>& descriptors) {
    const int count = static_cast<int>(descriptors.size());
    std::vector<int> copies; // out of the way of the numbers that are to be taken
    copies.reserve(descriptors.size());
    for (const int descriptor : descriptors)
        copies.push_back(fcntl(descriptor, F_DUPFD_CLOEXEC, count));
    for (int number = 0; number < count; ++number) {
        if (dup2(copies[static_cast<std::size_t>(number)], number) < 0)
            return false;
    }
    return close_range(static_cast<unsigned>(count), ~0U, CLOSE_RANGE_CLOEXEC) == 0;
}

/// The child between fork and exec.
[[noreturn]] void BecomeEngine(const EngineCommand& command, pid_t supervisor) {
    setpgid(0, 0);
    prctl(PR_SET_PDEATHSIG, SIGKILL);
    if (getppid() != supervisor) // it went before it could take us along
        _exit(EngineCannotStart);
    RestoreDefaultSignals();
    std::vector<std::string> words = command.words;
    std::vector<std::string> environment = command.environment;
    const std::vector<char*> wordPointers = ExecWords(words);
    const std::vector<char*> environmentPointers = ExecWords(environment);
    if (TakeDescriptors(command.descriptors) && chdir(command.folder.c_str()) == 0) {
        if (!Confine(command.reach))
            _exit(EngineNotConfined);
        LimitResources(command.resources, command.times);
        execve(wordPointers[0], wordPointers.data(), environmentPointers.data());
    }
    _exit(EngineCannotStart);
}

/// What it may use of the processors before the system ends it.
rlim_t CpuLimit(TimeLimits times) {
    rlimit inherited{};
    getrlimit(RLIMIT_CPU, &inherited);
    return std::min<rlim_t>(inherited.rlim_max, MostCpuSeconds(times));
}

bool UsedUp(const rusage& usage, rlim_t seconds) {
    const timeval& user = usage.ru_utime;
    const timeval& system = usage.ru_stime;
    return static_cast<rlim_t>(user.tv_sec + system.tv_sec +
                               (user.tv_usec + system.tv_usec) / 1'000'000) >= seconds;
}

} // namespace

std::vector<std::string> EngineEnvironment(const std::string& folder) {
    std::vector<std::string> environment = {
        "HOME=" + folder,
        "TMPDIR=" + folder,
        "PATH=/nonexistent", // there is no program that an engine may run
        "LC_ALL=C.UTF-8",
    };
    if (const char* zone = std::getenv("TZ")) // dates in documents are those of the user
        environment.push_back(std::string("TZ=") + zone);
    return environment;
}

EngineProcess::EngineProcess(TimeLimits times) : m_mostCpuSeconds(CpuLimit(times)) {}

EngineProcess::EngineProcess(const EngineCommand& command) : EngineProcess(command.times) {
    const pid_t supervisor = getpid();
    m_id = fork();
    if (m_id == 0)
        BecomeEngine(command, supervisor);
    if (m_id < 0)
        return;
    setpgid(m_id, m_id); // here too, so that the group exists whoever comes first
    m_exit = WatchProcess(m_id);
}

EngineProcess EngineProcess::Adopt(pid_t child, TimeLimits times) {
    EngineProcess engine(times);
    siginfo_t unused{};
    if (child <= 0 ||
        waitid(P_PID, static_cast<id_t>(child), &unused, WEXITED | WNOHANG | WNOWAIT) != 0)
        return engine; // it is not ours to end
    setpgid(child, child);
    engine.m_id = child;
    engine.m_exit = WatchProcess(child);
    return engine;
}

int EngineProcess::End(pid_t spared) {
    int status = 0;
    if (m_id > 0) {
        kill(-m_id, SIGKILL); // nobody has waited for it yet, so the number is still its own
        rusage usage{};
        wait4(m_id, &status, 0, &usage);
        if (WIFSIGNALED(status) && WTERMSIG(status) == SIGKILL && UsedUp(usage, m_mostCpuSeconds))
            status = SIGXCPU;
    }
    EndChildren(spared);
    return status;
}

} // namespace standins
