#pragma once

#include <wx/string.h>
// After the strings, which it takes for granted.
#include <wx/msw/registry.h>

// The registry keys and values that the host shares with its filters and the stand-ins.

/// Under HKEY_LOCAL_MACHINE: the host itself. Filters find its folder there.
constexpr const char* HostKey = "SOFTWARE\\Orvanta\\Marlo Quillon";
constexpr const char* InstallPathValue = "InstallPath";

/// Under HKEY_LOCAL_MACHINE what the stand-ins say of themselves, under HKEY_CURRENT_USER what
/// they are told.
constexpr const char* StandInsKey = "SOFTWARE\\Orvanta\\Office Stand-Ins";
constexpr const char* DistillerStandInKey = "SOFTWARE\\Orvanta\\Distiller Stand-In";
constexpr const char* EngineValue = "Engine";             ///< name and version of the engine
constexpr const char* StallSecondsValue = "StallSeconds"; ///< a number
constexpr const char* TotalSecondsValue = "TotalSeconds"; ///< a number

/// @param valueName empty for the key's own value
/// @return the text; empty when there is none
wxString RegisteredText(wxRegKey::StdKey root, const wxString& keyName, const wxString& valueName);
