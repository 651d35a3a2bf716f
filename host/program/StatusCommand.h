#pragma once

#include "host/program/ExitCode.h"
#include "host/program/Reporter.h"

#include <filesystem>

/// `quillon status`: says what there is to convert with, and what is missing.
ExitCode RunStatus(const std::filesystem::path& filtersFolder, Reporter& reporter);
