#include "platform/win32/com/ClassRegistry.h"

#include <objbase.h>

#include <cwchar>
#include <string>

namespace {

constexpr int TextLength = 38; // {00000000-0000-0000-0000-000000000000}

/// Reads the hexadecimal digits that `digits` begins with.
/// @return false when one of them is none
template <typename Number>
bool ReadHex(std::wstring_view digits, Number& number) {
    unsigned long value = 0;
    for (std::size_t i = 0; i < 2 * sizeof(Number); ++i) {
        const wchar_t digit = digits[i];
        unsigned nibble = 0;
        if (digit >= L'0' && digit <= L'9')
            nibble = static_cast<unsigned>(digit - L'0');
        else if (digit >= L'A' && digit <= L'F')
            nibble = static_cast<unsigned>(digit - L'A') + 10;
        else if (digit >= L'a' && digit <= L'f')
            nibble = static_cast<unsigned>(digit - L'a') + 10;
        else
            return false;
        value = value << 4 | nibble;
    }
    number = static_cast<Number>(value);
    return true;
}

bool ParseGuid(std::wstring_view text, GUID& guid) {
    if (text.size() != TextLength || text[0] != L'{' || text[9] != L'-' || text[14] != L'-' ||
        text[19] != L'-' || text[24] != L'-' || text[37] != L'}')
        return false;
    bool good = ReadHex(text.substr(1), guid.Data1) && ReadHex(text.substr(10), guid.Data2) &&
                ReadHex(text.substr(15), guid.Data3);
    for (std::size_t i = 0; good && i < 8; ++i) {
        const std::size_t position = i < 2 ? 20 + 2 * i : 25 + 2 * (i - 2);
        good = ReadHex(text.substr(position), guid.Data4[i]);
    }
    return good;
}

} // namespace

int WINAPI StringFromGUID2(REFGUID guid, LPOLESTR text, int size) {
    if (!text || size <= TextLength)
        return 0;
    const auto& tail = guid.Data4;
    std::swprintf(text, static_cast<std::size_t>(size),
                  L"{%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X}", guid.Data1, guid.Data2,
                  guid.Data3, tail[0], tail[1], tail[2], tail[3], tail[4], tail[5], tail[6],
                  tail[7]);
    return TextLength + 1;
}

HRESULT WINAPI CLSIDFromProgID(LPCOLESTR progId, LPCLSID clsid) {
    if (!progId || !clsid)
        return E_INVALIDARG;
    *clsid = CLSID{};
    const std::optional<std::wstring> text =
        win32::ReadClassesText(std::wstring(progId) + L"\\CLSID");
    GUID guid{};
    if (!text || !ParseGuid(*text, guid))
        return CO_E_CLASSSTRING;
    *clsid = guid;
    return S_OK;
}
