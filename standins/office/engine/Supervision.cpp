#include "standins/office/engine/Supervision.h"

#include "standins/engine/EngineFailure.h"
#include "standins/engine/EngineWatch.h"
#include "standins/office/UserInstallation.h"
#include "standins/office/engine/DocumentCopy.h"
#include "standins/office/engine/EngineOutput.h"
#include "standins/office/engine/LibreOfficeCommand.h"
#include "standins/office/engine/PackageKind.h"
#include "standins/office/engine/Profile.h"
#include "standins/office/engine/Publication.h"
#include "standins/process/WorkFolder.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include <cerrno>
#include <string>

namespace standins {

namespace {

const std::string EngineName = "LibreOffice";
constexpr int WantsRestart = 81; // LibreOffice's exit code after it has set up its profile

Message Failure(std::string reason) {
    return Message{MessageKind::Failed, std::move(reason), Descriptor()};
}

/// Runs LibreOffice until it has ended, once more if it asks for it.
/// @return why it failed; empty when it ended well
std::string RunEngine(const EngineJob& job, const WorkFolder& folder, EngineWatch& watch) {
    const Descriptor input(open("/dev/null", O_RDONLY | O_CLOEXEC));
    const Descriptor log(open(LogPath(folder).c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC,
                              S_IRUSR | S_IWUSR));
    int status = 0;
    for (int start = 0; start < 2; ++start) {
        EngineProcess engine(LibreOfficeCommand(folder, job, input.Get(), log.Get()));
        if (!engine.IsStarted())
            return DescribeError("LibreOffice cannot be started", errno);
        std::string ended = watch.Await(engine, [&] { return folder.Size(); });
        status = engine.End();
        RemoveSocket(job.folder); // while the folder tells of it, whatever happens to this process
        if (!ended.empty())
            return ended;
        if (!WIFEXITED(status) || WEXITSTATUS(status) != WantsRestart)
            break;
    }
    return DescribeStatus(EngineName, status);
}

/// Everything that happens in the work folder; it is gone afterwards.
Message ConvertInFolder(const EngineJob& job, int document, const Channel& server) {
    const WorkFolder folder(job.folder);
    if (!folder.IsMade())
        return Failure(DescribeError("the folder " + job.folder + " cannot be made", errno));
    Heartbeat heartbeat(server);
    const DocumentCopy copy = CopyDocument(document, DocumentPath(folder, job), heartbeat);
    if (copy.error != 0)
        return Failure(DescribeError("it cannot be copied to " + job.folder, copy.error));
    if (IsPackageOfAnotherKind(DocumentPath(folder, job), job.extension))
        return Failure("it is a document of another application");
    if (job.extension == "pub" && !IsPublication(DocumentPath(folder, job)))
        return Failure("it is not a publication");
    if (!MakeProfile(folder.Path(), job.program))
        return Failure(DescribeError("LibreOffice's profile cannot be written", errno));
    EngineWatch watch(EngineName, job.limits, server);
    std::string failure = RunEngine(job, folder, watch);
    Descriptor output = failure.empty() ? OpenOutput(OutputPath(folder, job)) : Descriptor();
    if (output.IsOpen())
        return Message{MessageKind::Done, copy.sha256, std::move(output)};
    if (IsFull(folder.Path()))
        return Failure(DescribeFull(job.folder.substr(0, job.folder.rfind('/'))));
    return Failure(failure.empty() ? DescribeMissingOutput(LogPath(folder)) : failure);
}

} // namespace

void Supervise(const EngineJob& job, int document, const Channel& server) {
    const Message result = ConvertInFolder(job, document, server);
    server.Send(result.kind, result.text, result.attachment.Get());
}

} // namespace standins
