#include "standins/office/inprocess/EngineRun.h"

#include "standins/inprocess/Paths.h"
#include "standins/office/inprocess/KeptEngine.h"
#include "standins/office/inprocess/Settings.h"
#include "standins/office/shared/UserInstallation.h"
#include "standins/shared/Text.h"
#include "standins/shared/WorkFolder.h"

#include <filesystem>

namespace fs = std::filesystem;

namespace standins {

EngineResult RunEngine(const std::wstring& path, const DocumentFile& document,
                       const DocumentFormat& format) {
    const std::string program = ReadEnginePath();
    if (program.empty())
        return {
            Descriptor(), Descriptor(), {}, {}, {"LibreOffice is not installed", Fault::Machine}};
    SupervisedRun run;
    run.engine = "LibreOffice";
    run.supervisor = HelperPath("office-engine");
    run.arguments = {
        "--program=" + program,
        "--document=" + fs::path(ToUtf8(path).value_or("")).lexically_normal().string(),
        std::string("--extension=") + format.extension,
        std::string("--import=") + format.importFilter,
        "--export=" + format.exportTo,
    };
    if (!format.hiddenTo.empty())
        run.arguments.push_back("--hidden=" + format.hiddenTo);
    run.descriptors = {document.descriptor.Get()};
    run.folder = WorkFolder::NewPath(OfficeFolderKind);
    run.clearOutside = RemoveSocket;
    run.limits = ReadTimeLimits();
    run.mostMemory = ReadMemoryLimit();
    Descriptor hiddenOutput;
    run.takePart = [&hiddenOutput](Message part) { hiddenOutput = std::move(part.attachment); };

    Message result = RunByKeptEngine(run, program);
    if (result.kind != MessageKind::Done || !result.attachment.IsOpen())
        return {Descriptor(), Descriptor(), {}, {}, {result.text, result.fault}};
    // The sum is a line, the fonts follow; a text that is too long is cut off.
    const std::size_t sum = result.text.find('\n');
    const std::size_t end = result.text.rfind('\n') + 1;
    return {std::move(result.attachment),
            std::move(hiddenOutput),
            result.text.substr(0, sum),
            result.text.substr(sum + 1, end - sum - 1),
            {}};
}

void ClearAfterKilledRuns() {
    WorkFolder::DiscardAbandoned(OfficeFolderKind, RemoveSocket);
}

} // namespace standins
