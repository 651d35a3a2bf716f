#pragma once

// The texts of fixed records: UTF-16LE bytes with a terminating zero, on every system.

#include <windef.h>

#include <string>
#include <vector>

namespace win32 {

/// @return the text as UTF-16LE, with its terminating zero
std::vector<BYTE> ToUtf16Bytes(const std::wstring& text);

/// @param bytes UTF-16LE; reading ends at the first zero, or at `size`
/// @param size in bytes; an odd last byte is ignored
std::wstring FromUtf16Bytes(const BYTE* bytes, std::size_t size);

} // namespace win32
