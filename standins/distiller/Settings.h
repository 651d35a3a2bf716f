#pragma once

namespace standins {

/// Under HKEY_LOCAL_MACHINE the engine's name and version, "Engine", entered by registration. Under
/// HKEY_CURRENT_USER, or else HKEY_LOCAL_MACHINE, the limits: the numbers "StallSeconds" and
/// "TotalSeconds".
constexpr const wchar_t* DistillerSettingsKey = L"SOFTWARE\\Orvanta\\Distiller Stand-In";
constexpr const wchar_t* DistillerEngineValue = L"Engine";

/// The kind of the engine's work folders.
constexpr const char* DistillerFolderKind = "distiller";

} // namespace standins
