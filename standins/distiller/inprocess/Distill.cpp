#include "standins/distiller/inprocess/Distill.h"

#include "standins/distiller/inprocess/Ghostscript.h"
#include "standins/distiller/inprocess/Profiles.h"
#include "standins/distiller/inprocess/Settings.h"
#include "standins/inprocess/DocumentFile.h"
#include "standins/inprocess/LimitSettings.h"
#include "standins/inprocess/Paths.h"
#include "standins/inprocess/RegistryKey.h"
#include "standins/inprocess/SupervisedRun.h"
#include "standins/shared/NewFile.h"
#include "standins/shared/Text.h"
#include "standins/shared/WorkFolder.h"

using namespace std::chrono_literals;

namespace standins {

namespace {

/// A failure on the way; caught where the outcome is made.
struct Failed {
    DistillOutcome outcome;
};

[[noreturn]] void Fail(DistillResult result, Failure failure) {
    throw Failed{{result, std::move(failure)}};
}

[[noreturn]] void FailByMachine(DistillResult result, std::string reason) {
    Fail(result, {std::move(reason), Fault::Machine});
}

Descriptor OpenPostScript(const std::string& path) {
    Failure failure;
    DocumentFile file = OpenDocumentFile(FromUtf8(path), failure);
    if (!file.descriptor.IsOpen())
        Fail(DistillResult::NoPostScript, failure);
    return std::move(file.descriptor);
}

std::string Joined(const std::vector<std::string>& folders) {
    std::string text;
    for (const std::string& folder : folders)
        text += (text.empty() ? "" : " or ") + folder;
    return text;
}

/// @return closed when none is asked for
Descriptor OpenProfile(const std::string& name) {
    if (name.empty())
        return Descriptor();
    const std::optional<std::string> path = FindProfile(name);
    if (!path) {
        const std::string folders = Joined(ProfileFolders());
        FailByMachine(DistillResult::NoProfile, "there is no profile \"" + name + '"' +
                                                    (folders.empty() ? folders : " in " + folders));
    }
    Failure failure;
    DocumentFile file = OpenDocumentFile(FromUtf8(*path), failure);
    if (!file.descriptor.IsOpen())
        FailByMachine(DistillResult::NoProfile,
                      "the profile " + *path + " cannot be used: " + failure.reason);
    return std::move(file.descriptor);
}

void CheckOutput(int error) {
    if (error != 0)
        FailByMachine(DistillResult::NoOutput, ErrorWords(error));
}

SupervisedRun PrepareRun(const Descriptor& postScript, const NewFile& pdf,
                         const Descriptor& profile) {
    const RegistryKey facts = RegistryKey::Open(HKEY_LOCAL_MACHINE, DistillerSettingsKey);
    if (!facts.Text(DistillerEngineValue)) // then the machine counts as having none
        FailByMachine(DistillResult::NoEngine,
                      "no Ghostscript was found when the stand-in was registered");
    const std::optional<Ghostscript> ghostscript = FindGhostscript();
    if (!ghostscript)
        FailByMachine(DistillResult::NoEngine, "Ghostscript is not installed");
    SupervisedRun run;
    run.engine = "Ghostscript";
    run.supervisor = HelperPath("../StandIns/distiller-engine");
    run.arguments = {"--program=" + ghostscript->program};
    run.descriptors = {postScript.Get(), pdf.Get()};
    if (profile.IsOpen()) {
        run.arguments.emplace_back("--profile");
        run.descriptors.push_back(profile.Get());
    }
    run.folder = WorkFolder::NewPath(DistillerFolderKind);
    run.limits = ReadTimeLimits(DistillerSettingsKey, {60s, 600s});
    run.mostMemory = ReadMemoryLimit(DistillerSettingsKey);
    return run;
}

void MakePdf(const DistillRequest& request) {
    const Descriptor postScript = OpenPostScript(request.postScript);
    const Descriptor profile = OpenProfile(request.profile);
    NewFile pdf(request.pdf);
    CheckOutput(pdf.Error());
    const Message result = RunSupervised(PrepareRun(postScript, pdf, profile));
    if (result.kind != MessageKind::Done)
        Fail(DistillResult::NotConverted, {result.text, result.fault});
    CheckOutput(pdf.Appear());
}

} // namespace

DistillOutcome Distill(const DistillRequest& request) {
    try {
        MakePdf(request);
        return {};
    } catch (const Failed& failed) {
        return failed.outcome;
    }
}

} // namespace standins
