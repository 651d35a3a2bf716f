// Where an in-process server is kept that Windows would take away.

#include "tests/support/RegistryText.h"

#include <ole2.h>
#include <windows.h>

#include <gtest/gtest.h>

namespace {

constexpr CLSID ServedClass = {
    0x5D3A1C52, 0x7B0E, 0x4E86, {0x9C, 0x0F, 0x2F, 0x6B, 0x1D, 0x0A, 0x9E, 0x41}};
constexpr wchar_t ServerKey[] = L"CLSID\\{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E41}\\InprocServer32";

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
    RegDeleteTreeW(HKEY_CLASSES_ROOT, L"CLSID\\{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E41}");
}

} // namespace
