#include "standins/shared/ProcessEnd.h"

#include "standins/shared/FileBytes.h"

#include <sys/wait.h>

#include <csignal>
#include <cstring>
#include <sstream>

namespace standins {

namespace {

/// The number that stands behind a word in one of the system's tables; 0 when there is none.
std::uint64_t NumberBehind(const std::string& word, const std::string& table) {
    constexpr std::size_t Longest = std::size_t{64} << 10;
    std::istringstream entries(ReadText(table, Longest));
    std::string name;
    std::uint64_t number = 0;
    while (entries >> name >> number) {
        if (name == word)
            return number;
    }
    return 0;
}

/// How often the system has ended a process for want of memory: one of this process's control
/// group, or else, where that does not tell, any.
std::uint64_t MemoryKills() {
    constexpr const char* Kills = "oom_kill";
    const std::string groups = ReadText("/proc/self/cgroup", 4096);
    const std::size_t own = groups.rfind("0::");
    if (own != std::string::npos) {
        const std::string group = groups.substr(own + 3, groups.find('\n', own) - own - 3);
        const std::string events = "/sys/fs/cgroup" + group + "/memory.events";
        if (!ReadText(events, 1).empty())
            return NumberBehind(Kills, events);
    }
    return NumberBehind(Kills, "/proc/vmstat");
}

Failure DescribeSignal(const std::string& program, int number, const MemoryShortage& shortage) {
    const std::string name = strsignal(number); // NOLINT(concurrency-mt-unsafe): a word of its own
    switch (number) {
    case SIGKILL:
        if (shortage.HasStruck())
            return {"the machine has run out of memory, and ended " + program, Fault::Machine};
        [[fallthrough]];
    case SIGHUP:
    case SIGINT:
    case SIGTERM:
        return {program + " was ended from outside (signal " + std::to_string(number) + ", " +
                    name + ")",
                Fault::Outside};
    case SIGXCPU:
        return {program + " used more processor time than it may"};
    case SIGXFSZ:
        return {program + " wrote a larger file than it may"};
    default:
        return {program + " ended with signal " + std::to_string(number) + " (" + name + ")"};
    }
}

} // namespace

MemoryShortage::MemoryShortage() : m_before(MemoryKills()) {}

bool MemoryShortage::HasStruck() const {
    return MemoryKills() > m_before;
}

Failure MemoryFailure(const std::string& program, std::uint64_t most) {
    return {program + " took more than " + std::to_string(most >> 20) + " MB of memory"};
}

Failure DescribeEnd(const std::string& program, int status, const MemoryShortage& shortage) {
    if (WIFSIGNALED(status))
        return DescribeSignal(program, WTERMSIG(status), shortage);
    if (WEXITSTATUS(status) != 0)
        return {program + " ended with exit code " + std::to_string(WEXITSTATUS(status))};
    return {};
}

} // namespace standins
