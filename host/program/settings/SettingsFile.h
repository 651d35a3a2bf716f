#pragma once

#include <wx/string.h>

#include <filesystem>
#include <map>

/// Values by key.
using SettingsValues = std::map<wxString, wxString>;

/// Stores values in a settings file, making it if it is not there. All else that the file holds
/// stays; the file is at any moment the whole old one or the whole new one.
/// @return empty when they are stored; else why they are not, for people
wxString StoreSettings(const std::filesystem::path& file, const SettingsValues& values);
