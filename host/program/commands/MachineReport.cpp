#include "host/program/commands/MachineReport.h"

#include "host/program/commands/JobReport.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <algorithm>

namespace {

/// Whether it converts documents.
bool Works(const Machine& machine) {
    return machine.isAlive && !machine.makers.program.empty();
}

/// What most of those that work print with.
PageMakers CommonMakers(const std::vector<Machine>& machines) {
    const auto count = [&machines](const PageMakers& makers) {
        return std::count_if(machines.begin(), machines.end(), [&makers](const Machine& machine) {
            return Works(machine) && machine.makers == makers;
        });
    };
    PageMakers common;
    for (const Machine& machine : machines)
        if (Works(machine) && count(machine.makers) > count(common))
            common = machine.makers;
    return common;
}

std::vector<wxString> DifferencesOf(const PageMakers& makers, const PageMakers& common) {
    std::vector<wxString> differences;
    if (makers.program != common.program)
        differences.push_back(wxString::Format("quillon %s", makers.program));
    if (makers.office != common.office)
        differences.push_back(makers.office);
    if (makers.pdf != common.pdf)
        differences.push_back(makers.pdf);
    if (makers.fonts != common.fonts)
        differences.push_back(_("other fonts"));
    return differences;
}

wxString ListOf(const std::vector<wxString>& parts) {
    wxString list;
    for (const wxString& part : parts)
        list << (list.empty() ? "" : ", ") << part;
    return list;
}

std::vector<wxString> TextsOf(const std::set<std::string>& extensions) {
    std::vector<wxString> texts;
    for (const std::string& extension : extensions)
        texts.push_back(wxString::FromUTF8(extension));
    return texts;
}

wxString WorkOf(const Machine& machine) {
    wxString work = machine.finds ? _("finds documents") : wxString();
    if (machine.makers.program.empty())
        return work;
    work << (work.empty() ? "" : ", ");
    return work << (machine.jobs > 0 ? wxString::Format(_("converts %u at a time"), machine.jobs)
                                     : _("converts as many at a time as pay"));
}

wxString LineOf(const Machine& machine, const PageMakers& common) {
    std::vector<wxString> parts = {WorkOf(machine)};
    if (machine.isAlive)
        parts.push_back(wxString::Format(_("%zu under way"), machine.running));
    else
        parts.push_back(wxString::Format(_("not heard of since %s"), LocalTime(machine.seen)));
    if (Works(machine) && !(machine.makers == common))
        parts.push_back(
            wxString::Format(_("differs: %s"), ListOf(DifferencesOf(machine.makers, common))));
    if (!machine.cannot.empty())
        parts.push_back(
            wxString::Format(_("has nothing to open %s with"), ListOf(TextsOf(machine.cannot))));
    if (!machine.obstacle.empty())
        parts.push_back(OneLine(machine.obstacle));
    return OneLine(machine.name) + ": " + ListOf(parts);
}

Json RecordOf(const Machine& machine, const PageMakers& common) {
    const bool differs = Works(machine) && !(machine.makers == common);
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
        if (!Works(machine))
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
    if (std::none_of(machines.begin(), machines.end(), Works))
        reporter.Line(_("No machine converts documents; `quillon serve` on one of them would."));
    else if (const auto extensions = OpenedByNone(machines); !extensions.empty())
        reporter.Line(wxString::Format(
            _("No machine has anything to open these with: %s. Such documents wait."),
            ListOf(extensions)));
}
