#include "host/program/PathText.h"
#include "host/program/commands/Commands.h"
#include "host/program/filters/FilterSet.h"
#include "host/program/machine/Engines.h"
#include "host/program/machine/FilePrinter.h"
#include "host/program/machine/MissingParts.h"
#include "host/services/OneLine.h"
#include "machine/Distiller.h"
#include "machine/InstalledOffice.h"
#include "plugin/ResultCodes.h"

namespace {

constexpr std::size_t NameColumn = 14;

wxString Entry(const wxString& name, const wxString& rest) {
    wxString line = "  " + OneLine(name);
    line.Pad(line.length() < NameColumn ? NameColumn - line.length() : 0);
    return line + "  " + OneLine(rest);
}

wxString OrNone(const wxString& text) {
    return "  " + (text.empty() ? wxString("none") : OneLine(text));
}

template <typename Texts>
Json ListOf(const Texts& texts) {
    Json list = Json::array();
    for (const wxString& text : texts)
        list.push_back(JsonText(text));
    return list;
}

/// Why the filter is not ready, in its own words.
wxString Unreadiness(const Filter& filter) {
    return filter.IsReady() ? wxString() : filter.ErrorText(Result::NotInitialized);
}

void TellFilter(const Filter& filter, Reporter& reporter) {
    const PluginInfo& info = filter.Info();
    const wxString fault = Unreadiness(filter);
    reporter.Line(Entry(info.identifier, info.version + ", " + info.vendor + ", for " +
                                             wxJoin(filter.Extensions(), ' ', 0) + ": " +
                                             (filter.IsReady() ? "ready" : "not ready, " + fault)));
    reporter.Record({{"type", "filter"},
                     {"identifier", JsonText(info.identifier)},
                     {"version", JsonText(info.version)},
                     {"vendor", JsonText(info.vendor)},
                     {"extensions", ListOf(filter.Extensions())},
                     {"ready", filter.IsReady()},
                     {"text", JsonText(fault)}});
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

/// How the application is there, on a line behind its name.
wxString Describe(OfficeApplication application, const wxString& version) {
    switch (InstallationOf(application)) {
    case OfficeInstallation::None:
        return "not installed";
    case OfficeInstallation::TooOld:
        return "of Office 97 or 2000, too old to be driven";
    case OfficeInstallation::Drivable:
        break;
    }
    const bool isLimited =
        application != OfficeApplication::Publisher && !ReadsOpenXml(application);
    return (version.empty() ? wxString("installed") : "version " + version) +
           (isLimited ? ", not for Office Open XML, which needs version 12 or later" : "");
}

void TellApplication(OfficeApplication application, Reporter& reporter) {
    const unsigned long number = RegisteredVersionOf(application);
    const wxString version = number ? wxString::Format("%lu", number) : wxString();
    const std::optional<MissingPart> missing = FindMissingApplication(application);
    const wxString advice = missing ? missing->advice : wxString();
    reporter.Line(Entry(NameOf(application), Describe(application, version) +
                                                 (advice.empty() ? advice : ". " + advice)));
    reporter.Record({{"type", "application"},
                     {"name", NameOf(application)},
                     {"installed", IsInstalled(application)},
                     {"usable", !missing},
                     {"version", JsonText(version)},
                     {"advice", JsonText(advice)}});
}

void TellApplications(Reporter& reporter) {
    reporter.Line("Office applications");
    for (const OfficeApplication application : AllOfficeApplications)
        TellApplication(application, reporter);
    const wxString engine = OfficeEngine();
    reporter.Line("Engine");
    reporter.Line(OrNone(engine));
    reporter.Record({{"type", "engine"}, {"version", JsonText(engine)}});
}

void TellPrinters(Reporter& reporter) {
    reporter.Line("Printers");
    const std::vector<Printer> printers = ListPrinters();
    const Printer* const preferred = PreferredPrinter(printers);
    if (printers.empty())
        reporter.Line("  none");
    for (const Printer& printer : printers) {
        const bool isPostScript = printer.IsPostScript();
        wxString kind = isPostScript ? "PostScript" : "not PostScript";
        if (printer.IsDistiller())
            kind += ", Acrobat Distiller";
        if (&printer == preferred)
            kind += printer.IsDistiller() ? ", used whichever is chosen"
                                          : ", used unless another is chosen";
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
        reporter.Line("  profile " + OneLine(profile));
    reporter.Record(
        {{"type", "distiller"}, {"engine", JsonText(engine)}, {"profiles", ListOf(profiles)}});
}

void TellPanel(const FilterSet& filters, Reporter& reporter) {
    const wxString obstacle = filters.Filters().empty() ? "there is no filter" : PanelObstacle();
    reporter.Line("Settings panel");
    reporter.Line("  " + (obstacle.empty() ? wxString("can be used") : "disabled: " + obstacle));
    reporter.Record(
        {{"type", "panel"}, {"enabled", obstacle.empty()}, {"reason", JsonText(obstacle)}});
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
std::vector<MissingPart> FindObstacles(const FilterSet& filters) {
    std::vector<MissingPart> obstacles;
    if (filters.Filters().empty())
        obstacles.push_back({"There is no filter", "Install the program anew"});
    for (const auto& part : {FindMissingOffice(), FindMissingPrinter()})
        if (part)
            obstacles.push_back(*part);
    if (!obstacles.empty())
        return obstacles;
    for (const auto& filter : filters.Filters()) {
        const wxString fault = filter->IsReady() ? wxString("has no use for what is installed")
                                                 : "is not ready: " + Unreadiness(*filter);
        obstacles.push_back({"The filter " + filter->Info().identifier + ' ' + fault, {}});
    }
    return obstacles;
}

ExitCode TellReadiness(const FilterSet& filters, Reporter& reporter) {
    const wxArrayString convertible = ListConvertible(filters);
    std::vector<MissingPart> missing;
    if (convertible.empty())
        missing = FindObstacles(filters);
    if (const auto pdfMaker = FindMissingPdfMaker())
        missing.push_back(*pdfMaker);
    for (const MissingPart& part : missing) {
        reporter.Line("Missing: " + part.Text());
        reporter.Record({{"type", "missing"},
                         {"text", JsonText(part.what)},
                         {"advice", JsonText(part.advice)}});
    }
    const ExitCode exitCode = missing.empty() ? ExitCode::Done : ExitCode::MachineAtFault;
    if (missing.empty())
        reporter.Line("Ready to convert " + wxJoin(convertible, ' ', 0) + '.');
    reporter.Record({{"type", "summary"},
                     {"convertible", ListOf(convertible)},
                     {"exitCode", static_cast<int>(exitCode)}});
    return exitCode;
}

} // namespace

ExitCode RunStatus(const std::filesystem::path& filtersFolder, Reporter& reporter) {
    const FilterSet filters(filtersFolder);
    TellFilters(filters, filtersFolder, reporter);
    TellApplications(reporter);
    TellPrinters(reporter);
    TellDistiller(reporter);
    TellPanel(filters, reporter);
    return TellReadiness(filters, reporter);
}
