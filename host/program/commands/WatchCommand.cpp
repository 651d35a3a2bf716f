#include "host/program/base/PathText.h"
#include "host/program/commands/JournalOptions.h"
#include "host/program/commands/ServiceRun.h"
#include "host/program/page/PageServer.h"
#include "host/program/watch/ConfigurationCheck.h"
#include "host/program/watch/FolderLock.h"
#include "host/program/watch/FolderPlaces.h"
#include "plugin/settings/FilterSettings.h"

#include <wx/intl.h>
#include <wx/utils.h>

#include <algorithm>

namespace fs = std::filesystem;

namespace {

struct WatchOptions {
    std::optional<std::string> folder;
    std::optional<std::string> out;
    ServiceOptions service;
    std::optional<std::string> journal;
    SettingsOptions settings;
    bool check = false;
    bool once = false;
};

/// What a command line says of the settings, as assignments.
std::vector<std::string> AssignmentsOf(const SettingsOptions& options) {
    std::vector<std::string> assignments = options.assignments;
    const auto assign = [&assignments](const Setting& setting, const std::string& value) {
        assignments.push_back(setting.key + ("=" + value));
    };
    if (options.printer)
        assign(FilterSettings::Printer, *options.printer);
    if (options.profile)
        assign(FilterSettings::DistillerProfile, *options.profile);
    if (options.pdf) {
        assign(FilterSettings::OutputPS, *options.pdf ? "0" : "1");
        assign(FilterSettings::OutputPDF, *options.pdf ? "1" : "0");
    }
    return assignments;
}

/// A watch of one folder, as the command line says.
std::optional<WatchConfiguration> ConfigurationOf(const WatchOptions& options, Fault& fault) {
    if (!options.folder || !options.out) {
        fault = {_("say which folder to watch, and with --out where its output goes; or name a "
                   "file with --config"),
                 Blame::Usage};
        return std::nullopt;
    }
    FolderConfiguration folder = StandardFolderConfiguration();
    folder.in = fs::absolute(FromArgument(*options.folder)).lexically_normal();
    if (!folder.in.has_filename())
        folder.in = folder.in.parent_path();
    folder.name = Shown(folder.in.filename());
    folder.out = fs::absolute(FromArgument(*options.out)).lexically_normal();
    if (options.settings.file)
        folder.settings = fs::absolute(FromArgument(*options.settings.file));
    folder.assignments = AssignmentsOf(options.settings);
    WatchConfiguration configuration = StandardWatchConfiguration();
    configuration.http.clear();
    configuration.folders = {std::move(folder)};
    return configuration;
}

/// What is to be watched: the file's word, and the command line's in its place.
std::optional<WatchConfiguration> ReadConfiguration(const WatchOptions& options, Fault& fault) {
    const std::optional<std::string>& file = options.service.configuration;
    if (file && options.folder) {
        fault = {_("name either a folder or a file with --config"), Blame::Usage};
        return std::nullopt;
    }
    std::optional<WatchConfiguration> configuration =
        file ? ReadWatchConfiguration(FromArgument(*file), fault) : ConfigurationOf(options, fault);
    if (!configuration)
        return std::nullopt;
    if (options.journal)
        configuration->journal = fs::absolute(FromArgument(*options.journal)).u8string();
    Override(*configuration, options.service);
    if (const auto clash = FindClash(*configuration)) {
        fault = {clash->what, Blame::Usage};
        return std::nullopt;
    }
    return configuration;
}

/// Whether the page could be shown; while the watch runs, it is.
std::vector<Fault> FindObstacleOfPage(const WatchConfiguration& configuration) {
    const bool runs =
        std::any_of(configuration.folders.begin(), configuration.folders.end(),
                    [](const auto& folder) { return FolderLock::HolderOf(folder.in).has_value(); });
    const StatusBoard board;
    Fault fault;
    if (configuration.http.empty() || runs ||
        PageServer::Start(
            configuration.http, {}, board, [] {}, fault))
        return {};
    return {fault};
}

ExitCode RunWatch(const WatchOptions& watch, const CommonOptions& options, Reporter& reporter) {
    Fault fault;
    std::optional<WatchConfiguration> configuration = ReadConfiguration(watch, fault);
    if (!configuration)
        return reporter.Error(fault);
    if (watch.check)
        return TellCheck(*configuration, FilterSet(options.FiltersFolder()), reporter,
                         FindObstacleOfPage(*configuration));
    const std::optional<std::string>& file = watch.service.configuration;
    ServiceRun run = {std::move(*configuration), {}};
    run.means.once = watch.once;
    run.means.finder =
        wxGetHostName() + ' ' + Shown(fs::absolute(FromArgument(file ? *file : *watch.folder)));
    run.pageIsAsked = watch.service.http.has_value();
    if (file) {
        run.means.reload = [watch](Fault& why) { return ReadConfiguration(watch, why); };
        run.obeysHangUp = true;
    }
    return RunService(std::move(run), options, reporter);
}

} // namespace

void AddWatch(CLI::App& program, Command& chosen) {
    const auto given = std::make_shared<WatchOptions>();
    CLI::App& watch = AddSubcommand(
        program, "watch", "Convert what comes into a folder: quillon watch FOLDER --out DIR",
        [&chosen, given] {
            chosen.opensDocuments = true;
            chosen.run = [given](const CommonOptions& options, Reporter& reporter) {
                return RunWatch(*given, options, reporter);
            };
        });
    AddOption(watch, "FOLDER", "DIR", "The folder that documents come into", given->folder);
    AddOption(watch, "-o,--out", "DIR", "The folder for the output", given->out);
    AddOption(watch, "--config", "FILE.toml", "What to watch, in place of one folder",
              given->service.configuration);
    AddFlag(watch, "--check", "Say what would be done, and what will not work", given->check);
    AddFlag(watch, "--once", "End when all that has settled is done", given->once);
    AddOption(watch, "--journal", "FILE", "Where it is kept what is known of documents",
              given->journal);
    AddQueueUrl(watch, given->service.queue);
    AddOption(watch, "--http", "HOST:PORT", "Where to show a page", given->service.http);
    AddSettingsOptions(watch, given->settings);
    AddJobs(watch, given->service.jobs);
}
