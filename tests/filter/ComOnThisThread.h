#pragma once

#include <objbase.h>

#include <gtest/gtest.h>

/// Whether the calling thread has COM, by asking for a class that nobody has entered.
inline bool IsComInitialised() {
    const CLSID nobodys{0x11111111, 0x2222, 0x3333, {4, 4, 4, 4, 4, 4, 4, 4}};
    void* object = nullptr;
    const HRESULT result =
        CoCreateInstance(nobodys, nullptr, CLSCTX_INPROC_SERVER, IID_IUnknown, &object);
    EXPECT_TRUE(result == CO_E_NOTINITIALIZED || result == REGDB_E_CLASSNOTREG) << result;
    return result != CO_E_NOTINITIALIZED;
}
