#pragma once

#include <string>

namespace win32 {

/// Puts the values of environment variables in for their names between percent signs; what names
/// no variable stays as it is.
std::wstring ExpandEnvironment(const std::wstring& text);

} // namespace win32
