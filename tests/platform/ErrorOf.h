#pragma once

#include <windows.h>

/// The error of the call that gave `answer`; ERROR_SUCCESS when it succeeded.
/// @param answer false, null or a handle of nothing stands for failure
template <typename Answer>
LSTATUS ErrorOf(const Answer& answer) {
    return answer ? ERROR_SUCCESS : static_cast<LSTATUS>(GetLastError());
}
