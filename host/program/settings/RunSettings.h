#pragma once

#include "host/program/ExitCode.h"
#include "host/program/commands/CommandLine.h"
#include "host/program/settings/Settings.h"

#include <wx/string.h>

#include <optional>
#include <vector>

/// A setting that filters know.
struct SettingsKey {
    const char* name;
    const char* values;
    const char* meaning;
};

const std::vector<SettingsKey>& KnownSettings();

/// Why a run cannot begin.
struct Obstacle {
    ExitCode exitCode = ExitCode::WrongUsage;
    wxString text;
};

/// Fills in what the settings do not say: PDF output on the preferred printer, if there is one.
void FillIn(Settings& settings);

/// Puts together the settings of a run: the file's, the command line's in their place, and what
/// FillIn adds.
/// @param obstacle receives why there is no result
std::optional<Settings> MakeRunSettings(const CommandLine& line, Obstacle& obstacle);
