#include "platform/win32/com/Apartment.h"
#include "platform/win32/com/ClassObjects.h"
#include "platform/win32/com/InProcessServers.h"

namespace {

/// @param factory receives the class object that makes objects of the class
HRESULT FindFactory(REFCLSID clsid, void** factory) {
    IUnknown* registered = nullptr;
    if (!win32::FindRegisteredClassObject(clsid, &registered))
        return win32::GetInProcessClassObject(clsid, IID_IClassFactory, factory);
    const HRESULT result = registered->QueryInterface(IID_IClassFactory, factory);
    registered->Release();
    return result;
}

} // namespace

HRESULT WINAPI CoCreateInstance(REFCLSID clsid, LPUNKNOWN outer, DWORD context, REFIID iid,
                                LPVOID* object) {
    if (!object)
        return E_POINTER;
    *object = nullptr;
    if (outer && iid != IID_IUnknown)
        return CLASS_E_NOAGGREGATION;
    if (!win32::IsComInitialized())
        return CO_E_NOTINITIALIZED;
    if ((context & CLSCTX_INPROC_SERVER) == 0)
        return REGDB_E_CLASSNOTREG;
    void* factory = nullptr;
    HRESULT result = FindFactory(clsid, &factory);
    if (FAILED(result))
        return result;
    auto* classFactory = static_cast<IClassFactory*>(factory);
    result = classFactory->CreateInstance(outer, iid, object);
    classFactory->Release();
    return result;
}
