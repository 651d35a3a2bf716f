#pragma once

#include <locale>
#include <stdexcept>

/// Makes file names and texts beyond ASCII UTF-8, whatever the machine's language. Where the system
/// has no such locale its file names are wide, and need none.
inline void UseUtf8Locale() {
    try {
        std::locale::global(std::locale("C.UTF-8"));
    } catch (const std::runtime_error&) {
    }
}
