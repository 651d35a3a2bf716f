// Where an in-process server is kept that Windows would take away.

#include "tests/platform/TestServer.h"
#include "tests/support/RegistryText.h"

#include <gtest/gtest.h>

namespace {

TEST(LinuxCom, AServerStaysAsLongAsItsObjects) {
    WriteRegistryText(HKEY_CLASSES_ROOT, ServerKey, L"", TEST_SERVER);
    ASSERT_EQ(S_OK, CoInitialize(nullptr));
    void* object = nullptr;
    ASSERT_EQ(S_OK, CoCreateInstance(ServedClass, nullptr, CLSCTX_ALL, IID_IUnknown, &object));
    CoUninitialize();
    EXPECT_NE(nullptr, GetModuleHandleW(TEST_SERVER));
    static_cast<IUnknown*>(object)->Release();
    ASSERT_EQ(S_OK, CoInitialize(nullptr));
    CoUninitialize();
    EXPECT_EQ(nullptr, GetModuleHandleW(TEST_SERVER));
    RegDeleteTreeW(HKEY_CLASSES_ROOT, ServedClassKey);
}

} // namespace
