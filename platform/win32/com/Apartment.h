#pragma once

#include <objbase.h>

#include <thread>

namespace win32 {

/// Whether the calling thread may use COM: it has entered an apartment, or the process has a
/// multithreaded one, which then takes in every thread without its own.
bool IsComInitialized();

/// The apartment that the calling thread is in: a single-threaded one is told by its thread, the
/// multithreaded one by no thread's id.
std::thread::id CurrentApartment();

} // namespace win32
