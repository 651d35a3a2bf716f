#pragma once

#include <windows.h>

/// Whether the Windows below is Wine, which differs from Microsoft's documentation here and there.
inline bool RunsOnWine() {
    const HMODULE system = GetModuleHandleW(L"ntdll.dll");
    return system && GetProcAddress(system, "wine_get_version");
}
