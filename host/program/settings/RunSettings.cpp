#include "host/program/settings/RunSettings.h"

#include "common/WQServices.h"
#include "host/program/PathText.h"
#include "host/program/machine/Printers.h"

#include <algorithm>

namespace {

bool IsKnown(const wxString& key) {
    return std::any_of(KnownSettings().begin(), KnownSettings().end(),
                       [&key](const SettingsKey& known) { return key == known.name; });
}

/// @return whether the text is a setting
bool Apply(const std::string& assignment, Settings& settings, Obstacle& obstacle) {
    const std::optional<wxString> text = ToText(FromArgument(assignment));
    if (!text || text->find('=') == wxString::npos || text->StartsWith("=")) {
        obstacle = {ExitCode::WrongUsage,
                    "--set takes KEY=VALUE, not \"" + Shown(FromArgument(assignment)) + "\""};
        return false;
    }
    const wxString key = text->BeforeFirst('=');
    if (!IsKnown(key))
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "No filter is known to have a setting " << key << "; see quillon --help.";
    settings.Set(key, text->AfterFirst('='));
    return true;
}

wxString ListOf(const std::vector<Printer>& printers) {
    wxString names;
    for (const Printer& printer : printers)
        names << (names.empty() ? "\"" : ", \"") << printer.name << '"';
    return names.empty() ? wxString("none") : names;
}

/// @return whether the settings name a printer that there is
bool ChoosePrinter(Settings& settings, Obstacle& obstacle) {
    const std::vector<Printer> printers = ListPrinters();
    const wxString wanted = settings.Value("PRINTER");
    if (wanted.empty()) {
        const Printer* const preferred = PreferredPrinter(printers);
        if (!preferred)
            obstacle = {ExitCode::MachineAtFault,
                        "there is no PostScript printer; add one to the system"};
        else
            settings.Set("PRINTER", preferred->name);
        return preferred != nullptr;
    }
    if (std::any_of(printers.begin(), printers.end(),
                    [&wanted](const Printer& printer) { return printer.name == wanted; }))
        return true;
    obstacle = {ExitCode::WrongUsage,
                "there is no printer \"" + wanted + "\"; the printers are: " + ListOf(printers)};
    return false;
}

} // namespace

const std::vector<SettingsKey>& KnownSettings() {
    static const std::vector<SettingsKey> s_settings = {
        {"PRINTER", "name", "the printer to print on, as `quillon status` lists it"},
        {"OUTPUTFILETYPEPS", "1 0", "1: PostScript files"},
        {"OUTPUTFILETYPEPDF", "1 0", "1: PDF files are chosen in the settings panel"},
        {"SELECTEDDISTILLERPROFILE", "file name", "the job options for PDF files"},
        {"PRINTOUTPUTTYPE", "text", "Slides, Handouts, Notes Pages or Outline View"},
        {"COLOR", "text", "Color, Grayscale or Pure Black and White"},
        {"SLIDESPERPAGE", "1 2 3 4 6 9", "slides on a page of handouts"},
        {"HANDOUTSHORIZONTAL", "1 0", "1: slides of a handout run across the page"},
        {"HANDOUTSVERTICAL", "1 0", "1: slides of a handout run down the page"},
        {"SCALETOFITPAGE", "1 0", "1: slides are scaled to fit the page"},
        {"FRAMESLIDES", "1 0", "1: slides have a frame"},
        {"PRINTHIDDENSLIDES", "1 0", "1: hidden slides are printed"},
        {"PRINTCOMMENTSANDINKMARKUP", "1 0", "1: comments and ink are printed"},
        {"HIGHQUALITY", "1 0", "1: slides are printed in high quality"},
    };
    return s_settings;
}

std::optional<Settings> MakeRunSettings(const CommandLine& line, Obstacle& obstacle) {
    std::optional<Settings> settings = Settings();
    if (line.settingsFile) {
        wxString fault;
        settings = Settings::Load(FromArgument(*line.settingsFile), fault);
        if (!settings)
            obstacle = {ExitCode::WrongUsage, "the settings file " +
                                                  Shown(FromArgument(*line.settingsFile)) +
                                                  " cannot be used: " + fault};
    }
    if (!settings)
        return std::nullopt;
    for (const std::string& assignment : line.settings)
        if (!Apply(assignment, *settings, obstacle))
            return std::nullopt;
    if (line.printer)
        settings->Set("PRINTER", ToText(FromArgument(*line.printer)).value_or(wxString()));
    if (settings->Value("OUTPUTFILETYPEPS").empty())
        settings->Set("OUTPUTFILETYPEPS", "1");
    if (!ChoosePrinter(*settings, obstacle))
        return std::nullopt;
    return settings;
}
