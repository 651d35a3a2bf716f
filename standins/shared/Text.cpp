#include "standins/shared/Text.h"

#include <glib.h>

#include <memory>

namespace standins {

namespace {

bool HasUtf8(wchar_t character) {
    return g_unichar_validate(static_cast<gunichar>(character)); // not half a surrogate pair
}

} // namespace

std::optional<std::string> ToUtf8(std::wstring_view text) {
    std::string utf8;
    for (const wchar_t character : text) {
        if (!HasUtf8(character))
            return std::nullopt;
        char bytes[6];
        const int count = g_unichar_to_utf8(static_cast<gunichar>(character), bytes);
        utf8.append(bytes, static_cast<std::size_t>(count));
    }
    return utf8;
}

std::wstring FromUtf8(const std::string& text) {
    const std::unique_ptr<char, decltype(&g_free)> valid(
        g_utf8_make_valid(text.data(), static_cast<gssize>(text.size())), g_free);
    std::wstring wide;
    for (const char* next = valid.get(); *next != '\0'; next = g_utf8_next_char(next))
        wide += static_cast<wchar_t>(g_utf8_get_char(next));
    return wide;
}

std::optional<std::string> FromUtf16(std::u16string_view text) {
    const std::unique_ptr<char, decltype(&g_free)> utf8(
        g_utf16_to_utf8(reinterpret_cast<const gunichar2*>(text.data()),
                        static_cast<glong>(text.size()), nullptr, nullptr, nullptr),
        g_free);
    return utf8 ? std::optional<std::string>(utf8.get()) : std::nullopt;
}

std::u16string ToUtf16(const std::string& text) {
    glong length = 0;
    const std::unique_ptr<gunichar2, decltype(&g_free)> units(
        g_utf8_to_utf16(text.c_str(), -1, nullptr, &length, nullptr), g_free);
    return units ? std::u16string(units.get(), units.get() + length) : std::u16string();
}

std::wstring FileName(std::wstring_view path) {
    return std::wstring(path.substr(path.rfind(L'/') + 1));
}

} // namespace standins
