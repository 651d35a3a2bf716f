#include "standins/engine/TightLimits.h"

#include <sys/resource.h>

#include <future>
#include <system_error>
#include <thread>
#include <vector>

namespace standins {

namespace {

constexpr rlim_t ManyFiles = 256;
constexpr int ManyThreads = 64;

/// @return the limit, where it is below what is wanted; otherwise empty
std::string Below(__rlimit_resource resource, rlim_t wanted) {
    rlimit limit{};
    if (getrlimit(resource, &limit) != 0 || limit.rlim_cur >= wanted)
        return {};
    return std::to_string(limit.rlim_cur);
}

/// By trying: a limit may be the user's, or that of a group of processes.
bool CanStartThreads(int count) {
    std::promise<void> end;
    const std::shared_future<void> ended(end.get_future());
    std::vector<std::thread> threads;
    bool canStart = true;
    try {
        while (static_cast<int>(threads.size()) < count)
            threads.emplace_back([ended] { ended.wait(); });
    } catch (const std::system_error&) {
        canStart = false;
    }
    end.set_value();
    for (std::thread& thread : threads)
        thread.join();
    return canStart;
}

} // namespace

std::string DescribeTightLimit(const ResourceLimits& wanted, TimeLimits times) {
    if (const std::string files = Below(RLIMIT_NOFILE, ManyFiles); !files.empty())
        return "only " + files + " files may be open (ulimit -n)";
    if (const std::string bytes = Below(RLIMIT_FSIZE, wanted.largestFile); !bytes.empty())
        return "a file may have only " + bytes + " bytes (ulimit -f)";
    if (const std::string bytes = Below(RLIMIT_AS, wanted.memory); !bytes.empty())
        return "a process may have only " + bytes + " bytes of memory (ulimit -v)";
    if (const std::string seconds = Below(RLIMIT_CPU, MostCpuSeconds(times)); !seconds.empty())
        return "a process may use only " + seconds + " seconds of processor time (ulimit -t)";
    if (!CanStartThreads(ManyThreads))
        return "hardly any more processes and threads can be started (ulimit -u)";
    return {};
}

} // namespace standins
