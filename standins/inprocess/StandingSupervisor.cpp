#include "standins/inprocess/StandingSupervisor.h"

#include "standins/shared/Channel.h"
#include "standins/shared/WorkFolder.h"

namespace standins {

StandingSupervisor::~StandingSupervisor() {
    if (m_process)
        m_process->Close();
    Kill(); // and clear up, in case it has not come to it
}

std::optional<Message> StandingSupervisor::Run(const SupervisedRun& run,
                                               const std::vector<std::string>& keep,
                                               const std::string& kind) {
    const MemoryShortage shortage;
    if (!Start(run, keep, kind))
        return std::nullopt;
    if (!m_process->Give(JoinWords(SupervisorArguments(run)), run.descriptors.front())) {
        Kill(run);
        return std::nullopt;
    }
    std::optional<Message> result = m_process->AwaitResult(run);
    if (!result) {
        result = m_process->EndLost(run, shortage);
        Kill(run);
    }
    return result;
}

/// @return whether there is one
bool StandingSupervisor::Start(const SupervisedRun& run, const std::vector<std::string>& keep,
                               const std::string& kind) {
    SupervisedRun kept = run;
    kept.folder.clear();
    kept.arguments = keep;
    if (m_process && m_kept == SupervisorArguments(kept))
        return true;
    Kill();
    m_kept = SupervisorArguments(kept);
    kept.folder = m_home = WorkFolder::NewPath(kind);
    auto started = SupervisorProcess::Start(run.supervisor, SupervisorArguments(kept), {});
    if (started)
        m_process.emplace(std::move(*started));
    return started.has_value();
}

/// The engine at work on the run comes from what is kept: it ends with that.
void StandingSupervisor::Kill(const SupervisedRun& run) {
    Kill();
    WorkFolder::Discard(run.folder, run.clearOutside);
}

void StandingSupervisor::Kill() {
    if (!m_process)
        return;
    m_process->Kill();
    m_process.reset();
    WorkFolder::Discard(m_home, nullptr);
}

} // namespace standins
