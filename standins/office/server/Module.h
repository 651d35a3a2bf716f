#pragma once

#include <string>

namespace standins {

/// This module's full path.
std::wstring ModulePath();

/// The path of a program that stands beside this module.
std::string HelperPath(const std::string& name);

// What keeps the module in memory.

/// Counts one object (or lock) of this module for as long as it lives.
class ModuleUse {
public:
    ModuleUse();
    ~ModuleUse();
    ModuleUse(const ModuleUse&) = delete;
    ModuleUse& operator=(const ModuleUse&) = delete;
};

void LockModule(bool lock);
bool IsModuleInUse();

} // namespace standins
