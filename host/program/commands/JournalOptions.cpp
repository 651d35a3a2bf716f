#include "host/program/commands/JournalOptions.h"

#include "host/program/base/PathText.h"
#include "host/program/system/StandardFiles.h"
#include "host/program/watch/WatchConfiguration.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <CLI/CLI.hpp>
#include <algorithm>
#include <fstream>

namespace fs = std::filesystem;

namespace {

std::optional<NamedJournal> JournalOf(const fs::path& configuration, Fault& fault) {
    const std::optional<WatchConfiguration> watch =
        ReadWatchConfiguration(configuration, fault, FoldersNeed::None);
    if (!watch)
        return std::nullopt;
    NamedJournal named = {watch->journal, watch->map, {}};
    for (const FolderConfiguration& folder : watch->folders)
        named.folders.push_back(folder.name);
    return named;
}

/// @return empty when there is none
fs::path ReadableMachineConfiguration() {
    const fs::path file = MachineConfiguration();
    return !file.empty() && std::ifstream(file) ? file : fs::path();
}

/// Where it cannot be looked, opening it says why.
bool IsMissing(const std::string& where) {
    std::error_code error;
    return !IsQueueUrl(where) && !fs::exists(fs::u8path(where), error) && !error;
}

Fault NoJournal(const std::string& where) {
    return {wxString::Format(_("there is no journal %s"), ShownJournal(where)), Blame::Usage,
            ConversionFailed,
            _("`quillon watch` makes it; name another one with --journal or --config")};
}

} // namespace

void AddJournalOptions(CLI::App& command, JournalOptions& options) {
    AddOption(command, "--journal", "FILE", "The journal", options.journal);
    AddQueueUrl(command, options.queue);
    AddOption(command, "--config", "FILE.toml",
              "The configuration of the folders, which names the journal; without both, that of\n"
              "the machine's service, or else the user's own journal",
              options.configuration);
}

void AddQueueUrl(CLI::App& command, std::optional<std::string>& url) {
    command.add_option("--queue", url, "In place of a journal: the queue that machines share")
        ->type_name("postgres://…")
        ->check([](const std::string& text) {
            return IsQueueUrl(text) ? std::string() : "It must begin with postgres://";
        });
}

std::optional<NamedJournal> FindJournal(const JournalOptions& options, Fault& fault) {
    const fs::path configuration =
        options.configuration              ? fs::absolute(FromArgument(*options.configuration))
        : options.journal || options.queue ? fs::path()
                                           : ReadableMachineConfiguration();
    std::optional<NamedJournal> named = configuration.empty()
                                            ? NamedJournal{StandardJournal(), {}, {}}
                                            : JournalOf(configuration, fault);
    if (named && options.journal)
        named->where = fs::absolute(FromArgument(*options.journal)).u8string();
    if (named && options.queue)
        named->where = *options.queue;
    return named;
}

ExitCode WorkOnJournal(const JournalOptions& options, Reporter& reporter, const JournalWork& work,
                       const std::function<ExitCode(const NamedJournal&)>& withNone) {
    Fault fault;
    const std::optional<NamedJournal> named = FindJournal(options, fault);
    if (!named)
        return reporter.Error(fault);
    if (IsMissing(named->where))
        return withNone ? withNone(*named) : reporter.Error(NoJournal(named->where));
    const std::unique_ptr<Journal> journal =
        OpenJournal(named->where, fault, JournalNeed::Visit, named->map);
    if (!journal)
        return reporter.Error(fault);
    try {
        return work(*journal, *named);
    } catch (const JournalError& error) {
        return reporter.Error(
            {wxString::Format(_("the journal %s cannot be used: %s"), ShownJournal(named->where),
                              wxString::FromUTF8(error.what())),
             Blame::Machine});
    }
}

std::optional<Fault> FindUnknown(const wxString& folder, Journal& journal,
                                 const NamedJournal& named) {
    std::set<wxString> known(named.folders.begin(), named.folders.end());
    for (const auto& [name, counts] : journal.Counts())
        known.insert(name);
    if (known.count(folder) != 0)
        return std::nullopt;
    wxString list;
    for (const wxString& name : known)
        list << (list.empty() ? "" : ", ") << OneLine(name);
    return Fault{wxString::Format(_("there is no watched folder \"%s\""), folder), Blame::Usage,
                 ConversionFailed,
                 list.empty() ? wxString() : wxString::Format(_("The folders are: %s"), list)};
}
