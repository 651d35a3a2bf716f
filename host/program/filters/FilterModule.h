#pragma once

#include "plugin/interface/WQPlugin.h"

#include <wx/msw/wrapwin.h>

#include <filesystem>
#include <memory>

/// A module with the five functions that make it a filter, loaded and initialised for as long as
/// the object lives.
class FilterModule {
public:
    /// @return null when the file cannot be loaded or is no filter; the log says which
    static std::unique_ptr<FilterModule> Load(const std::filesystem::path& file);

    ~FilterModule();
    FilterModule(const FilterModule&) = delete;
    FilterModule& operator=(const FilterModule&) = delete;

    /// How the filter describes itself.
    PluginInfo Describe() const;

    /// @return a new object, or null; goes back to ReleaseInstance
    WQPlugin* NewInstance() const;
    void ReleaseInstance(WQPlugin* plugin) const;

private:
    explicit FilterModule(HMODULE module) : m_module(module) {}
    bool FindExports();

    HMODULE m_module;
    decltype(&InitializePlugin) m_initialize = nullptr;
    decltype(&GetPluginInfo) m_getInfo = nullptr;
    decltype(&GetPluginInstance) m_getInstance = nullptr;
    decltype(&ReleasePluginInstance) m_releaseInstance = nullptr;
    decltype(&UninitializePlugin) m_uninitialize = nullptr;
    bool m_initialized = false;
};
