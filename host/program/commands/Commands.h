#pragma once

#include "host/program/ExitCode.h"
#include "host/program/commands/CommandLine.h"
#include "host/program/report/Reporter.h"

#include <filesystem>

// The program's commands. Each answers with the code to end with.

/// `quillon status`: says what there is to convert with, and what is missing.
ExitCode RunStatus(const CommandLine& line, const std::filesystem::path& filtersFolder,
                   Reporter& reporter);

/// `quillon screen`: says of each file whether it can be converted.
ExitCode RunScreen(const CommandLine& line, const std::filesystem::path& filtersFolder,
                   Reporter& reporter);

/// `quillon convert`: converts documents into a folder.
ExitCode RunConvert(const CommandLine& line, const std::filesystem::path& filtersFolder,
                    Reporter& reporter);

/// `quillon settings`: shows the filters' settings panels in a window, and stores what is chosen.
/// Needs a GUI.
ExitCode RunSettings(const CommandLine& line, const std::filesystem::path& filtersFolder,
                     Reporter& reporter);

/// `quillon worker`: converts what another process of this program asks for; see WorkerPool.
ExitCode RunWorker(const std::filesystem::path& filtersFolder);
