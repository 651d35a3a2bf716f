#pragma once

#include "standins/process/Clocks.h"

#include <cstdint>
#include <string>

namespace standins {

/// Under HKEY_LOCAL_MACHINE the facts about the engine, entered by registration: "Engine", its name
/// and version, and "EnginePath", its program folder. Under HKEY_CURRENT_USER, or else
/// HKEY_LOCAL_MACHINE, the limits: the numbers "StallSeconds", "TotalSeconds" and
/// "MemoryMegabytes".
constexpr const wchar_t* SettingsKey = L"SOFTWARE\\Orvanta\\Office Stand-Ins";
constexpr const wchar_t* EngineValue = L"Engine";
constexpr const wchar_t* EnginePathValue = L"EnginePath";

/// How long a document may take.
TimeLimits ReadTimeLimits();

/// How much memory a document may take, in bytes.
std::uint64_t ReadMemoryLimit();

/// LibreOffice's program folder, as registration found it; empty when it found none.
std::string ReadEnginePath();

} // namespace standins
