#include "host/program/report/Readiness.h"

#include "host/program/machine/MissingParts.h"

#include <wx/intl.h>

namespace {

Fault Obstacle(const wxString& what, const wxString& advice = {}) {
    return {what, Blame::Machine, ConversionFailed, advice};
}

/// The extensions of the files that a filter is ready for and the machine can print.
wxArrayString ListConvertible(const FilterSet& filters) {
    wxArrayString extensions;
    for (const auto& filter : filters.Filters())
        for (const wxString& extension : filter->Extensions())
            if (filter->IsReady() && !FindMissingFor(extension))
                extensions.Add(extension);
    return extensions;
}

/// Why there is nothing that could be converted.
std::vector<Fault> FindObstacles(const FilterSet& filters) {
    std::vector<Fault> obstacles;
    if (filters.Filters().empty())
        obstacles.push_back(Obstacle(_("There is no filter"), _("Install the program anew")));
    for (const auto& part : {FindMissingOffice(), FindMissingPrinter()})
        if (part)
            obstacles.push_back(*part);
    if (!obstacles.empty())
        return obstacles;
    for (const auto& filter : filters.Filters()) {
        const wxString& name = filter->Info().identifier;
        obstacles.push_back(Obstacle(
            filter->IsReady()
                ? wxString::Format(_("The filter %s has no use for what is installed"), name)
                : wxString::Format(_("The filter %s is not ready: %s"), name,
                                   filter->Unreadiness())));
    }
    return obstacles;
}

} // namespace

std::optional<Fault> FindMissingFilter(const FilterSet& filters) {
    if (!filters.Filters().empty())
        return std::nullopt;
    return Obstacle(
        _("no filter could be loaded; `quillon status` shows where they are looked for. "
          "Install the program anew"));
}

std::set<std::string> FindUnopenable(const FilterSet& filters) {
    std::set<std::string> extensions;
    for (const std::string& extension : filters.Extensions()) {
        const auto application = ApplicationForExtension(wxString::FromUTF8(extension));
        if (application && FindMissingApplication(*application))
            extensions.insert(extension);
    }
    return extensions;
}

std::vector<Fault> FindMissing(const FilterSet& filters, bool requireIsolation) {
    std::vector<Fault> missing;
    if (ListConvertible(filters).empty())
        missing = FindObstacles(filters);
    if (const auto pdfMaker = FindMissingPdfMaker())
        missing.push_back(*pdfMaker);
    if (const auto isolation = FindMissingIsolation(); isolation && requireIsolation)
        missing.push_back(*isolation);
    return missing;
}

ExitCode TellReadiness(const FilterSet& filters, bool requireIsolation, Reporter& reporter) {
    const wxArrayString convertible = ListConvertible(filters);
    const std::vector<Fault> missing = FindMissing(filters, requireIsolation);
    for (const Fault& part : missing) {
        reporter.Line(wxString::Format(_("Missing: %s"), part.Text()));
        reporter.Record({{"type", "missing"},
                         {"text", JsonText(part.what)},
                         {"advice", JsonText(part.advice)}});
    }
    const ExitCode exitCode = missing.empty() ? ExitCode::Done : ExitCode::MachineAtFault;
    if (missing.empty())
        reporter.Line(wxString::Format(_("Ready to convert %s."), wxJoin(convertible, ' ', 0)));
    reporter.Record({{"type", "summary"},
                     {"convertible", JsonTexts(convertible)},
                     {"exitCode", static_cast<int>(exitCode)}});
    return exitCode;
}
