// An in-process server with one class, whose object says when it is the last one.

#include "tests/platform/TestServer.h"

#include "tests/support/CountedObject.h"

namespace {

CountedFactory<Counted<IUnknown>>& Factory() {
    static CountedFactory<Counted<IUnknown>> factory;
    return factory;
}

} // namespace

STDAPI DllGetClassObject(REFCLSID clsid, REFIID iid, LPVOID* object) {
    *object = nullptr;
    return clsid == ServedClass ? Factory().QueryInterface(iid, object) : CLASS_E_CLASSNOTAVAILABLE;
}

STDAPI DllCanUnloadNow() {
    const bool isIdle = Factory().References() == 1 && Factory().product.References() == 1;
    return isIdle ? S_OK : S_FALSE;
}
