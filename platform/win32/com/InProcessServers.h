#pragma once

#include <objbase.h>

namespace win32 {

/// Has the class object of a class made by its in-process server, which is loaded if need be.
/// @return REGDB_E_CLASSNOTREG when the registry knows of no such server, CO_E_DLLNOTFOUND,
/// CO_E_ERRORINDLL, or what the server answers
HRESULT GetInProcessClassObject(REFCLSID clsid, REFIID iid, void** object);

/// Unloads the servers that say they can go. Called when COM's last apartment closes.
void UnloadIdleServers();

} // namespace win32
