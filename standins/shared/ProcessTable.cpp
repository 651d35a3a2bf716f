#include "standins/shared/ProcessTable.h"

#include "standins/shared/FileBytes.h"

#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cctype>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <filesystem>
#include <sstream>
#include <thread>
#include <vector>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace standins {

namespace {

/// A file of the process's folder in /proc; empty when the process has gone.
std::string ReadProcFile(pid_t process, const char* name) {
    constexpr std::size_t Longest = 1 << 20;
    return ReadText("/proc/" + std::to_string(process) + "/" + name, Longest);
}

std::vector<pid_t> AllProcesses() {
    std::vector<pid_t> processes;
    std::error_code error;
    for (fs::directory_iterator entry("/proc", error), end; !error && entry != end;
         entry.increment(error)) {
        const std::string name = entry->path().filename();
        if (std::isdigit(static_cast<unsigned char>(name[0])))
            processes.push_back(std::stoi(name));
    }
    return processes;
}

struct ProcessStatus {
    pid_t parent = 0;
    pid_t group = 0;
    std::uint64_t ticks = 0;
};

ProcessStatus ReadStatus(pid_t process) {
    const std::string stat = ReadProcFile(process, "stat");
    const std::size_t afterName = stat.rfind(')'); // the name may hold anything
    if (afterName == std::string::npos)
        return {};
    std::istringstream fields(stat.substr(afterName + 1));
    ProcessStatus status;
    std::string skipped;
    fields >> skipped >> status.parent >> status.group;
    for (int i = 0; i < 8; ++i) // session … cmajflt
        fields >> skipped;
    for (int i = 0; i < 4; ++i) { // utime, stime, cutime, cstime
        std::uint64_t ticks = 0;
        fields >> ticks;
        status.ticks += ticks;
    }
    return status;
}

/// In memory and swapped out.
std::uint64_t MemoryOf(pid_t process) {
    std::istringstream entries(ReadProcFile(process, "smaps_rollup"));
    std::uint64_t kilobytes = 0;
    for (std::string word; entries >> word;) {
        std::uint64_t number = 0;
        if ((word == "Pss:" || word == "SwapPss:") && entries >> number)
            kilobytes += number;
    }
    return kilobytes << 10;
}

std::vector<pid_t> ChildrenBut(pid_t spared) {
    const pid_t self = getpid();
    std::vector<pid_t> children;
    for (const pid_t process : AllProcesses()) {
        if (process != spared && ReadStatus(process).parent == self)
            children.push_back(process);
    }
    return children;
}

std::vector<pid_t> ProcessesAtHome(const std::string& home) {
    const std::string wanted = '\0' + ("HOME=" + home) + '\0';
    std::vector<pid_t> found;
    for (const pid_t process : AllProcesses()) {
        const std::string environment = '\0' + ReadProcFile(process, "environ");
        if (environment.find(wanted) != std::string::npos)
            found.push_back(process);
    }
    return found;
}

} // namespace

Descriptor WatchProcess(pid_t process) {
    // By its number: this C library's header for it does not suit C++.
    return Descriptor(static_cast<int>(syscall(SYS_pidfd_open, process, 0)));
}

GroupUsage UsageOfGroup(pid_t group) {
    GroupUsage sum;
    for (const pid_t process : AllProcesses()) {
        const ProcessStatus status = ReadStatus(process);
        if (status.group != group)
            continue;
        sum.cpuTicks += status.ticks;
        sum.memory += MemoryOf(process);
    }
    return sum;
}

std::uint64_t ResidentBytes(pid_t process) {
    std::istringstream fields(ReadProcFile(process, "statm"));
    std::uint64_t skipped = 0;
    std::uint64_t pages = 0;
    fields >> skipped >> pages;
    return pages * static_cast<std::uint64_t>(sysconf(_SC_PAGESIZE));
}

void EndChildren(pid_t spared) {
    for (;;) {
        const std::vector<pid_t> children = ChildrenBut(spared);
        for (const pid_t child : children) { // what they leave is ours in the next round
            kill(child, SIGKILL);
            waitpid(child, nullptr, 0);
        }
        if (children.empty())
            return;
    }
}

void EndProcessesAtHome(const std::string& home) {
    const auto giveUp = std::chrono::steady_clock::now() + 1s;
    for (;;) {
        const std::vector<pid_t> processes = ProcessesAtHome(home);
        for (const pid_t process : processes)
            kill(process, SIGKILL);
        if (processes.empty() || std::chrono::steady_clock::now() >= giveUp)
            return;
        std::this_thread::sleep_for(5ms);
    }
}

} // namespace standins
