#include "host/program/commands/JournalOptions.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

namespace {

struct PauseOptions {
    JournalOptions journal;
    std::optional<std::string> folder;
};

wxString Describe(const wxString& folder, bool paused) {
    if (folder.empty())
        return paused ? _("All folders are paused: no document is begun until `quillon resume`.")
                      : _("The folders go on.");
    return wxString::Format(paused ? _("%s is paused: none of its documents is begun until "
                                       "`quillon resume` with its name.")
                                   : _("%s goes on."),
                            OneLine(folder));
}

/// What is paused all the same, which whoever resumes wants to know.
void TellStillPaused(Journal& journal, Reporter& reporter) {
    const std::set<wxString> paused = journal.Paused();
    wxString list;
    for (const wxString& name : paused)
        if (!name.empty())
            list << (list.empty() ? "" : ", ") << OneLine(name);
    if (paused.count({}) != 0)
        reporter.Line(_("All folders are paused; `quillon resume` lets them go on."));
    else if (!list.empty())
        reporter.Line(wxString::Format(_("Still paused: %s"), list));
}

ExitCode SetPaused(const wxString& folder, bool paused, Journal& journal, const NamedJournal& named,
                   Reporter& reporter) {
    if (!folder.empty())
        if (const auto fault = FindUnknown(folder, journal, named))
            return reporter.Error(*fault);
    journal.SetPaused(folder, paused);
    reporter.Line(Describe(folder, paused));
    reporter.Record({{"type", "pause"},
                     {"folder", folder.empty() ? Json() : Json(JsonText(folder))},
                     {"paused", paused}});
    if (!paused)
        TellStillPaused(journal, reporter);
    return ExitCode::Done;
}

void AddPauseOrResume(CLI::App& program, Command& chosen, const char* name, const char* description,
                      bool paused) {
    const auto given = std::make_shared<PauseOptions>();
    CLI::App& command = AddSubcommand(program, name, description, [&chosen, given, paused] {
        chosen.needsMachine = false;
        chosen.run = [given, paused](const CommonOptions&, Reporter& reporter) {
            const wxString folder = wxString::FromUTF8(given->folder.value_or(""));
            return WorkOnJournal(given->journal, reporter,
                                 [&](Journal& journal, const NamedJournal& named) {
                                     return SetPaused(folder, paused, journal, named, reporter);
                                 });
        };
    });
    AddJournalOptions(command, given->journal);
    AddOption(command, "FOLDER", "NAME", "One watched folder; all, if not given", given->folder);
}

} // namespace

void AddPause(CLI::App& program, Command& chosen) {
    AddPauseOrResume(program, chosen, "pause",
                     "Begin no documents of watched folders, or of one: quillon pause [FOLDER]",
                     true);
}

void AddResume(CLI::App& program, Command& chosen) {
    AddPauseOrResume(program, chosen, "resume", "Take that back: quillon resume [FOLDER]", false);
}
