// An in-process server with one class, whose object says when it is the last one.

#include "tests/platform/CountedObject.h"

#include <cstddef>

namespace {

// {5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E41}
constexpr CLSID ServedClass = {
    0x5D3A1C52, 0x7B0E, 0x4E86, {0x9C, 0x0F, 0x2F, 0x6B, 0x1D, 0x0A, 0x9E, 0x41}};

CountedFactory& Factory() {
    static CountedFactory factory;
    return factory;
}

} // namespace

STDAPI DllGetClassObject(REFCLSID clsid, REFIID iid, LPVOID* object) {
    *object = nullptr;
    return clsid == ServedClass ? Factory().QueryInterface(iid, object) : CLASS_E_CLASSNOTAVAILABLE;
}

STDAPI DllCanUnloadNow() {
    const bool isIdle = Factory().references == 0 && Factory().product.references == 0;
    return isIdle ? S_OK : S_FALSE;
}
