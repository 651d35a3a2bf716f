#include "tests/standins/StandInModule.h"

#include <gtest/gtest.h>

#include <filesystem>

StandInModule::StandInModule()
    : m_module(
          LoadLibraryW((std::filesystem::path(STANDINS_FOLDER) / "office.so").wstring().c_str())) {
    EXPECT_TRUE(m_module);
}

const StandInModule& StandInModule::Instance() {
    static const StandInModule module;
    return module;
}

HRESULT StandInModule::Call(const char* name) const {
    using Function = HRESULT(STDMETHODCALLTYPE*)();
    const auto function = reinterpret_cast<Function>(
        reinterpret_cast<void*>(m_module ? GetProcAddress(m_module, name) : nullptr));
    EXPECT_TRUE(function) << name;
    return function ? function() : E_FAIL;
}
