#pragma once

#include <optional>
#include <string>
#include <vector>

namespace standins {

/// The folders with Distiller's profiles, as the host has handed them over: the user's own, then
/// the installed ones.
std::vector<std::string> ProfileFolders();

/// Looks for a profile in the folders and in all that lies below them.
/// @param name the file's name, with its extension and without a folder
/// @return the full path; of two files with the same name, that of the first
std::optional<std::string> FindProfile(const std::string& name);

} // namespace standins
