#pragma once

#include <filesystem>
#include <optional>

/// What the program enters into the machine before filters look at it.
struct MachineSetup {
    std::filesystem::path standInsFolder;
    std::optional<unsigned> stallSeconds; ///< how long an engine may show no sign of life
    std::optional<unsigned> limitSeconds; ///< how long an engine may take altogether
};

/// Enters where the program is installed, the engines' clocks, the Office stand-ins and the file
/// printer. What fails is told by the log; filters then find it missing.
void SetUpMachine(const MachineSetup& setup);
