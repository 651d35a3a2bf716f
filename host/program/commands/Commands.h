#pragma once

#include "host/program/CommandLine.h"
#include "host/program/ExitCode.h"
#include "host/program/Reporter.h"

#include <filesystem>

/// `quillon convert`: converts document by document, each screened right before, so that what
/// screening has loaded is still at hand.
ExitCode RunConvert(const CommandLine& line, const std::filesystem::path& filtersFolder,
                    Reporter& reporter);
