#pragma once

// The registry keys and values that the host shares with the stand-ins.

/// Under HKEY_LOCAL_MACHINE what the stand-ins say of themselves, under HKEY_CURRENT_USER what
/// they are told.
constexpr const char* StandInsKey = "SOFTWARE\\Orvanta\\Office Stand-Ins";
constexpr const char* DistillerStandInKey = "SOFTWARE\\Orvanta\\Distiller Stand-In";

/// Under HKEY_CURRENT_USER what they say of their last failure: why, and whether it is to be blamed
/// on the "document", the "machine" or someone "outside".
constexpr const char* LastFailureKey = "SOFTWARE\\Orvanta\\Stand-Ins\\Last Failure";
constexpr const char* FailureReasonValue = "Reason";
constexpr const char* FailureFaultValue = "Fault";

/// Under HKEY_LOCAL_MACHINE what keeps their engines from the rest of the machine, by its names,
/// and what is missing there.
constexpr const char* IsolationKey = "SOFTWARE\\Orvanta\\Stand-Ins\\Isolation";
constexpr const char* IsolationMeansValue = "Means";
constexpr const char* IsolationMissingValue = "Missing";

/// Under HKEY_CURRENT_USER the fonts that others stood in for: for each a line with the font asked
/// for, the one used, and "metric" where lines break alike, with tabs between.
constexpr const char* LastFontsKey = "SOFTWARE\\Orvanta\\Stand-Ins\\Last Fonts";
constexpr const char* FontsValue = "Fonts";

constexpr const char* EngineValue = "Engine"; ///< said: name and version of the engine
/// Said by the Office stand-ins when they are told to examine it: why their engine is started anew
/// for each document; empty when it is not.
constexpr const char* KeepingObstacleValue = "KeepingObstacle";

constexpr const char* StallSecondsValue = "StallSeconds"; ///< told: a number
constexpr const char* TotalSecondsValue = "TotalSeconds"; ///< told: a number
constexpr const char* MemoryValue = "MemoryMegabytes";    ///< told: a number
constexpr const char* ExamineValue = "Examine";           ///< told: a number, not 0 for yes
constexpr const char* DocumentsPerStartValue = "DocumentsPerStart"; ///< told: a number
/// Told the Distiller stand-in: where the profiles lie that it is asked for by name.
constexpr const char* UserProfilesValue = "UserProfiles";
constexpr const char* JobOptionsFolderValue = "JobOptionsFolder";
