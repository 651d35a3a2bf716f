#include "host/program/base/PathText.h"
#include "host/program/commands/JournalOptions.h"
#include "host/program/commands/ServiceRun.h"

#include <wx/intl.h>

#include <CLI/CLI.hpp>

namespace fs = std::filesystem;

namespace {

struct ServeOptions {
    ServiceOptions service;
    std::vector<std::string> shares; ///< SHARE=DIR
    bool anyVersion = false;
};

std::optional<PathMap> ReadMap(const std::vector<std::string>& given, Fault& fault) {
    std::map<std::string, fs::path> shares;
    for (const std::string& share : given) {
        const std::size_t equals = share.find('=');
        const std::string name = share.substr(0, equals);
        if (equals == std::string::npos || !PathMap::IsName(name)) {
            fault = {wxString::Format(_("--map takes SHARE=DIR, not \"%s\""),
                                      Shown(FromArgument(share))),
                     Blame::Usage};
            return std::nullopt;
        }
        const fs::path folder =
            fs::absolute(FromArgument(share.substr(equals + 1))).lexically_normal();
        shares[name] = folder.has_filename() ? folder : folder.parent_path();
    }
    return PathMap(std::move(shares));
}

/// The file's word, and the command line's in its place.
std::optional<WatchConfiguration> ReadConfiguration(const ServeOptions& options, Fault& fault) {
    std::optional<WatchConfiguration> configuration = StandardWatchConfiguration();
    configuration->http.clear();
    if (const auto& file = options.service.configuration)
        configuration = ReadWatchConfiguration(FromArgument(*file), fault, FoldersNeed::None);
    if (!configuration)
        return std::nullopt;
    configuration->folders.clear();
    Override(*configuration, options.service);
    if (!options.shares.empty()) {
        const std::optional<PathMap> map = ReadMap(options.shares, fault);
        if (!map)
            return std::nullopt;
        configuration->map = *map;
    }
    if (IsQueueUrl(configuration->journal))
        return configuration;
    fault = {_("say which queue to work for: --queue postgres://…, or a configuration with "
               "\"queue\" and --config"),
             Blame::Usage};
    return std::nullopt;
}

ExitCode RunServe(const ServeOptions& serve, const CommonOptions& options, Reporter& reporter) {
    Fault fault;
    std::optional<WatchConfiguration> configuration = ReadConfiguration(serve, fault);
    if (!configuration)
        return reporter.Error(fault);
    ServiceRun run = {std::move(*configuration), {}};
    run.finds = false;
    run.anyVersion = serve.anyVersion;
    run.pageIsAsked = serve.service.http.has_value();
    return RunService(std::move(run), options, reporter);
}

} // namespace

void AddServe(CLI::App& program, Command& chosen) {
    const auto given = std::make_shared<ServeOptions>();
    CLI::App& serve = AddSubcommand(
        program, "serve", "Convert what watches on other machines find: quillon serve --queue URL",
        [&chosen, given] {
            chosen.opensDocuments = true;
            chosen.run = [given](const CommonOptions& options, Reporter& reporter) {
                return RunServe(*given, options, reporter);
            };
        });
    AddQueueUrl(serve, given->service.queue);
    AddOption(serve, "--config", "FILE.toml", "Where queue, map, jobs, lease and http stand",
              given->service.configuration);
    serve
        .add_option("--map", given->shares,
                    "Where this machine has a share that the watches name; as often as needed")
        ->type_name("SHARE=DIR");
    AddOption(serve, "--http", "HOST:PORT", "Where to show a page", given->service.http);
    AddFlag(serve, "--any-version",
            "Also where pages may look another way than from the machines that work already",
            given->anyVersion);
    AddJobs(serve, given->service.jobs);
}
