#include "host/program/base/PathText.h"
#include "host/program/commands/Command.h"
#include "host/program/settings/ChoiceTexts.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/window/SettingsDialogue.h"

#include <wx/intl.h>

namespace {

ExitCode Run(const std::filesystem::path& file, const CommonOptions& options, Reporter& reporter) {
    Fault fault;
    std::optional<Settings> settings = Settings::LoadForEditing(file, fault);
    if (settings && !IsText(file))
        fault = {_("its name is not valid UTF-8 text"), Blame::Usage};
    if (!settings || !IsText(file))
        return reporter.Error(UnusableSettings(file, fault));
    FillIn(*settings);
    TranslateChoices(*settings);
    const FilterSet filters(options.FiltersFolder());
    SettingsDialogue dialogue(filters, *settings, file);
    if (!dialogue.HasPanel())
        return reporter.Error(
            {_("no filter has settings to show; `quillon status` lists the filters"),
             Blame::Machine});
    const bool saved = dialogue.ShowModal() == wxID_SAVE;
    reporter.Line(saved ? wxString::Format(_("The settings are saved in %s."), Shown(file))
                        : _("The settings are left as they were."));
    return ExitCode::Done;
}

} // namespace

void AddSettings(CLI::App& program, Command& chosen) {
    const auto file = std::make_shared<std::string>();
    CLI::App& settings =
        AddSubcommand(program, "settings",
                      "Show the filters' settings in a window and change them:\n"
                      "quillon settings --settings FILE.xml",
                      [&chosen, file] {
                          chosen.showsWindows = true;
                          chosen.run = [file](const CommonOptions& options, Reporter& reporter) {
                              return Run(FromArgument(*file), options, reporter);
                          };
                      });
    AddRequired(settings, "--settings", "FILE.xml", "The file; if there is none, it is made",
                *file);
}
