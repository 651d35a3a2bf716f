#include "host/program/PathText.h"
#include "host/program/commands/Commands.h"
#include "host/program/settings/ChoiceTexts.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/window/SettingsDialogue.h"

#include <wx/intl.h>

ExitCode RunSettings(const CommandLine& line, const std::filesystem::path& filtersFolder,
                     Reporter& reporter) {
    const std::filesystem::path file = FromArgument(*line.settingsFile);
    wxString fault;
    std::optional<Settings> settings = Settings::LoadForEditing(file, fault);
    if (!settings || !ToText(file)) {
        reporter.Error(
            UnusableSettings(file, settings ? _("its name is not valid UTF-8 text") : fault));
        return ExitCode::WrongUsage;
    }
    FillIn(*settings);
    TranslateChoices(*settings);
    const FilterSet filters(filtersFolder);
    SettingsDialogue dialogue(filters, *settings, file);
    if (!dialogue.HasPanel()) {
        reporter.Error(_("no filter has settings to show; `quillon status` lists the filters"));
        return ExitCode::MachineAtFault;
    }
    const bool saved = dialogue.ShowModal() == wxID_SAVE;
    reporter.Line(saved ? wxString::Format(_("The settings are saved in %s."), Shown(file))
                        : _("The settings are left as they were."));
    return ExitCode::Done;
}
