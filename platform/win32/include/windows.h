#pragma once

// The Windows API for other systems: the functions, types and constants that this project uses,
// under Microsoft's names and in Microsoft's headers, and nothing else. docs/platform.md lists
// where the behaviour differs from Windows.

#include <winbase.h>
#include <windef.h>
#include <winerror.h>
#include <winreg.h>
