#pragma once

namespace win32 {

/// Whether the calling thread has entered an apartment, and so may use COM.
bool IsComInitialized();

} // namespace win32
