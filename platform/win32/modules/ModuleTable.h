#pragma once

#include <windows.h>

#include <map>
#include <mutex>
#include <optional>
#include <string>

namespace win32 {

/// The modules that the process was given handles of. A handle is the dynamic loader's own; the
/// table tells good ones from others, which the loader does not.
class ModuleTable {
public:
    static ModuleTable& Instance();

    /// Loads the module, or adds a reference when it is loaded.
    /// @param path in UTF-8
    /// @return null when the loader refuses; `reason` is then its message
    HMODULE Load(const std::string& path, std::string& reason);

    /// The module that is loaded from `path`, without a new reference; null when there is none.
    HMODULE FindLoaded(const std::string& path);

    /// The module whose code or data is at `address`, without a new reference; null when there is
    /// none.
    HMODULE FindByAddress(const void* address);

    HMODULE Program();

    /// @return the module's full path in UTF-8; nothing when `module` is no module's handle
    std::optional<std::string> PathOf(HMODULE module);

    /// Gives a reference of Load back; the last unloads the module. Modules that came with the
    /// program stay.
    /// @return false when `module` is no module's handle
    bool Release(HMODULE module);

private:
    struct Entry {
        std::string path;
        unsigned references = 0;
    };
    HMODULE Enter(void* loaded, const std::string& path);

    std::mutex m_mutex;
    std::map<HMODULE, Entry> m_modules;
};

/// The full path of the program, in UTF-8.
const std::string& ProgramPath();

} // namespace win32
