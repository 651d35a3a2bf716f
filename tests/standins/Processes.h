#pragma once

#include <sys/types.h>

#include <chrono>
#include <filesystem>
#include <functional>
#include <set>
#include <string>
#include <vector>

/// The processes of the stand-ins whose work folder lies in a folder for temporary files: engines,
/// by their home folder, and supervisors, by their command line.
std::vector<pid_t> ProcessesOf(const std::filesystem::path& temporary);

/// What runs have left: work folders and processes in the folder for temporary files, unfinished
/// output among the files.
/// @return a line for each; empty when all is clean
std::string LeftoversOf(const std::filesystem::path& temporary, const std::filesystem::path& files);

/// Waits for an engine at work there.
/// @return 0 when none comes up
pid_t AwaitEngine(const std::filesystem::path& temporary);
/// Waits for a supervisor with an engine at work there.
pid_t AwaitSupervisor(const std::filesystem::path& temporary);

/// Waits until the condition holds.
/// @return false when it does not within the time
bool Await(const std::function<bool()>& condition,
           std::chrono::milliseconds patience = std::chrono::seconds(10));

/// The sockets of LibreOffice in the system's folder for temporary files that belong to nobody any
/// more: what engines leave there when they are killed.
std::set<std::string> SocketsOfKilledEngines();
