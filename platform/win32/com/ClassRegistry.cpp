#include "platform/win32/com/ClassRegistry.h"

#include "platform/win32/text/Environment.h"
#include "platform/win32/text/Utf16.h"

#include <windows.h>

namespace win32 {

std::optional<std::wstring> ReadClassesText(const std::wstring& path) {
    HKEY key = nullptr;
    if (RegOpenKeyExW(HKEY_CLASSES_ROOT, path.c_str(), 0, KEY_READ, &key) != ERROR_SUCCESS)
        return std::nullopt;
    DWORD type = REG_NONE;
    DWORD size = 0;
    std::vector<BYTE> bytes;
    LSTATUS result = RegQueryValueExW(key, nullptr, nullptr, &type, nullptr, &size);
    if (result == ERROR_SUCCESS && size > 0) {
        bytes.resize(size);
        result = RegQueryValueExW(key, nullptr, nullptr, &type, bytes.data(), &size);
    }
    RegCloseKey(key);
    if (result != ERROR_SUCCESS || (type != REG_SZ && type != REG_EXPAND_SZ))
        return std::nullopt;
    std::wstring text = FromUtf16Bytes(bytes.data(), bytes.size());
    return type == REG_EXPAND_SZ ? ExpandEnvironment(text) : text;
}

} // namespace win32
