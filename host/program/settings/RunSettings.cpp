#include "host/program/settings/RunSettings.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/machine/FilePrinter.h"
#include "host/program/settings/KnownSettings.h"
#include "machine/Distiller.h"

#include <wx/intl.h>

#include <algorithm>

namespace {

/// @return whether the text is a setting
bool Apply(const std::string& assignment, Settings& settings, Fault& fault) {
    const wxString text = ToText(FromArgument(assignment));
    if (text.find('=') == wxString::npos || text.StartsWith("=")) {
        fault = {wxString::Format(_("--set takes KEY=VALUE, not \"%s\""),
                                  Shown(FromArgument(assignment))),
                 Blame::Usage};
        return false;
    }
    const wxString key = text.BeforeFirst('=');
    if (!FindSetting(key))
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "No filter is known to have a setting " << key << "; see quillon --help.";
    settings.Set(key, text.AfterFirst('='));
    return true;
}

wxString ListOf(const std::vector<wxString>& names) {
    wxString list;
    for (const wxString& name : names)
        list << (list.empty() ? "\"" : ", \"") << name << '"';
    return list.empty() ? _("none") : list;
}

/// @return whether the settings name a printer that there is
bool CheckPrinter(const Settings& settings, Fault& fault) {
    const wxString wanted = settings.Value(FilterSettings::Printer.key);
    std::vector<wxString> names;
    for (const Printer& printer : ListPrinters())
        names.push_back(printer.name);
    if (std::find(names.begin(), names.end(), wanted) != names.end())
        return true;
    if (wanted.empty())
        fault = {_("there is no PostScript printer; add one to the system"), Blame::Machine};
    else
        fault = {wxString::Format(_("there is no printer \"%s\"; the printers are: %s"), wanted,
                                  ListOf(names)),
                 Blame::Usage};
    return false;
}

/// The profile's listed name, where a user may have left out its ending.
/// @return empty when there is no such profile
wxString FindProfile(const wxString& wanted, const std::vector<wxString>& names) {
    const auto isMeant = [&wanted](const wxString& name) {
        return name.Contains(".") && name.BeforeLast('.').IsSameAs(wanted, false);
    };
    if (wanted.empty() || std::find(names.begin(), names.end(), wanted) != names.end())
        return wanted;
    const auto meant = std::find_if(names.begin(), names.end(), isMeant);
    return meant == names.end() ? wxString() : *meant;
}

/// @return whether the settings name a profile that there is, or none
bool CheckProfile(const Settings& settings, Fault& fault) {
    const wxString wanted = settings.Value(FilterSettings::DistillerProfile.key);
    const std::vector<wxString> names = ListDistillerProfiles();
    if (wanted.empty() || !FindProfile(wanted, names).empty())
        return true;
    fault = {wxString::Format(_("there is no Distiller profile \"%s\"; the profiles are: %s"),
                              wanted, ListOf(names)),
             Blame::Usage};
    return false;
}

void ApplyOptions(const SettingsOptions& options, Settings& settings) {
    const auto text = [](const std::string& argument) {
        return Shown(FromArgument(argument)); // what is no text is no name either
    };
    if (options.printer)
        settings.Set(FilterSettings::Printer.key, text(*options.printer));
    if (options.profile)
        settings.Set(FilterSettings::DistillerProfile.key, text(*options.profile));
    if (options.pdf) {
        settings.Set(FilterSettings::OutputPS.key, *options.pdf ? "0" : "1");
        settings.Set(FilterSettings::OutputPDF.key, *options.pdf ? "1" : "0");
    }
}

} // namespace

void FillIn(Settings& settings) {
    const auto fill = [&settings](const Setting& setting, const wxString& value) {
        if (settings.Value(setting.key).empty() && !value.empty())
            settings.Set(setting.key, value);
    };
    const std::vector<Printer> printers = ListPrinters();
    if (const Printer* const preferred = PreferredPrinter(printers))
        fill(FilterSettings::Printer, preferred->name);
    const wxString pdf = settings.Value(FilterSettings::OutputPDF.key);
    fill(FilterSettings::OutputPS, pdf.empty() || pdf == "1" ? "0" : "1");
    fill(FilterSettings::OutputPDF,
         settings.Value(FilterSettings::OutputPS.key) == "1" ? "0" : "1");
    fill(FilterSettings::HandoutsHorizontal,
         settings.Value(FilterSettings::HandoutsVertical.key) == "1" ? "0" : "1");
    for (const Setting* const setting : FilterSettings::All)
        fill(*setting, setting->standard);
    const wxString profile =
        FindProfile(settings.Value(FilterSettings::DistillerProfile.key), ListDistillerProfiles());
    if (!profile.empty())
        settings.Set(FilterSettings::DistillerProfile.key, profile);
}

Fault UnusableSettings(const std::filesystem::path& file, const Fault& fault) {
    return {
        wxString::Format(_("the settings file %s cannot be used: %s"), Shown(file), fault.Text()),
        Blame::Usage};
}

std::optional<Settings> MakeRunSettings(const SettingsOptions& options, Fault& fault) {
    std::optional<Settings> settings = Settings();
    if (options.file) {
        settings = Settings::Load(FromArgument(*options.file), fault);
        if (!settings)
            fault = UnusableSettings(FromArgument(*options.file), fault);
    }
    if (!options.file && options.text)
        settings = Settings::FromXml(*options.text, fault);
    if (!settings)
        return std::nullopt;
    for (const std::string& assignment : options.assignments)
        if (!Apply(assignment, *settings, fault))
            return std::nullopt;
    ApplyOptions(options, *settings);
    FillIn(*settings);
    const bool takesProfile =
        options.profile || settings->Value(FilterSettings::OutputPS.key) != "1";
    if (!CheckPrinter(*settings, fault) || (takesProfile && !CheckProfile(*settings, fault)))
        return std::nullopt;
    return settings;
}
