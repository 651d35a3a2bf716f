#pragma once

#include "host/program/base/Fault.h"

#include <cstdint>
#include <filesystem>
#include <optional>
#include <vector>

/// What is said when a folder's file system has less room than a document may want.
/// @param free and wanted in bytes
Fault NoSpaceIn(const std::filesystem::path& folder, std::uintmax_t free, std::uintmax_t wanted);

/// @param folders a file system that cannot be asked counts as having room
/// @return the first one that has less than is wanted
std::optional<Fault> FindShortage(const std::vector<std::filesystem::path>& folders,
                                  std::uintmax_t wanted);
