#pragma once

namespace standins {

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
