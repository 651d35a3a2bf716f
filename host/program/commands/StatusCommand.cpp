#include "host/program/base/PathText.h"
#include "host/program/commands/Command.h"
#include "host/program/filters/FilterSet.h"
#include "host/program/machine/Engines.h"
#include "host/program/machine/FilePrinter.h"
#include "host/program/machine/MissingParts.h"
#include "host/program/report/Readiness.h"
#include "host/services/OneLine.h"
#include "machine/Distiller.h"
#include "machine/InstalledOffice.h"

#include <wx/intl.h>

namespace {

constexpr std::size_t NameColumn = 14;

wxString Entry(const wxString& name, const wxString& rest) {
    wxString line = "  " + OneLine(name);
    line.Pad(line.length() < NameColumn ? NameColumn - line.length() : 0);
    return line + "  " + OneLine(rest);
}

wxString OrNone(const wxString& text) {
    return "  " + (text.empty() ? _("none") : OneLine(text));
}

void TellFilter(const Filter& filter, Reporter& reporter) {
    const PluginInfo& info = filter.Info();
    const wxString fault = filter.Unreadiness();
    const wxString about = wxString::Format(_("%s, %s, for %s"), info.version, info.vendor,
                                            wxJoin(filter.Extensions(), ' ', 0));
    const wxString readiness =
        filter.IsReady() ? _("ready") : wxString::Format(_("not ready, %s"), fault);
    reporter.Line(Entry(info.identifier, about + ": " + readiness));
    reporter.Record({{"type", "filter"},
                     {"identifier", JsonText(info.identifier)},
                     {"version", JsonText(info.version)},
                     {"vendor", JsonText(info.vendor)},
                     {"extensions", JsonTexts(filter.Extensions())},
                     {"ready", filter.IsReady()},
                     {"text", JsonText(fault)}});
}

void TellFilters(const FilterSet& filters, const std::filesystem::path& folder,
                 Reporter& reporter) {
    reporter.Line(wxString::Format(_("Filters in %s"), Shown(folder)));
    if (filters.Filters().empty())
        reporter.Line(OrNone({}));
    for (const auto& filter : filters.Filters())
        TellFilter(*filter, reporter);
    reporter.Record({{"type", "folder"}, {"filters", folder.u8string()}});
}

/// How the application is there, on a line behind its name.
wxString Describe(OfficeApplication application, const wxString& version) {
    switch (InstallationOf(application)) {
    case OfficeInstallation::None:
        return _("not installed");
    case OfficeInstallation::TooOld:
        return _("of Office 97 or 2000, too old to be driven");
    case OfficeInstallation::Drivable:
        break;
    }
    const bool isLimited =
        application != OfficeApplication::Publisher && !ReadsOpenXml(application);
    const wxString found =
        version.empty() ? _("installed") : wxString::Format(_("version %s"), version);
    return isLimited ? wxString::Format(
                           _("%s, not for Office Open XML, which needs version 12 or later"), found)
                     : found;
}

void TellApplication(OfficeApplication application, Reporter& reporter) {
    const unsigned long number = RegisteredVersionOf(application);
    const wxString version = number ? wxString::Format("%lu", number) : wxString();
    const std::optional<Fault> missing = FindMissingApplication(application);
    const wxString advice = missing ? missing->advice : wxString();
    const wxString found = Describe(application, version);
    reporter.Line(Entry(NameOf(application),
                        advice.empty() ? found : wxString::Format(_("%s. %s"), found, advice)));
    reporter.Record({{"type", "application"},
                     {"name", NameOf(application)},
                     {"installed", IsInstalled(application)},
                     {"usable", !missing},
                     {"version", JsonText(version)},
                     {"advice", JsonText(advice)}});
}

void TellApplications(Reporter& reporter) {
    reporter.Line(_("Office applications"));
    for (const OfficeApplication application : AllOfficeApplications)
        TellApplication(application, reporter);
}

/// @return why the engine is started anew for each document; nothing when that is not known
std::optional<wxString> WhyNotKept(const CommonOptions& options) {
    return options.engineDocuments == 1U ? wxString("--engine-documents says so")
                                         : OfficeEngineKeepingObstacle();
}

void TellEngine(const CommonOptions& options, Reporter& reporter) {
    const wxString engine = OfficeEngine();
    reporter.Line(_("Engine"));
    reporter.Line(OrNone(engine));
    Json record = {{"type", "engine"}, {"version", JsonText(engine)}};
    if (const std::optional<wxString> obstacle = WhyNotKept(options)) {
        reporter.Line("  " + (obstacle->empty()
                                  ? wxString("kept started for the documents of a run")
                                  : "started anew for each document: " + OneLine(*obstacle)));
        record["kept"] = obstacle->empty();
        record["reason"] = JsonText(*obstacle);
    }
    reporter.Record(record);
}

void TellPrinters(Reporter& reporter) {
    reporter.Line(_("Printers"));
    const std::vector<Printer> printers = ListPrinters();
    const Printer* const preferred = PreferredPrinter(printers);
    if (printers.empty())
        reporter.Line(OrNone({}));
    for (const Printer& printer : printers) {
        const bool isPostScript = printer.IsPostScript();
        wxString kind = isPostScript ? wxString("PostScript") : _("not PostScript");
        if (printer.IsDistiller())
            kind += ", Acrobat Distiller";
        if (&printer == preferred)
            kind += ", " + (printer.IsDistiller() ? _("used whichever is chosen")
                                                  : _("used unless another is chosen"));
        reporter.Line(Entry(printer.name, kind));
        reporter.Record({{"type", "printer"},
                         {"name", JsonText(printer.name)},
                         {"driver", JsonText(printer.driver)},
                         {"postScript", isPostScript},
                         {"distiller", printer.IsDistiller()},
                         {"preferred", &printer == preferred}});
    }
}

void TellDistiller(Reporter& reporter) {
    const wxString engine = PdfEngine();
    const std::vector<wxString> profiles = ListDistillerProfiles();
    reporter.Line("Distiller");
    reporter.Line(OrNone(engine));
    for (const wxString& profile : profiles)
        reporter.Line("  " + wxString::Format(_("profile %s"), OneLine(profile)));
    reporter.Record(
        {{"type", "distiller"}, {"engine", JsonText(engine)}, {"profiles", JsonTexts(profiles)}});
}

void TellIsolation(unsigned memoryMegabytes, Reporter& reporter) {
    const std::optional<EngineIsolation> isolation = IsolationOfEngines();
    const wxString means = isolation ? isolation->means : wxString();
    const std::optional<Fault> missing = FindMissingIsolation();
    reporter.Line(_("Isolation"));
    reporter.Line("  " + OneLine(missing ? wxString::Format(_("incomplete: %s"), missing->what)
                                         : wxString::Format(_("full (%s)"), means)));
    if (isolation)
        reporter.Line(
            "  " + wxString::Format(_("at most %u MB of memory for a document"), memoryMegabytes));
    reporter.Record({{"type", "isolation"},
                     {"full", !missing},
                     {"means", JsonText(means)},
                     {"missing", JsonText(missing ? missing->what : wxString())},
                     {"memoryMegabytes", isolation ? Json(memoryMegabytes) : Json()}});
}

void TellPanel(const FilterSet& filters, Reporter& reporter) {
    const std::optional<Fault> obstacle = filters.Filters().empty()
                                              ? Fault{_("there is no filter"), Blame::Machine}
                                              : FindMissingForPanel();
    const wxString reason = obstacle ? obstacle->Text() : wxString();
    reporter.Line(_("Settings panel"));
    reporter.Line("  " +
                  (obstacle ? wxString::Format(_("disabled: %s"), reason) : _("can be used")));
    reporter.Record({{"type", "panel"}, {"enabled", !obstacle}, {"reason", JsonText(reason)}});
}

ExitCode Run(const CommonOptions& options, Reporter& reporter) {
    const std::filesystem::path folder = options.FiltersFolder();
    const FilterSet filters(folder);
    TellFilters(filters, folder, reporter);
    TellApplications(reporter);
    TellEngine(options, reporter);
    TellPrinters(reporter);
    TellDistiller(reporter);
    TellIsolation(options.memoryMegabytes, reporter);
    TellPanel(filters, reporter);
    return TellReadiness(filters, options.requireIsolation, reporter);
}

} // namespace

void AddStatus(CLI::App& program, Command& chosen) {
    AddSubcommand(program, "status", "Show what there is to convert with, and what is missing",
                  [&chosen] {
                      chosen.examinesEngine = true;
                      chosen.run = Run;
                  });
}
