#pragma once

#include "platform/win32/storage/FileWindow.h"

#include <gsf/gsf.h>

namespace win32 {

/// A libgsf input that reads through `window`, which must live as long as the input.
/// @return a reference that is the caller's
GsfInput* NewGsfFileInput(FileWindow& window);

} // namespace win32
