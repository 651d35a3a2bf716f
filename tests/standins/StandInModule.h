#pragma once

#include <windows.h>

/// The module of the Office stand-ins, loaded for the length of the process.
class StandInModule {
public:
    static const StandInModule& Instance();

    HRESULT Register() const { return Call("DllRegisterServer"); }
    HRESULT Unregister() const { return Call("DllUnregisterServer"); }
    HRESULT CanUnloadNow() const { return Call("DllCanUnloadNow"); }

private:
    StandInModule();
    HRESULT Call(const char* name) const;

    HMODULE m_module;
};
