#pragma once

#include "plugin/settings/FilterSettings.h"

#include <wx/string.h>

#include <vector>

/// @return null when no filter is known to have a setting with the key
const Setting* FindSetting(const wxString& key);

/// @param text one of the setting's choices, in any installed language
/// @return null when it is none
const SettingChoice* FindChoice(const Setting& setting, const wxString& text);

/// What the setting can be set to, in English.
/// @return nothing where that depends on the machine
std::vector<wxString> ValuesOf(const Setting& setting);

/// Whether the setting can be set to the text: one of those, in any installed language.
bool Takes(const Setting& setting, const wxString& text);
