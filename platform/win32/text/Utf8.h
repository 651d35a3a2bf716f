#pragma once

// Between the API's wide texts and the UTF-8 of the system below.

#include <optional>
#include <string>
#include <string_view>

namespace win32 {

/// @return the text as UTF-8; nothing when a character of it has no UTF-8 form (half a surrogate
/// pair, or a value beyond Unicode)
std::optional<std::string> ToUtf8(std::wstring_view text);

/// ToUtf8 for people's eyes: what has no UTF-8 form becomes U+FFFD.
std::string ToReadableUtf8(std::wstring_view text);

/// @return the text; bytes that are no UTF-8 become U+FFFD
std::wstring FromUtf8(std::string_view text);

} // namespace win32
