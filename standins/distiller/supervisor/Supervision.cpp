#include "standins/distiller/supervisor/Supervision.h"

#include "standins/distiller/supervisor/GhostscriptCommand.h"
#include "standins/distiller/supervisor/GhostscriptLog.h"
#include "standins/distiller/supervisor/PdfCheck.h"
#include "standins/shared/WorkFolder.h"
#include "standins/supervisor/EngineFailure.h"
#include "standins/supervisor/EngineWatch.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include <cerrno>
#include <string>

namespace standins {

namespace {

const std::string EngineName = "Ghostscript";

std::string LogPath(const WorkFolder& folder) {
    return folder.Path() + "/engine.log";
}

std::uint64_t SizeOf(int file) {
    struct stat status {};
    return fstat(file, &status) == 0 ? static_cast<std::uint64_t>(status.st_size) : 0;
}

std::string TemporaryFolder(const DistillerJob& job) {
    return job.folder.substr(0, job.folder.rfind('/'));
}

/// How Ghostscript came to its end.
struct Ending {
    Failure cause;  ///< why it was ended; none when it ended by itself
    int status = 0; ///< as waitpid gives it
};

Ending RunGhostscript(const EngineCommand& command, const DistillerJob& job,
                      const WorkFolder& folder, const Channel& bridge) {
    EngineProcess engine(command);
    if (!engine.IsStarted())
        return {MachineFailure(EngineName + " cannot be started", errno)};
    EngineWatch watch(EngineName, job.limits, job.mostMemory, bridge);
    Ending ending;
    ending.cause = watch.Await(engine, [&] { return folder.Size() + SizeOf(job.pdf); });
    ending.status = engine.End();
    return ending;
}

bool IsProfileRead(const DistillerJob& job, const GhostscriptLog& log) {
    return job.profile < 0 || log.HasReadProfile();
}

/// Why there is no PDF, or not a whole one, although Ghostscript has ended by itself.
Failure DescribeFailure(const DistillerJob& job, const GhostscriptLog& log, int status,
                        const MemoryShortage& shortage) {
    const bool isProfileRead = IsProfileRead(job, log);
    const std::string error = log.PostScriptError();
    if (WIFEXITED(status) && !error.empty())
        return isProfileRead ? Failure{EngineName + " found an error in it: " + error}
                             : Failure{EngineName + " found an error in the profile: " + error,
                                       Fault::Machine};
    if (Failure failure = DescribeEngineEnd(EngineName, status, shortage))
        return failure;
    return isProfileRead ? Failure{EngineName + " made no whole PDF of it"}
                         : Failure{"the profile ends " + EngineName + "'s work", Fault::Machine};
}

/// Lets Ghostscript write the PDF.
Failure MakePdf(const DistillerJob& job, const WorkFolder& folder, const Channel& bridge) {
    const Descriptor input(open("/dev/null", O_RDONLY | O_CLOEXEC));
    const Descriptor output(open(LogPath(folder).c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC,
                                 S_IRUSR | S_IWUSR));
    const EngineCommand command = GhostscriptCommand(folder, job, input.Get(), output.Get());
    const MemoryShortage shortage;
    const Ending ending = RunGhostscript(command, job, folder, bridge);
    if (ending.cause)
        return ending.cause;
    const GhostscriptLog log(LogPath(folder));
    if (ending.status == 0 && IsProfileRead(job, log) && !log.TellsOfUnfinishedPdf() &&
        IsWholePdf(job.pdf))
        return {};
    if (log.TellsOfFullDisk() && !IsFull(job.pdf))
        return NoRoomFailure(TemporaryFolder(job));
    return WithTightLimits(DescribeFailure(job, log, ending.status, shortage), command);
}

/// The work folder is gone afterwards.
Failure Distill(const DistillerJob& job, const Channel& bridge) {
    const WorkFolder folder(job.folder);
    if (!folder.IsMade())
        return MachineFailure("no folder can be made in " + TemporaryFolder(job), errno);
    Failure failure = MakePdf(job, folder, bridge);
    if (!IsDocumentsFault(failure))
        return failure;
    if (IsFull(job.pdf))
        return NoRoomFailure("the folder of the PDF file");
    return IsFull(folder.Path()) ? NoRoomFailure(TemporaryFolder(job)) : failure;
}

} // namespace

void Supervise(const DistillerJob& job, const Channel& bridge) {
    if (const Failure failure = Distill(job, bridge))
        bridge.Send(failure);
    else
        bridge.Send(MessageKind::Done);
}

} // namespace standins
