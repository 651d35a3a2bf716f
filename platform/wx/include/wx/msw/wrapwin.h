#pragma once

// The headers of Windows as wxWidgets includes them on Windows: without the macros that change the
// names of its own functions. Here there are none.

#include <windows.h>
