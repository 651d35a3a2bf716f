#pragma once

#include <filesystem>

/// Lets the Office stand-ins of a folder enter themselves as COM servers, where the system has no
/// Office of its own. They enter the applications that their engine is there for.
void RegisterStandIns(const std::filesystem::path& folder);
