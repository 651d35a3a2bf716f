#pragma once

#include <wx/string.h>

#include <chrono>
#include <cstdint>
#include <optional>

// Times and sizes as people write them into a configuration.

/// @param text a whole number with its unit: "500ms", "2s", "5m", "2h" or "14d"
/// @return nothing when it is none, or too long to count
std::optional<std::chrono::milliseconds> ParseTime(const wxString& text);

/// @return nothing when it is none, or too much to count
/// @param text a whole number of bytes, or of multiples of 1024: "10K", "500M", "1G" or "2T"
std::optional<std::uintmax_t> ParseSize(const wxString& text);

/// The time with the largest unit in which it is a whole number, as ParseTime takes it.
wxString TimeText(std::chrono::milliseconds time);
/// The size likewise, as ParseSize takes it.
wxString SizeText(std::uintmax_t bytes);
