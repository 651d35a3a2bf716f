#pragma once

#include <ole2.h>

// The class of the in-process server TestServer, and where its entry is in the registry.

constexpr CLSID ServedClass = {
    0x5D3A1C52, 0x7B0E, 0x4E86, {0x9C, 0x0F, 0x2F, 0x6B, 0x1D, 0x0A, 0x9E, 0x41}};
constexpr wchar_t ServedClassId[] = L"{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E41}";
constexpr wchar_t ServedClassKey[] = L"CLSID\\{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E41}";
constexpr wchar_t ServerKey[] = L"CLSID\\{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E41}\\InprocServer32";
