#pragma once

#include "common/UniqueHandle.h"

#include <wx/string.h>

/// A module loaded by its full path, unloaded with the object.
class LoadedModule {
public:
    explicit LoadedModule(const wxString& path) : m_module(LoadLibraryW(path.wc_str())) {}

    explicit operator bool() const { return static_cast<bool>(m_module); }

    /// @tparam Function the export's type, which nothing checks
    /// @return null when the module has no export of that name
    template <typename Function>
    Function* Find(const char* name) const {
        // By way of void*, since compilers warn of a cast between function types of other shape.
        return reinterpret_cast<Function*>(
            reinterpret_cast<void*>(GetProcAddress(m_module.Get(), name)));
    }

private:
    struct Traits {
        using Type = HMODULE;
        static Type None() { return nullptr; }
        static void Close(Type module) { FreeLibrary(module); }
    };

    UniqueHandle<Traits> m_module;
};
