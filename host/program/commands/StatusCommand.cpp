#include "host/program/PathText.h"
#include "host/program/commands/Commands.h"
#include "host/program/filters/FilterSet.h"
#include "host/program/machine/MachineStatus.h"
#include "host/services/OneLine.h"

namespace {

constexpr std::size_t NameColumn = 14;

wxString Entry(const wxString& name, const wxString& rest) {
    wxString line = "  " + OneLine(name);
    line.Pad(line.length() < NameColumn ? NameColumn - line.length() : 0);
    return line + "  " + OneLine(rest);
}

void TellFilter(const Filter& filter, Reporter& reporter) {
    const PluginInfo& info = filter.Info();
    const wxString readiness = filter.IsReady() ? "ready" : "not ready";
    reporter.Line(Entry(info.identifier, info.version + ", " + info.vendor + ", for " +
                                             wxJoin(info.extensions, ' ', 0) + ": " + readiness));
    Json record = {{"type", "filter"},
                   {"identifier", JsonText(info.identifier)},
                   {"version", JsonText(info.version)},
                   {"vendor", JsonText(info.vendor)},
                   {"extensions", Json::array()},
                   {"ready", filter.IsReady()}};
    for (const wxString& extension : info.extensions)
        record["extensions"].push_back(JsonText(extension));
    reporter.Record(record);
}

void TellFilters(const FilterSet& filters, const std::filesystem::path& folder,
                 Reporter& reporter) {
    reporter.Line("Filters in " + Shown(folder));
    if (filters.Filters().empty())
        reporter.Line("  none");
    for (const auto& filter : filters.Filters())
        TellFilter(*filter, reporter);
    reporter.Record({{"type", "folder"}, {"filters", folder.u8string()}});
}

void TellApplications(const MachineStatus& status, Reporter& reporter) {
    reporter.Line("Office applications");
    for (const OfficeApplication& application : status.applications) {
        const wxString version =
            application.version.empty() ? wxString("installed") : "version " + application.version;
        const wxString absence = application.advice.empty()
                                     ? wxString("not installed")
                                     : "not installed. " + application.advice;
        reporter.Line(Entry(application.name, application.installed ? version : absence));
        reporter.Record({{"type", "application"},
                         {"name", JsonText(application.name)},
                         {"installed", application.installed},
                         {"version", JsonText(application.version)},
                         {"advice", JsonText(application.advice)}});
    }
    reporter.Line("Engine");
    reporter.Line("  " + (status.engine.empty() ? wxString("none") : OneLine(status.engine)));
    reporter.Record({{"type", "engine"}, {"version", JsonText(status.engine)}});
}

void TellPrinters(const MachineStatus& status, Reporter& reporter) {
    reporter.Line("Printers");
    const Printer* const preferred = PreferredPrinter(status.printers);
    if (status.printers.empty())
        reporter.Line("  none");
    for (const Printer& printer : status.printers) {
        wxString kind = printer.isPostScript ? "PostScript" : "not PostScript";
        if (printer.isDistiller)
            kind += ", Acrobat Distiller";
        if (&printer == preferred)
            kind += ", used unless another is chosen";
        reporter.Line(Entry(printer.name, kind));
        reporter.Record({{"type", "printer"},
                         {"name", JsonText(printer.name)},
                         {"driver", JsonText(printer.driver)},
                         {"postScript", printer.isPostScript},
                         {"distiller", printer.isDistiller},
                         {"preferred", &printer == preferred}});
    }
}

void TellDistiller(const MachineStatus& status, Reporter& reporter) {
    reporter.Line("Distiller");
    reporter.Line("  " + (status.pdfEngine.empty() ? wxString("none") : OneLine(status.pdfEngine)));
    Json record = {
        {"type", "distiller"}, {"engine", JsonText(status.pdfEngine)}, {"profiles", Json::array()}};
    for (const wxString& profile : status.profiles) {
        reporter.Line("  profile " + OneLine(profile));
        record["profiles"].push_back(JsonText(profile));
    }
    reporter.Record(record);
}

void TellPanel(const MachineStatus& status, Reporter& reporter) {
    reporter.Line("Settings panel");
    const wxString& obstacle = status.panelObstacle;
    reporter.Line("  " + (obstacle.empty() ? wxString("can be used") : "disabled: " + obstacle));
    reporter.Record(
        {{"type", "panel"}, {"enabled", obstacle.empty()}, {"reason", JsonText(obstacle)}});
}

ExitCode TellMissing(std::vector<MissingPart> missing, bool hasFilter, Reporter& reporter) {
    if (!hasFilter)
        missing.push_back({"There is no filter", "Install the program anew"});
    for (const MissingPart& part : missing) {
        reporter.Line("Missing: " + part.what + ". " + part.advice);
        reporter.Record({{"type", "missing"},
                         {"text", JsonText(part.what)},
                         {"advice", JsonText(part.advice)}});
    }
    if (!missing.empty())
        return ExitCode::MachineAtFault;
    reporter.Line("Ready to convert.");
    return ExitCode::Done;
}

} // namespace

ExitCode RunStatus(const std::filesystem::path& filtersFolder, Reporter& reporter) {
    const FilterSet filters(filtersFolder);
    const MachineStatus status = LookAtMachine();
    TellFilters(filters, filtersFolder, reporter);
    TellApplications(status, reporter);
    TellPrinters(status, reporter);
    TellDistiller(status, reporter);
    TellPanel(status, reporter);
    return TellMissing(status.missing, !filters.Filters().empty(), reporter);
}
