#pragma once

#include "host/program/CommandLine.h"
#include "host/program/ExitCode.h"
#include "host/program/Reporter.h"

#include <filesystem>

/// `quillon screen`: says of each file whether it can be converted.
ExitCode RunScreen(const CommandLine& line, const std::filesystem::path& filtersFolder,
                   Reporter& reporter);
