#pragma once

#include <filesystem>

/// The folder, which may be missing, in which programs keep for this user what is to outlive them.
std::filesystem::path UserStateFolder();

/// The configuration of the folders that this machine watches.
/// @return empty where the system has no place for it
std::filesystem::path MachineConfiguration();
