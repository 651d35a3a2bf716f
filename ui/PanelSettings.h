#pragma once

#include "plugin/settings/SettingsMap.h"

// Settings as the panels read and write them.

/// @return the setting's text; where it is missing or empty, `standard`. A missing one is entered
/// with an empty text.
inline wxString ReadText(SettingsMap& settings, const char* key, const wxString& standard) {
    const wxString& text = settings[key];
    return text.empty() ? standard : text;
}

/// @return whether the setting's text is "1"; where it is missing or empty, `standard`
inline bool ReadFlag(SettingsMap& settings, const char* key, bool standard) {
    const wxString& text = settings[key];
    return text.empty() ? standard : text == "1";
}

inline void WriteFlag(SettingsMap& settings, const char* key, bool flag) {
    settings[key] = wxString::Format("%d", flag ? 1 : 0);
}
