#pragma once

#include "host/program/base/Fault.h"
#include "host/program/settings/Settings.h"

#include <wx/string.h>

#include <optional>
#include <string>
#include <vector>

/// Fills in what the settings do not say: PDF output on the preferred printer, if there is one,
/// and the standard values. So a window shows what a conversion with these settings does. Completes
/// the profile's name where a user has left out its ending.
void FillIn(Settings& settings);

/// What is said of a settings file that cannot be used.
Fault UnusableSettings(const std::filesystem::path& file, const Fault& fault);

/// What a command line says of the settings. Texts and paths are as they were given.
struct SettingsOptions {
    std::optional<std::string> file;
    std::optional<std::string> text;      ///< what it says, where the file is not there
    std::vector<std::string> assignments; ///< KEY=VALUE
    std::optional<std::string> printer;
    std::optional<bool> pdf; ///< true for PDF, false for PostScript only
    std::optional<std::string> profile;
};

/// Puts together the settings of a run: the file's, the command line's in their place, and what
/// FillIn adds.
/// @param fault receives why there is no result
std::optional<Settings> MakeRunSettings(const SettingsOptions& options, Fault& fault);
