#pragma once

#include <string>
#include <string_view>

namespace win32 {

/// The form under which names that differ in case only are one name: character by character in
/// upper case, whatever the locale, as Windows compares the names of keys, files and printers.
std::wstring CaseFold(std::wstring_view name);

inline bool SameName(std::wstring_view left, std::wstring_view right) {
    return left.size() == right.size() && CaseFold(left) == CaseFold(right);
}

} // namespace win32
