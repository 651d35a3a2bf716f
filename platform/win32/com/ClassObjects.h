#pragma once

#include <objbase.h>

#include <thread>

namespace win32 {

/// Looks for a class object that this process registered. One for single use is taken off the list.
/// @param object receives a reference, which is the caller's
bool FindRegisteredClassObject(REFCLSID clsid, DWORD context, IUnknown** object);

/// Takes back what is still registered in an apartment that is going.
void RevokeClassObjectsOf(std::thread::id apartment);

} // namespace win32
