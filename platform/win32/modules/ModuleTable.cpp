#include "platform/win32/modules/ModuleTable.h"

#include <dlfcn.h>
#include <link.h>

#include <filesystem>

namespace win32 {

ModuleTable& ModuleTable::Instance() {
    static ModuleTable table;
    return table;
}

HMODULE ModuleTable::Enter(void* loaded, const std::string& path) {
    const auto module = static_cast<HMODULE>(loaded);
    m_modules.try_emplace(module, Entry{path, 0});
    return module;
}

HMODULE ModuleTable::Load(const std::string& path, std::string& reason) {
    const std::lock_guard lock(m_mutex);
    void* loaded = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (!loaded) {
        const char* message = dlerror();
        reason = message ? message : "unknown reason";
        return nullptr;
    }
    const HMODULE module = Enter(loaded, path);
    ++m_modules[module].references;
    return module;
}

HMODULE ModuleTable::FindLoaded(const std::string& path) {
    const std::lock_guard lock(m_mutex);
    void* loaded = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL | RTLD_NOLOAD);
    if (!loaded)
        return nullptr;
    dlclose(loaded); // it stays: somebody else loaded it
    return Enter(loaded, path);
}

HMODULE ModuleTable::FindByAddress(const void* address) {
    Dl_info info{};
    void* found = nullptr;
    if (dladdr1(address, &info, &found, RTLD_DL_LINKMAP) == 0 || !found)
        return nullptr;
    const auto* map = static_cast<const link_map*>(found);
    const std::string path = *map->l_name ? map->l_name : ProgramPath();
    const std::lock_guard lock(m_mutex);
    return Enter(found, path);
}

HMODULE ModuleTable::Program() {
    const std::lock_guard lock(m_mutex);
    void* program = dlopen(nullptr, RTLD_NOW | RTLD_NOLOAD);
    return Enter(program, ProgramPath());
}

std::optional<std::string> ModuleTable::PathOf(HMODULE module) {
    const std::lock_guard lock(m_mutex);
    const auto found = m_modules.find(module);
    if (found == m_modules.end())
        return std::nullopt;
    return found->second.path;
}

bool ModuleTable::Release(HMODULE module) {
    const std::lock_guard lock(m_mutex);
    const auto found = m_modules.find(module);
    if (found == m_modules.end())
        return false;
    Entry& entry = found->second;
    if (entry.references == 0)
        return true;
    const bool last = --entry.references == 0;
    const std::string path = entry.path;
    dlclose(module);
    if (last) {
        void* left = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL | RTLD_NOLOAD);
        if (left)
            dlclose(left);
        else
            m_modules.erase(found);
    }
    return true;
}

const std::string& ProgramPath() {
    static const std::string path = [] {
        std::error_code error;
        return std::filesystem::read_symlink("/proc/self/exe", error).string();
    }();
    return path;
}

} // namespace win32
