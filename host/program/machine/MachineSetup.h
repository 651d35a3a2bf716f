#pragma once

#include <filesystem>
#include <optional>

/// What the program enters into the machine before filters look at it.
struct MachineSetup {
    std::filesystem::path standInsFolder;
    /// How long an engine may show no sign of life, and what it prints not grow.
    std::optional<unsigned> stallSeconds;
    std::optional<unsigned> limitSeconds; ///< how long each may take altogether
    unsigned memoryMegabytes = 0;         ///< how much memory engines may take for a document
    bool examineEngine = false;           ///< whether to find out how the engine can be run
};

/// Enters where the program is installed, the engines' limits, the Office stand-ins and the file
/// printer. What fails is told by the log; filters then find it missing.
void SetUpMachine(const MachineSetup& setup);

/// Tells the Office stand-ins for how many documents of this process, one after the other, they are
/// to keep their engine started; 1 to start it for each, as they do when they are not told.
void KeepEngine(unsigned documents);
