#include "platform/win32/com/Apartment.h"
#include "platform/win32/com/ClassObjects.h"
#include "platform/win32/com/InProcessServers.h"

#include <memory>

namespace {

struct Release {
    void operator()(IUnknown* object) const { object->Release(); }
};

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
    const HRESULT result = FindFactory(clsid, &factory);
    if (FAILED(result))
        return result;
    const std::unique_ptr<IClassFactory, Release> held(static_cast<IClassFactory*>(factory));
    return held->CreateInstance(outer, iid, object); // a server of C++ may throw
}
