#include "host/program/journal/Machines.h"

#include <wx/intl.h>

#include <algorithm>

bool Converts(const Machine& machine) {
    return machine.isAlive && !machine.makers.program.empty();
}

PageMakers CommonMakers(const std::vector<Machine>& machines) {
    const auto count = [&machines](const PageMakers& makers) {
        return std::count_if(machines.begin(), machines.end(), [&makers](const Machine& machine) {
            return Converts(machine) && machine.makers == makers;
        });
    };
    PageMakers common;
    for (const Machine& machine : machines)
        if (Converts(machine) && count(machine.makers) > count(common))
            common = machine.makers;
    return common;
}

std::vector<wxString> WorkOf(const Machine& machine, const Translation& text) {
    std::vector<wxString> work;
    if (machine.finds)
        work.push_back(text(wxTRANSLATE("finds documents")));
    if (machine.makers.program.empty())
        return work;
    work.push_back(machine.jobs > 0
                       ? wxString::Format(text(wxTRANSLATE("converts %u at a time")), machine.jobs)
                       : text(wxTRANSLATE("converts as many at a time as pay")));
    return work;
}

std::vector<wxString> DifferencesOf(const Machine& machine, const PageMakers& common,
                                    const Translation& text) {
    std::vector<wxString> differences;
    if (!Converts(machine))
        return differences;
    const PageMakers& makers = machine.makers;
    if (makers.program != common.program)
        differences.push_back(wxString::Format("quillon %s", makers.program));
    if (makers.office != common.office)
        differences.push_back(makers.office.empty() ? text(wxTRANSLATE("no Office application"))
                                                    : makers.office);
    if (makers.pdf != common.pdf)
        differences.push_back(makers.pdf.empty() ? text(wxTRANSLATE("no PDF")) : makers.pdf);
    if (makers.fonts != common.fonts)
        differences.push_back(text(wxTRANSLATE("other fonts")));
    return differences;
}

std::vector<Machine> WithoutReplaced(const std::vector<Machine>& machines) {
    const auto isReplaced = [&machines](const Machine& gone) {
        return !gone.isAlive &&
               std::any_of(machines.begin(), machines.end(), [&gone](const Machine& machine) {
                   return machine.started > gone.seen &&
                          machine.name.BeforeLast(':') == gone.name.BeforeLast(':');
               });
    };
    std::vector<Machine> others;
    std::remove_copy_if(machines.begin(), machines.end(), std::back_inserter(others), isReplaced);
    return others;
}
