#pragma once

#include "host/program/base/Fault.h"

#include <filesystem>
#include <map>
#include <optional>

/// Values by key.
using SettingsValues = std::map<wxString, wxString>;

/// Stores values in a settings file, making it if it is not there. All else that the file holds
/// stays; the file is at any moment the whole old one or the whole new one.
/// @return why they are not stored
std::optional<Fault> StoreSettings(const std::filesystem::path& file, const SettingsValues& values);
