#pragma once

#include <string>

namespace standins {

/// This module's full path.
std::wstring ModulePath();

/// The path of a program that the module brings along.
/// @param name relative to the folder in which the module's file lies
std::string HelperPath(const std::string& name);

} // namespace standins
