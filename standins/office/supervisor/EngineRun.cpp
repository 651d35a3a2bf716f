#include "standins/office/supervisor/EngineRun.h"

#include "standins/office/shared/UserInstallation.h"
#include "standins/supervisor/EngineFailure.h"

#include <sys/wait.h>

#include <cerrno>
#include <csignal>
#include <string>

namespace standins {

namespace {

constexpr int WantsRestart = 81; // LibreOffice's exit code after it has set up its profile
constexpr int LogDescriptor = 2; // of a command

using BytesWritten = std::function<std::uint64_t()>;

/// Starts LibreOffice and waits until it has ended, once more if it asks for it.
/// @param spared a child of this process that is left alone, or 0
Failure RunStarted(const EngineCommand& command, pid_t spared, EngineWatch& watch,
                   const BytesWritten& bytesWritten) {
    const MemoryShortage shortage;
    int status = 0;
    for (int start = 0; start < 2; ++start) {
        EngineProcess engine(command);
        if (!engine.IsStarted())
            return MachineFailure(watch.Engine() + " cannot be started", errno);
        Failure ended = watch.Await(engine, bytesWritten);
        status = engine.End(spared);
        // While the folder tells of it, whatever happens to this process; and before the next
        // start, which would take itself for a second one.
        RemoveSocket(command.folder);
        if (ended)
            return ended;
        if (!WIFEXITED(status) || WEXITSTATUS(status) != WantsRestart)
            break;
    }
    return WithTightLimits(DescribeEngineEnd(watch.Engine(), status, shortage), command);
}

/// Whether a process has ended by a fault of its own.
bool HasCrashed(int status) {
    if (!WIFSIGNALED(status))
        return WEXITSTATUS(status) != 0;
    const int number = WTERMSIG(status);
    return number == SIGSEGV || number == SIGABRT || number == SIGBUS || number == SIGILL ||
           number == SIGFPE;
}

/// Has the LibreOffice that is kept started do the work.
/// @param failure receives what came of it
/// @return false, with the reason in `failure`, when it is to be tried without
bool RunForked(const EngineWork& work, OfficeHost& host, EngineWatch& watch,
               const BytesWritten& bytesWritten, const Channel& server, Failure& failure) {
    const MemoryShortage shortage;
    std::optional<EngineProcess> engine =
        host.Fork(work.order, work.command.descriptors.at(LogDescriptor), server);
    if (!engine) {
        failure.reason = host.Reason();
        return false;
    }
    failure = watch.Await(*engine, bytesWritten);
    const int status = engine->End(host.Process());
    if (failure)
        return true;
    failure = WithTightLimits(DescribeEngineEnd(watch.Engine(), status, shortage), work.command);
    return !HasCrashed(status); // which may be due to where it comes from
}

} // namespace

Failure RunLibreOffice(const EngineWork& work, OfficeHost* host, EngineWatch& watch,
                       const BytesWritten& bytesWritten, const Channel& server) {
    if (host) {
        Failure failure;
        if (RunForked(work, *host, watch, bytesWritten, server, failure))
            return failure;
        server.Send(MessageKind::Note,
                    watch.Engine() + " is started for a document of its own: " + failure.reason);
    }
    return RunStarted(work.command, host ? host->Process() : 0, watch, bytesWritten);
}

} // namespace standins
