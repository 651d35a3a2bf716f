#include "standins/office/server/EngineRun.h"

#include "standins/module/ModulePath.h"
#include "standins/module/SupervisedRun.h"
#include "standins/office/UserInstallation.h"
#include "standins/office/server/Settings.h"
#include "standins/process/WorkFolder.h"

namespace standins {

namespace {

constexpr const char* FolderKind = "office";

} // namespace

EngineResult RunEngine(const DocumentFile& document, const DocumentFormat& format) {
    const std::string program = ReadEnginePath();
    if (program.empty())
        return {Descriptor(), {}, {"LibreOffice is not installed", Fault::Machine}};
    SupervisedRun run;
    run.engine = "LibreOffice";
    run.supervisor = HelperPath("office-engine");
    run.arguments = {
        "--program=" + program,
        std::string("--extension=") + format.extension,
        std::string("--import=") + format.importFilter,
        "--export=" + format.exportTo,
    };
    run.descriptors = {document.descriptor.Get()};
    run.folder = WorkFolder::NewPath(FolderKind);
    run.clearOutside = RemoveSocket;
    run.limits = ReadTimeLimits();
    run.mostMemory = ReadMemoryLimit();

    Message result = RunSupervised(run);
    if (result.kind != MessageKind::Done || !result.attachment.IsOpen())
        return {Descriptor(), {}, {result.text, result.fault}};
    return {std::move(result.attachment), result.text, {}};
}

void ClearAfterKilledRuns() {
    WorkFolder::DiscardAbandoned(FolderKind, RemoveSocket);
}

} // namespace standins
