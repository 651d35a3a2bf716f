// What COM asks of an in-process server.

#include "standins/office/inprocess/ClassFactory.h"
#include "standins/office/inprocess/EngineRun.h"
#include "standins/office/inprocess/ExportCache.h"
#include "standins/office/inprocess/Registration.h"

#include <exception>

namespace {

/// No exception leaves the module.
template <typename Work>
HRESULT Guarded(Work work) {
    try {
        return work();
    } catch (const std::exception&) {
        return E_UNEXPECTED;
    }
}

HRESULT GetClassObject(REFCLSID clsid, REFIID iid, LPVOID* object) {
    for (const standins::Application& application : standins::Applications()) {
        if (application.clsid != clsid)
            continue;
        auto* factory = new standins::ClassFactory(application);
        const HRESULT result = factory->QueryInterface(iid, object);
        factory->Release();
        return result;
    }
    return CLASS_E_CLASSNOTAVAILABLE;
}

} // namespace

STDAPI DllGetClassObject(REFCLSID clsid, REFIID iid, LPVOID* object) {
    if (!object)
        return E_POINTER;
    *object = nullptr;
    return Guarded([&] { return GetClassObject(clsid, iid, object); });
}

/// The pages that are kept in case their document is opened again would go with the module.
STDAPI DllCanUnloadNow() {
    return !standins::IsModuleInUse() && standins::ExportCache::Instance().IsEmpty() ? S_OK
                                                                                     : S_FALSE;
}

STDAPI DllRegisterServer() {
    return Guarded([] {
        standins::ClearAfterKilledRuns(); // a client starts
        return standins::RegisterApplications();
    });
}

STDAPI DllUnregisterServer() {
    return Guarded(standins::UnregisterApplications);
}
