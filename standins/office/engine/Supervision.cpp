#include "standins/office/engine/Supervision.h"

#include "standins/engine/EngineFailure.h"
#include "standins/engine/EngineWatch.h"
#include "standins/office/UserInstallation.h"
#include "standins/office/engine/DocumentCopy.h"
#include "standins/office/engine/EngineOutput.h"
#include "standins/office/engine/FontStandIns.h"
#include "standins/office/engine/ImportFilter.h"
#include "standins/office/engine/LibreOfficeCommand.h"
#include "standins/office/engine/PackageKind.h"
#include "standins/office/engine/Profile.h"
#include "standins/office/engine/Publication.h"
#include "standins/office/engine/TextLibrary.h"
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

std::string TemporaryFolder(const EngineJob& job) {
    return job.folder.substr(0, job.folder.rfind('/'));
}

/// Runs LibreOffice until it has ended, once more if it asks for it.
Failure RunEngine(const EngineCommand& command, const WorkFolder& folder, EngineWatch& watch) {
    const MemoryShortage shortage;
    int status = 0;
    for (int start = 0; start < 2; ++start) {
        EngineProcess engine(command);
        if (!engine.IsStarted())
            return MachineFailure(EngineName + " cannot be started", errno);
        Failure ended = watch.Await(engine, [&] { return folder.Size(); });
        status = engine.End();
        // While the folder tells of it, whatever happens to this process; and before the next
        // start, which would take itself for a second one.
        RemoveSocket(folder.Path());
        if (ended)
            return ended;
        if (!WIFEXITED(status) || WEXITSTATUS(status) != WantsRestart)
            break;
    }
    return WithTightLimits(DescribeEngineEnd(EngineName, status, shortage), command);
}

/// @param output receives what LibreOffice has made
Failure MakeOutput(const EngineJob& job, const WorkFolder& folder, const Channel& server,
                   Descriptor& output) {
    const Descriptor input(open("/dev/null", O_RDONLY | O_CLOEXEC));
    const Descriptor log(open(LogPath(folder).c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC,
                              S_IRUSR | S_IWUSR));
    const EngineCommand command = LibreOfficeCommand(folder, job, input.Get(), log.Get());
    EngineWatch watch(EngineName, job.limits, job.mostMemory, server);
    if (Failure failure = RunEngine(command, folder, watch))
        return failure;
    output = OpenOutput(OutputPath(folder, job));
    return output.IsOpen() ? Failure()
                           : WithTightLimits({DescribeMissingOutput(LogPath(folder))}, command);
}

/// Everything that happens in the work folder.
/// @param result receives the document's sum and the output
Failure ConvertInFolder(const EngineJob& job, int document, const WorkFolder& folder,
                        const Channel& server, Message& result) {
    Heartbeat heartbeat(server);
    DocumentCopy copy = CopyDocument(document, DocumentPath(folder, job), heartbeat);
    if (copy.error != 0)
        return MachineFailure("it cannot be copied to " + TemporaryFolder(job), copy.error);
    result.text = std::move(copy.sha256);
    if (IsPackageOfAnotherKind(DocumentPath(folder, job), job.extension))
        return {"it is a document of another application"};
    if (job.extension == "pub" && !IsPublication(DocumentPath(folder, job)))
        return {"it is not a publication"};
    if (!MakeProfile(folder.Path(), job.program) || !LinkTextLibrary(folder.Path()))
        return MachineFailure(EngineName + "'s profile cannot be written", errno);
    EngineJob ownJob = job;
    ownJob.importFilter = ImportFilterOf(DocumentPath(folder, job), job.importFilter);
    const Failure failure = MakeOutput(ownJob, folder, server, result.attachment);
    result.text += '\n' + ReadFontStandIns(folder.Path());
    return failure;
}

/// The work folder is gone afterwards.
Failure Convert(const EngineJob& job, int document, const Channel& server, Message& result) {
    const WorkFolder folder(job.folder);
    if (!folder.IsMade())
        return MachineFailure("no folder can be made in " + TemporaryFolder(job), errno);
    const Failure failure = ConvertInFolder(job, document, folder, server, result);
    const bool lacksRoom = IsDocumentsFault(failure) && IsFull(folder.Path());
    return lacksRoom ? NoRoomFailure(TemporaryFolder(job)) : failure;
}

} // namespace

void Supervise(const EngineJob& job, int document, const Channel& server) {
    Message result;
    const Failure failure = Convert(job, document, server, result);
    if (failure)
        server.Send(failure);
    else
        server.Send(MessageKind::Done, result.text, result.attachment.Get());
}

} // namespace standins
