// The supervisor of engine runs. The server of the Office applications gives it the document to
// read; or, when it is a standing one, one job after the other.

#include "standins/office/supervisor/OfficeHost.h"
#include "standins/office/supervisor/Supervision.h"
#include "standins/shared/Channel.h"
#include "standins/supervisor/Supervisor.h"

#include <algorithm>
#include <cstdlib>
#include <exception>
#include <vector>

namespace {

using Words = std::vector<std::string>;

/// Has CLI11 read the words.
/// @throws CLI::Error when they are no such options
void Read(CLI::App& options, Words words) {
    std::reverse(words.begin(), words.end()); // as CLI11 wants them
    options.parse(words);
}

/// Takes over what every supervisor is told.
template <typename Settings>
void Take(const standins::SupervisorOptions& options, Settings& settings) {
    settings.folder = options.folder;
    settings.fontFolders = options.fontFolders;
    settings.limits = options.Limits();
    settings.mostMemory = options.mostMemory;
}

standins::EngineJob ReadJob(const Words& words) {
    standins::EngineJob job;
    standins::SupervisorOptions supervisor;
    CLI::App options("Supervises one run of LibreOffice.");
    supervisor.AddTo(options);
    options.add_option("--program", job.program)->required();
    options.add_option("--document", job.knownPath)->required();
    options.add_option("--extension", job.extension)->required();
    options.add_option("--import", job.importFilter)->required();
    options.add_option("--export", job.exportTo)->required();
    options.add_option("--hidden", job.hiddenTo);
    Read(options, words);
    Take(supervisor, job);
    return job;
}

standins::HostSettings ReadHostSettings(const Words& words) {
    standins::HostSettings settings;
    standins::SupervisorOptions supervisor;
    CLI::App options("Supervises one run of LibreOffice after the other.");
    supervisor.AddTo(options);
    options.add_option("--program", settings.program)->required();
    options.add_option("--documents", settings.mostDocuments)->required();
    Read(options, words);
    Take(supervisor, settings);
    return settings;
}

/// Whether the supervisor is to serve for many documents.
bool IsStanding(const Words& words) {
    return std::any_of(words.begin(), words.end(),
                       [](const std::string& word) { return word.rfind("--documents=", 0) == 0; });
}

/// Tries whether LibreOffice can be kept started.
void Examine(standins::OfficeHost& host, const standins::Channel& server) {
    const bool isReady = host.AwaitReady(server);
    server.Send(isReady ? standins::MessageKind::Done : standins::MessageKind::Failed,
                host.Reason());
}

/// Keeps LibreOffice started while there is a server.
void Stand(const Words& words) {
    const standins::HostSettings settings = ReadHostSettings(words);
    const standins::Channel server = standins::BecomeSupervisor(0, settings.mostMemory);
    standins::OfficeHost host(settings);
    host.Start();
    if (settings.mostDocuments == 0)
        return Examine(host, server);
    while (const std::optional<standins::Message> job = server.Receive()) {
        standins::Supervise(ReadJob(standins::SplitWords(job->text)), job->attachment.Get(), server,
                            &host);
        host.RenewIfDue();
    }
}

void RunOnce(const Words& words) {
    const standins::EngineJob job = ReadJob(words);
    const standins::Channel server = standins::BecomeSupervisor(1, job.mostMemory);
    standins::Supervise(job, standins::FirstGivenDescriptor, server);
}

} // namespace

int main(int argc, char** argv) {
    try {
        const Words words(argv + 1, argv + argc);
        if (IsStanding(words))
            Stand(words);
        else
            RunOnce(words);
        return EXIT_SUCCESS;
    } catch (const std::exception&) { // the server sees the channel close
        return EXIT_FAILURE;
    }
}
