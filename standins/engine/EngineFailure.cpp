#include "standins/engine/EngineFailure.h"

#include "standins/engine/TightLimits.h"

#include <sys/wait.h>

namespace standins {

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
