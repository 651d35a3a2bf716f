#pragma once

#include "host/program/commands/Command.h"

#include <optional>
#include <string>
#include <vector>

/// What the command line asks for.
struct CommandLine {
    CommonOptions options;
    Command command;
};

/// Reads the command line; answers a question for help, or a mistake, itself.
/// @param arguments without the program's name
/// @param exitCode receives the code to end with when there is no result
/// @return nothing when there is no command to run
std::optional<CommandLine> ReadCommandLine(std::vector<std::string> arguments, int& exitCode);
