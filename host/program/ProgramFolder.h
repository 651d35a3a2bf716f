#pragma once

#include <filesystem>

/// The folder of the program's file, beside which its parts lie: Filters, StandIns, Printers,
/// locale. No separator at its end.
std::filesystem::path ProgramFolder();
