#include "standins/office/inprocess/KeptEngine.h"

#include "standins/inprocess/Paths.h"
#include "standins/inprocess/StandingSupervisor.h"
#include "standins/office/inprocess/Settings.h"
#include "standins/shared/Text.h"
#include "standins/shared/WorkFolder.h"

#include <mutex>
#include <optional>

namespace standins {

namespace {

struct KeptEngine {
    std::mutex mutex; ///< of what follows
    std::optional<StandingSupervisor> supervisor;
};

KeptEngine& TheKeptEngine() {
    static KeptEngine engine;
    return engine;
}

} // namespace

Message RunByKeptEngine(const SupervisedRun& run, const std::string& program) {
    KeptEngine& engine = TheKeptEngine();
    const unsigned documents = ReadDocumentsPerStart();
    const std::unique_lock lock(engine.mutex, std::try_to_lock);
    std::optional<Message> result;
    if (documents > 1 && lock.owns_lock()) {
        if (!engine.supervisor)
            engine.supervisor.emplace();
        result = engine.supervisor->Run(
            run, {"--program=" + program, "--documents=" + std::to_string(documents)},
            OfficeFolderKind);
    }
    return result ? std::move(*result) : RunSupervised(run);
}

std::wstring WhyEngineCannotBeKept(const std::string& program) {
    SupervisedRun run;
    run.engine = "LibreOffice";
    run.supervisor = HelperPath("office-engine");
    run.arguments = {"--program=" + program, "--documents=0"};
    run.folder = WorkFolder::NewPath(OfficeFolderKind);
    run.limits = ReadTimeLimits();
    run.mostMemory = ReadMemoryLimit();
    const Message result = RunSupervised(run);
    return result.kind == MessageKind::Done ? std::wstring() : FromUtf8(result.text);
}

void EndKeptEngine() {
    KeptEngine& engine = TheKeptEngine();
    const std::lock_guard lock(engine.mutex);
    engine.supervisor.reset();
}

} // namespace standins
