#pragma once

#include "host/program/base/Fault.h"

#include <filesystem>
#include <optional>
#include <string>

/// Reads a file that people write settings into.
/// @param fault receives why there is no result, without the file's name
std::optional<std::string> ReadBounded(const std::filesystem::path& file, Fault& fault);
