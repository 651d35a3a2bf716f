#include "tests/filter/module/FilterModule.h"

#include <gtest/gtest.h>

namespace {

template <typename Function>
Function* Export(const LoadedModule& module, const char* name) {
    Function* function = module.Find<Function>(name);
    EXPECT_TRUE(function) << name;
    return function;
}

} // namespace

FilterModule::FilterModule() : m_module(wxString::FromUTF8(FILTER_MODULE)) {
    EXPECT_TRUE(m_module) << "error " << GetLastError();
    InitializePlugin = Export<decltype(::InitializePlugin)>(m_module, "InitializePlugin");
    GetPluginInfo = Export<decltype(::GetPluginInfo)>(m_module, "GetPluginInfo");
    GetPluginInstance = Export<decltype(::GetPluginInstance)>(m_module, "GetPluginInstance");
    ReleasePluginInstance =
        Export<decltype(::ReleasePluginInstance)>(m_module, "ReleasePluginInstance");
    UninitializePlugin = Export<decltype(::UninitializePlugin)>(m_module, "UninitializePlugin");
}
