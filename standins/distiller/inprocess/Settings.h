#pragma once

namespace standins {

/// Under HKEY_LOCAL_MACHINE the engine's name and version, "Engine", entered by registration. Under
/// HKEY_CURRENT_USER the folders of profiles, entered by the host; there, or else under
/// HKEY_LOCAL_MACHINE, the limits: the numbers "StallSeconds", "TotalSeconds" and
/// "MemoryMegabytes".
constexpr const wchar_t* DistillerSettingsKey = L"SOFTWARE\\Orvanta\\Distiller Stand-In";
constexpr const wchar_t* DistillerEngineValue = L"Engine";
constexpr const wchar_t* UserProfilesValue = L"UserProfiles";
constexpr const wchar_t* JobOptionsFolderValue = L"JobOptionsFolder";

/// The kind of the engine's work folders.
constexpr const char* DistillerFolderKind = "distiller";

} // namespace standins
