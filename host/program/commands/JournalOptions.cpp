#include "host/program/commands/JournalOptions.h"

#include "host/program/base/PathText.h"
#include "host/program/system/StandardFiles.h"
#include "host/program/watch/WatchConfiguration.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <algorithm>
#include <fstream>

namespace fs = std::filesystem;

namespace {

std::optional<NamedJournal> JournalOf(const fs::path& configuration, Fault& fault) {
    const std::optional<WatchConfiguration> watch = ReadWatchConfiguration(configuration, fault);
    if (!watch)
        return std::nullopt;
    NamedJournal named = {fs::u8path(watch->journal), {}};
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
bool IsMissing(const fs::path& file) {
    std::error_code error;
    return !fs::exists(file, error) && !error;
}

Fault NoJournal(const fs::path& file) {
    return {wxString::Format(_("there is no journal %s"), Shown(file)), Blame::Usage,
            ConversionFailed,
            _("`quillon watch` makes it; name another one with --journal or --config")};
}

} // namespace

void AddJournalOptions(CLI::App& command, JournalOptions& options) {
    AddOption(command, "--journal", "FILE", "The journal", options.journal);
    AddOption(command, "--config", "FILE.toml",
              "The configuration of the folders, which names the journal; without both, that of\n"
              "the machine's service, or else the user's own journal",
              options.configuration);
}

std::optional<NamedJournal> FindJournal(const JournalOptions& options, Fault& fault) {
    const fs::path configuration = options.configuration
                                       ? fs::absolute(FromArgument(*options.configuration))
                                   : options.journal ? fs::path()
                                                     : ReadableMachineConfiguration();
    std::optional<NamedJournal> named = configuration.empty()
                                            ? NamedJournal{fs::u8path(StandardJournal()), {}}
                                            : JournalOf(configuration, fault);
    if (named && options.journal)
        named->file = fs::absolute(FromArgument(*options.journal));
    return named;
}

ExitCode WorkOnJournal(const JournalOptions& options, Reporter& reporter, const JournalWork& work,
                       const std::function<ExitCode(const NamedJournal&)>& withNone) {
    Fault fault;
    const std::optional<NamedJournal> named = FindJournal(options, fault);
    if (!named)
        return reporter.Error(fault);
    if (IsMissing(named->file))
        return withNone ? withNone(*named) : reporter.Error(NoJournal(named->file));
    const std::unique_ptr<Journal> journal =
        OpenJournal(named->file.u8string(), fault, JournalNeed::Visit);
    if (!journal)
        return reporter.Error(fault);
    try {
        return work(*journal, *named);
    } catch (const JournalError& error) {
        return reporter.Error(
            {wxString::Format(_("the journal %s cannot be used: %s"), Shown(named->file),
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
