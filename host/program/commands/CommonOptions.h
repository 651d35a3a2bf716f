#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

namespace CLI {
class App;
} // namespace CLI

/// What every command may be told. Texts and paths are as they were given.
struct CommonOptions {
    std::optional<std::string> language;
    bool json = false;
    bool verbose = false;
    std::optional<std::string> logFile;
    std::optional<unsigned> stallSeconds;
    std::optional<unsigned> limitSeconds;
    unsigned memoryMegabytes = 3584; ///< for a document
    bool requireIsolation = false;
    std::optional<unsigned> engineDocuments; ///< until an engine is started anew
    std::optional<std::string> filtersFolder;
    std::optional<std::string> standInsFolder;

    /// The folders to use, absolute.
    std::filesystem::path FiltersFolder() const;
    std::filesystem::path StandInsFolder() const;
};

/// @param options receives what is given, and outlives the parsing
void AddCommonOptions(CLI::App& program, CommonOptions& options);

/// The options that a run hands on to its workers.
std::vector<std::string> OptionsForWorkers(const CommonOptions& options);

/// Adds the files that a command works on.
/// @param paths receives what is given, and outlives the parsing
void AddPaths(CLI::App& command, std::vector<std::string>& paths);
