#include <oleauto.h>

#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <cwchar>

namespace {

// A BSTR points at its characters; in front of them stands their length in bytes, behind them a
// terminating zero. The block begins this far in front of the text, which keeps the text aligned.
constexpr std::size_t HeaderSize = 8;
constexpr std::size_t LengthOffset = HeaderSize - sizeof(std::uint32_t);
constexpr UINT LongestText = (UINT32_MAX - 64) / sizeof(OLECHAR);

char* BlockOf(BSTR text) {
    return reinterpret_cast<char*>(text) - HeaderSize;
}

} // namespace

BSTR WINAPI SysAllocString(const OLECHAR* text) {
    if (!text)
        return nullptr;
    const std::size_t length = std::wcslen(text);
    return length > LongestText ? nullptr : SysAllocStringLen(text, static_cast<UINT>(length));
}

BSTR WINAPI SysAllocStringLen(const OLECHAR* text, UINT length) {
    if (length > LongestText)
        return nullptr;
    const auto size = static_cast<std::uint32_t>(length * sizeof(OLECHAR));
    auto* block = static_cast<char*>(std::calloc(1, HeaderSize + size + sizeof(OLECHAR)));
    if (!block)
        return nullptr;
    std::memcpy(block + LengthOffset, &size, sizeof size);
    if (text && size > 0)
        std::memcpy(block + HeaderSize, text, size);
    return reinterpret_cast<BSTR>(block + HeaderSize);
}

void WINAPI SysFreeString(BSTR text) {
    if (text)
        std::free(BlockOf(text));
}

UINT WINAPI SysStringLen(BSTR text) {
    std::uint32_t size = 0;
    if (text)
        std::memcpy(&size, BlockOf(text) + LengthOffset, sizeof size);
    return static_cast<UINT>(size / sizeof(OLECHAR));
}
