#include "platform/win32/com/Apartment.h"
#include "platform/win32/com/ClassObjects.h"
#include "platform/win32/com/InProcessServers.h"
#include "platform/win32/log/LogSink.h"

HRESULT WINAPI CoGetClassObject(REFCLSID clsid, DWORD context, LPVOID reserved, REFIID iid,
                                LPVOID* object) {
    if (!object)
        return E_INVALIDARG;
    *object = nullptr;
    if (!win32::IsComInitialized())
        return CO_E_NOTINITIALIZED;
    if (reserved) {
        win32::Log("CoGetClassObject: other machines are not supported");
        return E_INVALIDARG;
    }
    IUnknown* registered = nullptr;
    if (win32::FindRegisteredClassObject(clsid, context, &registered)) {
        const HRESULT result = registered->QueryInterface(iid, object);
        registered->Release();
        return result;
    }
    if ((context & CLSCTX_INPROC_SERVER) == 0)
        return REGDB_E_CLASSNOTREG;
    return win32::GetInProcessClassObject(clsid, iid, object);
}

HRESULT WINAPI CoCreateInstance(REFCLSID clsid, LPUNKNOWN outer, DWORD context, REFIID iid,
                                LPVOID* object) {
    if (!object)
        return E_POINTER;
    *object = nullptr;
    if (outer && iid != IID_IUnknown)
        return CLASS_E_NOAGGREGATION;
    void* factory = nullptr;
    HRESULT result = CoGetClassObject(clsid, context, nullptr, IID_IClassFactory, &factory);
    if (FAILED(result))
        return result;
    auto* classFactory = static_cast<IClassFactory*>(factory);
    result = classFactory->CreateInstance(outer, iid, object);
    classFactory->Release();
    return result;
}
