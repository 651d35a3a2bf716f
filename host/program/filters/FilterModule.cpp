#include "host/program/filters/FilterModule.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"

namespace {

template <typename Function>
bool Find(HMODULE module, const char* name, Function& function) {
    // By way of a function without arguments: the loader does not know more of it.
    function =
        reinterpret_cast<Function>(reinterpret_cast<void (*)()>(GetProcAddress(module, name)));
    return function != nullptr;
}

} // namespace

std::unique_ptr<FilterModule> FilterModule::Load(const std::filesystem::path& file) {
    const HMODULE handle = LoadLibraryW(ToText(file).wc_str());
    if (!handle) {
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "Cannot load the filter " << Shown(file);
        return nullptr;
    }
    std::unique_ptr<FilterModule> module(new FilterModule(handle));
    if (!module->FindExports()) {
        SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__)
            << "Passed over, since it is no filter: " << Shown(file);
        return nullptr;
    }
    module->m_initialize();
    module->m_initialized = true;
    return module;
}

FilterModule::~FilterModule() {
    if (m_initialized)
        m_uninitialize();
    FreeLibrary(m_module);
}

bool FilterModule::FindExports() {
    return Find(m_module, "InitializePlugin", m_initialize) &&
           Find(m_module, "GetPluginInfo", m_getInfo) &&
           Find(m_module, "GetPluginInstance", m_getInstance) &&
           Find(m_module, "ReleasePluginInstance", m_releaseInstance) &&
           Find(m_module, "UninitializePlugin", m_uninitialize);
}

PluginInfo FilterModule::Describe() const {
    PluginInfo info;
    m_getInfo(&info);
    return info;
}

WQPlugin* FilterModule::NewInstance() const {
    return m_getInstance(nullptr);
}

void FilterModule::ReleaseInstance(WQPlugin* plugin) const {
    m_releaseInstance(plugin);
}
