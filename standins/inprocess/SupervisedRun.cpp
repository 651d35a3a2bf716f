#include "standins/inprocess/SupervisedRun.h"

#include "standins/inprocess/Fonts.h"
#include "standins/inprocess/SupervisorProcess.h"

#include <cerrno>

namespace standins {

std::vector<std::string> SupervisorArguments(const SupervisedRun& run) {
    std::vector<std::string> arguments = {
        "--folder=" + run.folder,
        "--stall=" + std::to_string(run.limits.stall.count()),
        "--total=" + std::to_string(run.limits.total.count()),
        "--memory=" + std::to_string(run.mostMemory),
    };
    for (const std::string& folder : FontFolders())
        arguments.push_back("--fonts=" + folder);
    arguments.insert(arguments.end(), run.arguments.begin(), run.arguments.end());
    return arguments;
}

Message FailedMessage(Failure failure) {
    return {MessageKind::Failed, std::move(failure.reason), Descriptor(), failure.fault};
}

std::string NameOfSupervisor(const SupervisedRun& run) {
    return run.engine + "'s supervisor";
}

Message RunSupervised(const SupervisedRun& run) {
    const MemoryShortage shortage;
    std::optional<SupervisorProcess> supervisor =
        SupervisorProcess::Start(run.supervisor, SupervisorArguments(run), run.descriptors);
    if (!supervisor)
        return FailedMessage(MachineFailure(NameOfSupervisor(run) + " cannot be started", errno));
    std::optional<Message> result = supervisor->AwaitResult(run);
    return result ? std::move(*result) : supervisor->EndLost(run, shortage);
}

} // namespace standins
