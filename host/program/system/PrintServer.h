#pragma once

#include <chrono>
#include <filesystem>
#include <map>
#include <optional>
#include <string>
#include <system_error>

/// The print server of the system, which has documents converted as it spools them.
namespace PrintServer {

/// Where it looks for what others add to it.
struct Folders {
    std::filesystem::path root; ///< types of documents, and what converts them
    std::filesystem::path bin;  ///< has a folder "filter" of programs that do
};

/// @return nothing where there is no print server
std::optional<Folders> FindFolders();

/// What its administrator does to have it take in what has been added or taken out.
const char* ReloadCommand();

/// The options of a job, by name, as it hands them to a filter.
std::map<std::string, std::string> ParseOptions(const std::string& options);

/// Reads what has come on standard input, and waits for it.
/// @param error receives why nothing more can be read
/// @return empty at its end; nothing when the time is up before, or nothing can be read
std::optional<std::string> ReadInput(std::chrono::milliseconds longest, std::error_code& error);

} // namespace PrintServer
