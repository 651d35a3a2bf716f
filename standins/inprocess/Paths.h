#pragma once

#include <string>
#include <vector>

namespace standins {

/// This module's full path.
std::wstring ModulePath();

/// The path of a program that the module brings along.
/// @param name relative to the folder in which the module's file lies
std::string HelperPath(const std::string& name);

/// The folders in which a shell looks for programs, in its order: those of PATH, or the usual ones
/// when it is not set.
std::vector<std::string> SearchPath();

} // namespace standins
