#pragma once

#include "standins/shared/Clocks.h"

#include <cstdint>
#include <string>

namespace standins {

/// Under HKEY_LOCAL_MACHINE the facts about the engine, entered by registration: "Engine", its name
/// and version, and "EnginePath", its program folder. Under HKEY_CURRENT_USER, or else
/// HKEY_LOCAL_MACHINE, the limits: the numbers "StallSeconds", "TotalSeconds" and
/// "MemoryMegabytes"; and under HKEY_CURRENT_USER the numbers "DocumentsPerStart" and "Examine".
/// With the latter, registration enters "KeepingObstacle" too, a text.
constexpr const wchar_t* SettingsKey = L"SOFTWARE\\Orvanta\\Office Stand-Ins";
constexpr const wchar_t* EngineValue = L"Engine";
constexpr const wchar_t* EnginePathValue = L"EnginePath";
constexpr const wchar_t* KeepingObstacleValue = L"KeepingObstacle";

/// The kind of the engine's work folders.
constexpr const char* OfficeFolderKind = "office";

/// How long a document may take.
TimeLimits ReadTimeLimits();

/// How much memory a document may take, in bytes.
std::uint64_t ReadMemoryLimit();

/// LibreOffice's program folder, as registration found it; empty when it found none.
std::string ReadEnginePath();

/// Whether registration is to find out how LibreOffice can be run, which takes a while.
bool ReadExamine();

/// For how many documents LibreOffice is kept once it is started; 1 when it is started for each.
unsigned ReadDocumentsPerStart();

} // namespace standins
