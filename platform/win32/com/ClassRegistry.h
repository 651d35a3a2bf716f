#pragma once

#include <optional>
#include <string>

namespace win32 {

/// The default value of a key below HKEY_CLASSES_ROOT; environment variables in an expandable text
/// are put in.
/// @return nothing when there is no such key or its default value is no text
std::optional<std::wstring> ReadClassesText(const std::wstring& path);

} // namespace win32
