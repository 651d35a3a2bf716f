#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace standins {

/// @return the text as UTF-8; nothing when a character of it has no UTF-8 form
std::optional<std::string> ToUtf8(std::wstring_view text);

/// @return the text; bytes that are no UTF-8 become U+FFFD
std::wstring FromUtf8(const std::string& text);

/// The name of the file at `path`, with its extension, for messages.
std::wstring FileName(std::wstring_view path);

} // namespace standins
