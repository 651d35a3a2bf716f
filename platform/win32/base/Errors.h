#pragma once

#include <winbase.h>
#include <windef.h>

namespace win32 {

/// The system error code that stands for an errno value.
DWORD ErrorFromErrno(int number);

/// Sets the last error.
/// @return FALSE, for a function to answer
inline BOOL Fail(DWORD error) {
    SetLastError(error);
    return FALSE;
}

} // namespace win32
