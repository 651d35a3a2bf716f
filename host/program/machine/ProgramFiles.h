#pragma once

#include <filesystem>
#include <vector>

/// The files directly in the folder with the ending of this system's modules, sorted by name.
/// A folder that is missing has none; a name that is no text is passed over.
std::vector<std::filesystem::path> ModuleFiles(const std::filesystem::path& folder);
