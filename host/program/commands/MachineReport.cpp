#include "host/program/commands/MachineReport.h"

#include "host/program/commands/JobReport.h"
#include "host/program/journal/Machines.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <algorithm>

namespace {

wxString ListOf(const std::vector<wxString>& parts) {
    wxString list;
    for (const wxString& part : parts)
        list << (list.empty() ? "" : ", ") << part;
    return list;
}

std::vector<wxString> TextsOf(const std::set<std::string>& extensions) {
    std::vector<wxString> texts;
    texts.reserve(extensions.size());
    for (const std::string& extension : extensions)
        texts.push_back(wxString::FromUTF8(extension));
    return texts;
}

wxString Translated(const char* text) {
    return wxGetTranslation(text);
}

wxString LineOf(const Machine& machine, const PageMakers& common) {
    std::vector<wxString> parts = WorkOf(machine, Translated);
    if (machine.isAlive)
        parts.push_back(wxString::Format(_("%zu under way"), machine.running));
    else
        parts.push_back(wxString::Format(_("not heard of since %s"), LocalTime(machine.seen)));
    if (const auto differences = DifferencesOf(machine, common, Translated); !differences.empty())
        parts.push_back(wxString::Format(_("differs: %s"), ListOf(differences)));
    if (!machine.cannot.empty())
        parts.push_back(
            wxString::Format(_("has nothing to open %s with"), ListOf(TextsOf(machine.cannot))));
    if (!machine.obstacle.empty())
        parts.push_back(OneLine(machine.obstacle));
    return OneLine(machine.name) + ": " + ListOf(parts);
}

Json RecordOf(const Machine& machine, const PageMakers& common) {
    const bool differs = Converts(machine) && !(machine.makers == common);
    return {{"type", "machine"},
            {"name", JsonText(machine.name)},
            {"finds", machine.finds},
            {"jobs", machine.jobs},
            {"running", machine.running},
            {"alive", machine.isAlive},
            {"started", RecordTime(machine.started)},
            {"seen", RecordTime(machine.seen)},
            {"version", JsonText(machine.makers.program)},
            {"office", JsonText(machine.makers.office)},
            {"pdf", JsonText(machine.makers.pdf)},
            {"fonts", JsonText(machine.makers.fonts)},
            {"anyVersion", machine.takesAnyVersion},
            {"differs", differs},
            {"cannot", JsonTexts(TextsOf(machine.cannot))},
            {"obstacle", JsonText(machine.obstacle)}};
}

/// What none of those that work can open.
std::vector<wxString> OpenedByNone(const std::vector<Machine>& machines) {
    std::optional<std::set<std::string>> none;
    for (const Machine& machine : machines) {
        if (!Converts(machine))
            continue;
        std::set<std::string> both;
        for (const std::string& extension : machine.cannot)
            if (!none || none->count(extension) != 0)
                both.insert(extension);
        none = std::move(both);
    }
    return TextsOf(none.value_or(std::set<std::string>()));
}

} // namespace

void TellMachines(SharedJournal& journal, Reporter& reporter) {
    const std::vector<Machine> machines = journal.Machines();
    const PageMakers common = CommonMakers(machines);
    for (const Machine& machine : machines) {
        reporter.Line(LineOf(machine, common));
        reporter.Record(RecordOf(machine, common));
    }
    if (std::none_of(machines.begin(), machines.end(), Converts))
        reporter.Line(_("No machine converts documents; `quillon serve` on one of them would."));
    else if (const auto extensions = OpenedByNone(machines); !extensions.empty())
        reporter.Line(wxString::Format(
            _("No machine has anything to open these with: %s. Such documents wait."),
            ListOf(extensions)));
}
