#pragma once

#include <optional>
#include <string>
#include <vector>

enum class Command { Status, Screen, Convert, Settings, Worker };

/// What the command line asks for. Texts and paths are as they were given.
struct CommandLine {
    Command command = Command::Status;
    std::vector<std::string> paths; ///< of screen and convert

    std::string out;
    std::optional<std::string> printer;
    std::optional<std::string> settingsFile; ///< of convert and settings
    std::vector<std::string> settings;       ///< KEY=VALUE

    std::optional<bool> pdf; ///< true for PDF, false for PostScript only
    std::optional<std::string> profile;
    std::optional<unsigned> jobs; ///< documents at a time; as many as pay when it is not given

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
};

/// Reads the command line; answers a question for help, or a mistake, itself.
/// @param arguments without the program's name
/// @param exitCode receives the code to end with when there is no result
/// @return nothing when there is no command to run
std::optional<CommandLine> ReadCommandLine(const std::vector<std::string>& arguments,
                                           int& exitCode);
