#include "platform/win32/text/Utf16.h"

namespace win32 {

namespace {

constexpr char32_t FirstSupplementary = 0x10000;
constexpr char32_t LastCodePoint = 0x10FFFF;
constexpr char32_t ReplacementCharacter = 0xFFFD;

bool IsHighSurrogate(char32_t unit) {
    return unit >= 0xD800 && unit < 0xDC00;
}

bool IsLowSurrogate(char32_t unit) {
    return unit >= 0xDC00 && unit < 0xE000;
}

void AppendUnit(std::vector<BYTE>& bytes, char32_t unit) {
    bytes.push_back(static_cast<BYTE>(unit & 0xFF));
    bytes.push_back(static_cast<BYTE>(unit >> 8));
}

void AppendCharacter(std::vector<BYTE>& bytes, char32_t character) {
    if (character > LastCodePoint)
        character = ReplacementCharacter;
    if (character < FirstSupplementary) {
        AppendUnit(bytes, character);
        return;
    }
    const char32_t offset = character - FirstSupplementary;
    AppendUnit(bytes, 0xD800 + (offset >> 10));
    AppendUnit(bytes, 0xDC00 + (offset & 0x3FF));
}

} // namespace

std::vector<BYTE> ToUtf16Bytes(const std::wstring& text) {
    std::vector<BYTE> bytes;
    bytes.reserve(2 * (text.size() + 1));
    for (const wchar_t character : text)
        AppendCharacter(bytes, static_cast<char32_t>(character));
    AppendUnit(bytes, 0);
    return bytes;
}

std::wstring FromUtf16Bytes(const BYTE* bytes, std::size_t size) {
    const auto unitAt = [&](std::size_t position) -> char32_t {
        return position + 1 < size ? bytes[position] | bytes[position + 1] << 8 : 0;
    };
    std::wstring text;
    std::size_t position = 0;
    while (unitAt(position) != 0) {
        const char32_t unit = unitAt(position);
        const char32_t next = unitAt(position + 2);
        if (IsHighSurrogate(unit) && IsLowSurrogate(next)) {
            text += static_cast<wchar_t>(FirstSupplementary + ((unit - 0xD800) << 10) +
                                         (next - 0xDC00));
            position += 4;
        } else {
            text += static_cast<wchar_t>(unit); // half a pair stays what it is, as on Windows
            position += 2;
        }
    }
    return text;
}

} // namespace win32
