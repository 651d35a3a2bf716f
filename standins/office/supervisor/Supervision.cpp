#include "standins/office/supervisor/Supervision.h"

#include "standins/office/supervisor/CompoundDocument.h"
#include "standins/office/supervisor/DocumentCopy.h"
#include "standins/office/supervisor/EngineOutput.h"
#include "standins/office/supervisor/EngineRun.h"
#include "standins/office/supervisor/FontStandIns.h"
#include "standins/office/supervisor/LibreOfficeCommand.h"
#include "standins/office/supervisor/PackageKind.h"
#include "standins/office/supervisor/Profile.h"
#include "standins/office/supervisor/TextLibrary.h"
#include "standins/shared/WorkFolder.h"
#include "standins/supervisor/EngineFailure.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>
#include <string>

namespace standins {

namespace {

const std::string EngineName = "LibreOffice";

std::string TemporaryFolder(const EngineJob& job) {
    return job.folder.substr(0, job.folder.rfind('/'));
}

/// What comes of a job.
struct Result {
    /// The document's SHA-256, and a line for each font that another stands in for.
    std::string text;
    Descriptor output;
    Descriptor hiddenOutput; ///< closed when there is none
};

/// For whom the job is done, and what there is to do it with.
struct Surroundings {
    const Channel& server;
    OfficeHost* host; ///< null for none
};

/// @param result receives what LibreOffice has made
Failure MakeOutput(const EngineJob& job, const WorkFolder& folder, const Surroundings& around,
                   Result& result) {
    const Descriptor input(open("/dev/null", O_RDONLY | O_CLOEXEC));
    const Descriptor log(open(LogPath(folder).c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC,
                              S_IRUSR | S_IWUSR));
    const EngineCommand command = LibreOfficeCommand(folder, job, input.Get(), log.Get());
    EngineWatch watch(EngineName, job.limits, job.mostMemory, around.server);
    Failure failure = RunLibreOffice(
        {command, OrderFor(folder, job)}, around.host, watch, [&folder] { return folder.Size(); },
        around.server);
    if (failure)
        return failure;
    result.output = OpenOutput(OutputPath(folder, job));
    result.hiddenOutput = OpenOutput(HiddenOutputPath(folder));
    return result.output.IsOpen()
               ? Failure()
               : WithTightLimits({DescribeMissingOutput(LogPath(folder))}, command);
}

/// Everything that happens in the work folder.
Failure ConvertInFolder(const EngineJob& job, int document, const WorkFolder& folder,
                        const Surroundings& around, Result& result) {
    Heartbeat heartbeat(around.server);
    DocumentCopy copy = CopyDocument(document, DocumentPath(folder, job), heartbeat);
    if (copy.error != 0)
        return MachineFailure("it cannot be copied to " + TemporaryFolder(job), copy.error);
    result.text = std::move(copy.sha256);
    if (IsPackageOfAnotherKind(DocumentPath(folder, job), job.importFilter))
        return {"it is a document of another application"};
    if (job.importFilter == PublicationFilter && !IsPublication(DocumentPath(folder, job)))
        return {"it is not a publication"};
    if (!MakeProfile(folder.Path(), job.program) || !LinkTextLibrary(folder.Path()))
        return MachineFailure(EngineName + "'s profile cannot be written", errno);
    EngineJob ownJob = job;
    ownJob.importFilter = ImportFilterOf(DocumentPath(folder, job), job.importFilter);
    Failure failure = MakeOutput(ownJob, folder, around, result);
    result.text += '\n' + ReadFontStandIns(folder.Path());
    return failure;
}

/// The work folder is gone afterwards.
Failure Convert(const EngineJob& job, int document, const Surroundings& around, Result& result) {
    const WorkFolder folder(job.folder);
    if (!folder.IsMade())
        return MachineFailure("no folder can be made in " + TemporaryFolder(job), errno);
    Failure failure = ConvertInFolder(job, document, folder, around, result);
    const bool lacksRoom = IsDocumentsFault(failure) && IsFull(folder.Path());
    return lacksRoom ? NoRoomFailure(TemporaryFolder(job)) : failure;
}

} // namespace

void Supervise(const EngineJob& job, int document, const Channel& server, OfficeHost* host) {
    Result result;
    if (const Failure failure = Convert(job, document, {server, host}, result)) {
        server.Send(failure);
        return;
    }
    if (result.hiddenOutput.IsOpen())
        server.Send(MessageKind::Part, {}, result.hiddenOutput.Get());
    server.Send(MessageKind::Done, result.text, result.output.Get());
}

} // namespace standins
