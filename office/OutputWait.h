#pragma once

#include <wx/string.h>

#include <chrono>

/// How a driver waits for the file that its application prints into. The application may return
/// from the print call before the spooler has written everything, so the file's size is watched
/// until two readings agree.
struct OutputWait {
    std::chrono::milliseconds pollInterval;
    /// Whether a file that cannot be read counts as empty, and two readings of 0 agree too; a later
    /// step then finds out. Otherwise a reading that fails changes nothing.
    bool emptyIsStable;
    /// How long a large file, which may pause while it grows, is left alone afterwards.
    std::chrono::seconds settleTimeOfLargeFile;
};

/// From this size on a file counts as large, in bytes.
constexpr unsigned long long LargeOutputSize = 9'000'000;

/// What bounds the wait for a file that never comes, or never stops growing, unless the host says
/// otherwise (machine/OutputClocks.h).
struct OutputWaitLimits {
    std::chrono::milliseconds withoutGrowth = std::chrono::minutes(2);
    std::chrono::milliseconds altogether = std::chrono::minutes(30);
};

/// The limits of all drivers, where the host says nothing. May be changed while no conversion runs.
OutputWaitLimits& GetOutputWaitLimits();

/// Waits until the file has stopped growing.
/// @param path the file; need not exist yet
/// @return false when a limit was reached first
bool WaitForOutput(const wxString& path, const OutputWait& wait);
