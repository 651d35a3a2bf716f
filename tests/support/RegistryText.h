#pragma once

#include <windows.h>

#include <string>

/// Writes a text value, as UTF-16, and makes its key. The test fails when it cannot be written.
/// @param name empty for the key's default value
void WriteRegistryText(HKEY root, const std::wstring& path, const std::wstring& name,
                       const std::wstring& text, DWORD type = REG_SZ);
