#include "standins/supervisor/EngineFailure.h"

#include <sys/resource.h>
#include <sys/wait.h>

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

/// What the machine, or whoever started the program, allows less of than an engine may use. To be
/// asked when one has failed: most documents need far less, and come out all the same.
/// @return "only 20 files may be open (ulimit -n)"; empty when there is enough of everything
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

} // namespace

Failure StallFailure(const std::string& engine, const TimeLimits& limits) {
    return {engine + " stopped responding for " + std::to_string(limits.stall.count()) +
            " seconds"};
}

Failure OverdueFailure(const std::string& engine, const TimeLimits& limits) {
    return {engine + " took longer than " + std::to_string(limits.total.count()) + " seconds"};
}

Failure DescribeEngineEnd(const std::string& engine, int status, const MemoryShortage& shortage) {
    if (WIFEXITED(status) && WEXITSTATUS(status) == EngineCannotStart)
        return {engine + " cannot be started", Fault::Machine};
    if (WIFEXITED(status) && WEXITSTATUS(status) == EngineNotConfined)
        return {engine + " cannot be kept from the rest of the machine", Fault::Machine};
    return DescribeEnd(engine, status, shortage);
}

Failure WithTightLimits(const Failure& failure, const EngineCommand& command) {
    if (!IsDocumentsFault(failure))
        return failure;
    const std::string limit = DescribeTightLimit(command.resources, command.times);
    return limit.empty() ? failure : Failure{failure.reason + "; " + limit, Fault::Machine};
}

} // namespace standins
