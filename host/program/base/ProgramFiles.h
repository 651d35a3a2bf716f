#pragma once

#include <filesystem>
#include <vector>

/// The program's own file.
std::filesystem::path ProgramFile();

/// The folder of the program's file, beside which its parts lie: Filters, StandIns, Printers,
/// locale. No separator at its end.
std::filesystem::path ProgramFolder();

/// The files directly in the folder with the ending of this system's modules, sorted by name.
/// A folder that is missing has none; a name that is no text is passed over.
std::vector<std::filesystem::path> ModuleFiles(const std::filesystem::path& folder);
