#pragma once

#include <objbase.h>

namespace win32 {

/// Looks for a class object that this process registered.
/// @param object receives a reference, which is the caller's
bool FindRegisteredClassObject(REFCLSID clsid, IUnknown** object);

} // namespace win32
