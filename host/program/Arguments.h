#pragma once

#include <string>
#include <vector>

/// The program's arguments without its own name, as UTF-8, or as whatever bytes the system has let
/// into a file name.
std::vector<std::string> Arguments(int argc, const char* const* argv);
