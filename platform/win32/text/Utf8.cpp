#include "platform/win32/text/Utf8.h"

#include <glib.h>

#include <memory>

namespace win32 {

namespace {

constexpr gunichar ReplacementCharacter = 0xFFFD;

void AppendCharacter(std::string& text, gunichar character) {
    char bytes[6];
    text.append(bytes, static_cast<std::size_t>(g_unichar_to_utf8(character, bytes)));
}

} // namespace

std::optional<std::string> ToUtf8(std::wstring_view text) {
    std::string utf8;
    utf8.reserve(text.size());
    for (const wchar_t character : text) {
        if (!g_unichar_validate(static_cast<gunichar>(character)))
            return std::nullopt;
        AppendCharacter(utf8, static_cast<gunichar>(character));
    }
    return utf8;
}

std::string ToReadableUtf8(std::wstring_view text) {
    std::string utf8;
    for (const wchar_t character : text) {
        const bool isValid = g_unichar_validate(static_cast<gunichar>(character));
        AppendCharacter(utf8, isValid ? static_cast<gunichar>(character) : ReplacementCharacter);
    }
    return utf8;
}

std::wstring FromUtf8(std::string_view text) {
    const std::unique_ptr<char, decltype(&g_free)> valid(
        g_utf8_make_valid(text.data(), static_cast<gssize>(text.size())), g_free);
    glong length = 0;
    const std::unique_ptr<gunichar, decltype(&g_free)> characters(
        g_utf8_to_ucs4_fast(valid.get(), -1, &length), g_free);
    return {characters.get(), characters.get() + length};
}

} // namespace win32
