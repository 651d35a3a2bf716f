#include "standins/distiller/engine/Supervision.h"

#include "standins/distiller/engine/GhostscriptCommand.h"
#include "standins/distiller/engine/GhostscriptLog.h"
#include "standins/distiller/engine/PdfCheck.h"
#include "standins/engine/EngineFailure.h"
#include "standins/engine/EngineWatch.h"
#include "standins/process/WorkFolder.h"

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

/// How Ghostscript came to its end.
struct Ending {
    std::string cause; ///< why it was ended; empty when it ended by itself
    int status = 0;    ///< as waitpid gives it
};

Ending RunGhostscript(const DistillerJob& job, const WorkFolder& folder, const Channel& bridge) {
    const Descriptor input(open("/dev/null", O_RDONLY | O_CLOEXEC));
    const Descriptor log(open(LogPath(folder).c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC,
                              S_IRUSR | S_IWUSR));
    EngineProcess engine(GhostscriptCommand(folder, job, input.Get(), log.Get()));
    if (!engine.IsStarted())
        return {DescribeError(EngineName + " cannot be started", errno)};
    EngineWatch watch(EngineName, job.limits, bridge);
    Ending ending;
    ending.cause = watch.Await(engine, [&] { return folder.Size() + SizeOf(job.pdf); });
    ending.status = engine.End();
    return ending;
}

bool IsProfileRead(const DistillerJob& job, const GhostscriptLog& log) {
    return job.profile < 0 || log.HasReadProfile();
}

/// Why there is no PDF, or not a whole one.
std::string DescribeFailure(const DistillerJob& job, const WorkFolder& folder,
                            const GhostscriptLog& log, const Ending& ending) {
    if (!ending.cause.empty())
        return ending.cause;
    if (IsFull(job.pdf))
        return DescribeFull("the folder of the PDF file");
    if (log.TellsOfFullDisk() || IsFull(folder.Path()))
        return DescribeFull(job.folder.substr(0, job.folder.rfind('/')));
    const std::string error = log.PostScriptError();
    if (WIFEXITED(ending.status) && !error.empty())
        return EngineName + " found an error in " +
               (IsProfileRead(job, log) ? "it: " : "the profile: ") + error;
    std::string failure = DescribeStatus(EngineName, ending.status);
    if (!failure.empty())
        return failure;
    return IsProfileRead(job, log) ? EngineName + " made no whole PDF of it"
                                   : "the profile ends " + EngineName + "'s work";
}

/// @return why it failed; empty when the PDF is written
std::string Distill(const DistillerJob& job, const Channel& bridge) {
    const WorkFolder folder(job.folder);
    if (!folder.IsMade())
        return DescribeError("the folder " + job.folder + " cannot be made", errno);
    const Ending ending = RunGhostscript(job, folder, bridge);
    const GhostscriptLog log(LogPath(folder));
    const bool hasEndedWell = ending.cause.empty() && ending.status == 0;
    if (hasEndedWell && IsProfileRead(job, log) && !log.TellsOfUnfinishedPdf() &&
        IsWholePdf(job.pdf))
        return {};
    return DescribeFailure(job, folder, log, ending);
}

} // namespace

void Supervise(const DistillerJob& job, const Channel& bridge) {
    const std::string failure = Distill(job, bridge);
    bridge.Send(failure.empty() ? MessageKind::Done : MessageKind::Failed, failure);
}

} // namespace standins
