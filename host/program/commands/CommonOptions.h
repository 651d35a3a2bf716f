#pragma once

#include "host/program/settings/RunSettings.h"

#include <chrono>
#include <filesystem>
#include <functional>
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
    bool quiet = false;
    std::optional<std::string> logFile;
    std::optional<unsigned> stallSeconds;
    std::optional<unsigned> limitSeconds;
    unsigned memoryMegabytes = 3584; ///< for a document
    bool requireIsolation = false;
    std::optional<unsigned> engineDocuments; ///< until an engine is started anew
    std::optional<std::string> filtersFolder;
    std::optional<std::string> standInsFolder;
    std::vector<std::string>
        spoolerWords; ///< what stands behind `filter`, where a spooler calls it

    /// The folders to use, absolute.
    std::filesystem::path FiltersFolder() const;
    std::filesystem::path StandInsFolder() const;
};

/// @param options receives what is given, and outlives the parsing
void AddCommonOptions(CLI::App& program, CommonOptions& options);

/// The arguments that make this program a worker of a run.
std::vector<std::string> WorkerArguments(const CommonOptions& options);

/// How long a worker may give no sign of life.
std::chrono::seconds WorkerPatience(const CommonOptions& options);

// By these, most commands do without the headers of the command line's library, which take long.

/// Adds a command to the program's.
/// @param description for the help, which does not show the command when it is empty
/// @param choose is called when it is asked for
/// @return the command; the program's
CLI::App& AddSubcommand(CLI::App& program, const std::string& name, const std::string& description,
                        std::function<void()> choose);

/// Adds an option that has to be given.
/// @param type what its value is called in the help
/// @param value receives it, and outlives the parsing
void AddRequired(CLI::App& command, const std::string& name, const std::string& type,
                 const std::string& description, std::string& value);

/// Adds the files that a command works on.
/// @param paths receives what is given, and outlives the parsing
void AddPaths(CLI::App& command, std::vector<std::string>& paths);

/// Adds an option.
/// @param type what its value is called in the help
/// @param value receives it, and outlives the parsing
void AddOption(CLI::App& command, const std::string& name, const std::string& type,
               const std::string& description, std::optional<std::string>& value);

/// Adds an option without a value.
void AddFlag(CLI::App& command, const std::string& name, const std::string& description,
             bool& value);

/// Adds how many documents are converted at a time.
void AddJobs(CLI::App& command, std::optional<unsigned>& jobs);

/// How a run's output is printed by a print server.
struct PrintOptions {
    std::optional<std::string> queue; ///< without which it is not
    std::optional<std::string> server;
    std::vector<std::string> assignments; ///< NAME=VALUE
    bool waits = false;                   ///< until all is on paper
};

/// Adds those that have output printed, and the folder for it, which is needed without them only.
void AddOutputOptions(CLI::App& command, std::string& out, PrintOptions& print);

/// Adds those that say how documents are printed.
void AddSettingsOptions(CLI::App& command, SettingsOptions& options);
