#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace standins {

/// @return the text as UTF-8; nothing when a character of it has no UTF-8 form
std::optional<std::string> ToUtf8(std::wstring_view text);

/// @return the text; bytes that are no UTF-8 become U+FFFD
std::wstring FromUtf8(const std::string& text);

/// @return the text as UTF-8, as far as its first zero; nothing when it is no UTF-16
std::optional<std::string> FromUtf16(std::u16string_view text);

/// @return the text in UTF-16, as far as its first zero; empty when it is no UTF-8
std::u16string ToUtf16(const std::string& text);

/// The name of the file at `path`, with its extension, for messages.
std::wstring FileName(std::wstring_view path);

} // namespace standins
