#include "tests/platform/CountedObject.h"
#include "tests/support/RegistryText.h"
#include "tests/support/Wine.h"

#include <ole2.h>
#include <windows.h>

#include <gtest/gtest.h>

#include <cwctype>
#include <string>
#include <thread>

namespace {

constexpr CLSID RegisteredClass = {
    0x0A6F3B10, 0x2C55, 0x4D0B, {0x8E, 0x11, 0x90, 0x3D, 0x6A, 0x72, 0x55, 0x01}};
constexpr CLSID ServedClass = {
    0x5D3A1C52, 0x7B0E, 0x4E86, {0x9C, 0x0F, 0x2F, 0x6B, 0x1D, 0x0A, 0x9E, 0x41}};
constexpr wchar_t ServedText[] = L"{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E41}";
constexpr wchar_t ServerKey[] = L"CLSID\\{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E41}";

HRESULT Create(REFCLSID clsid, IUnknown** object, DWORD context = CLSCTX_ALL) {
    return CoCreateInstance(clsid, nullptr, context, IID_IUnknown,
                            reinterpret_cast<void**>(object));
}

HRESULT Create(REFCLSID clsid) {
    IUnknown* object = nullptr;
    const HRESULT result = Create(clsid, &object);
    if (object)
        object->Release();
    return result;
}

void RegisterServer(const std::wstring& path) {
    WriteRegistryText(HKEY_CLASSES_ROOT, std::wstring(ServerKey) + L"\\InprocServer32", L"", path);
}

class Com : public testing::Test {
protected:
    Com() { EXPECT_EQ(S_OK, CoInitialize(nullptr)); }
    ~Com() override {
        CoUninitialize();
        RegDeleteTreeW(HKEY_CLASSES_ROOT, ServerKey);
        RegDeleteTreeW(HKEY_CLASSES_ROOT, L"QuillonTest.Thing");
        RegDeleteTreeW(HKEY_CLASSES_ROOT, L"QuillonTest.Thing.2");
    }
};

TEST(Apartment, IsEnteredAndLeftInBalance) {
    std::thread([] {
        EXPECT_EQ(CO_E_NOTINITIALIZED, Create(ServedClass));
        EXPECT_EQ(S_OK, CoInitialize(nullptr));
        EXPECT_EQ(S_FALSE, CoInitialize(nullptr));
        EXPECT_EQ(RPC_E_CHANGED_MODE, CoInitializeEx(nullptr, COINIT_MULTITHREADED));
        CoUninitialize();
        EXPECT_EQ(REGDB_E_CLASSNOTREG, Create(ServedClass));
        CoUninitialize();
        EXPECT_EQ(CO_E_NOTINITIALIZED, Create(ServedClass));
        EXPECT_EQ(S_OK, CoInitializeEx(nullptr, COINIT_MULTITHREADED));
        EXPECT_EQ(RPC_E_CHANGED_MODE, CoInitialize(nullptr));
        CoUninitialize();
    }).join();
}

TEST(Apartment, IsTheThreadsOwn) {
    ASSERT_EQ(S_OK, CoInitialize(nullptr));
    std::thread([] { EXPECT_EQ(CO_E_NOTINITIALIZED, Create(ServedClass)); }).join();
    CoUninitialize();
}

TEST_F(Com, ClassIdsHaveATextForm) {
    wchar_t text[39] = {};
    EXPECT_EQ(39, StringFromGUID2(ServedClass, text, 39));
    EXPECT_STREQ(ServedText, text);
    EXPECT_EQ(0, StringFromGUID2(ServedClass, text, 38));
    for (wchar_t& letter : text)
        letter = static_cast<wchar_t>(std::towlower(static_cast<std::wint_t>(letter)));
    CLSID clsid{};
    EXPECT_EQ(S_OK, CLSIDFromString(text, &clsid));
    EXPECT_TRUE(clsid == ServedClass);
    for (const wchar_t* bad :
         {L"{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E4}", L"{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E4G}",
          L"{5D3A1C52-7B0E-4E86-9C0F02F6B1D0A9E41}", L"{"})
        EXPECT_EQ(CO_E_CLASSSTRING, CLSIDFromString(bad, &clsid)) << bad;
}

TEST_F(Com, ProgIdsLeadToClassIds) {
    CLSID clsid{};
    EXPECT_EQ(CO_E_CLASSSTRING, CLSIDFromProgID(L"QuillonTest.Thing", &clsid));
    WriteRegistryText(HKEY_CLASSES_ROOT, L"QuillonTest.Thing\\CLSID", L"", ServedText);
    EXPECT_EQ(S_OK, CLSIDFromProgID(L"QuillonTest.Thing", &clsid));
    EXPECT_TRUE(clsid == ServedClass);
    WriteRegistryText(HKEY_CLASSES_ROOT, L"QuillonTest.Thing\\CLSID", L"", L"no class id");
    EXPECT_EQ(CO_E_CLASSSTRING, CLSIDFromProgID(L"QuillonTest.Thing", &clsid));
    EXPECT_EQ(E_INVALIDARG, CLSIDFromProgID(nullptr, &clsid));
}

TEST_F(Com, AClassObjectServesUntilItIsRevoked) {
    CountedFactory factory;
    DWORD cookie = 0;
    ASSERT_EQ(S_OK, CoRegisterClassObject(RegisteredClass, &factory, CLSCTX_LOCAL_SERVER,
                                          REGCLS_MULTIPLEUSE, &cookie));
    EXPECT_GE(factory.references, 1U);
    for (int i = 0; i < 2; ++i) {
        IUnknown* object = nullptr;
        ASSERT_EQ(S_OK, Create(RegisteredClass, &object, CLSCTX_INPROC_SERVER));
        EXPECT_EQ(1U, factory.product.references);
        object->Release();
    }
    void* storage = &factory;
    EXPECT_EQ(E_NOINTERFACE,
              CoCreateInstance(RegisteredClass, nullptr, CLSCTX_ALL, IID_IStorage, &storage));
    EXPECT_EQ(nullptr, storage);
    EXPECT_EQ(S_OK, CoRevokeClassObject(cookie));
    EXPECT_EQ(0U, factory.references);
    EXPECT_EQ(REGDB_E_CLASSNOTREG, Create(RegisteredClass));
    EXPECT_EQ(E_INVALIDARG, CoRevokeClassObject(cookie));

    ASSERT_EQ(S_OK, CoRegisterClassObject(RegisteredClass, &factory, CLSCTX_INPROC_SERVER,
                                          REGCLS_MULTIPLEUSE, &cookie));
    void* object = nullptr;
    EXPECT_EQ(REGDB_E_CLASSNOTREG, CoGetClassObject(RegisteredClass, CLSCTX_LOCAL_SERVER, nullptr,
                                                    IID_IUnknown, &object));
    EXPECT_EQ(S_OK, CoRevokeClassObject(cookie));
}

TEST_F(Com, AClassObjectForSingleUseServesOnce) {
    if (RunsOnWine())
        GTEST_SKIP() << "Wine lets it serve more than once";
    CountedFactory factory;
    DWORD cookie = 0;
    ASSERT_EQ(S_OK, CoRegisterClassObject(RegisteredClass, &factory,
                                          CLSCTX_LOCAL_SERVER | CLSCTX_INPROC_SERVER,
                                          REGCLS_SINGLEUSE, &cookie));
    EXPECT_EQ(S_OK, Create(RegisteredClass));
    EXPECT_EQ(REGDB_E_CLASSNOTREG, Create(RegisteredClass));
    CoRevokeClassObject(cookie);
    EXPECT_EQ(0U, factory.references);
}

TEST_F(Com, AnInProcessServerIsLoadedAndGoesWithTheLastApartment) {
    RegisterServer(TEST_SERVER);
    IUnknown* object = nullptr;
    ASSERT_EQ(S_OK, Create(ServedClass, &object));
    EXPECT_NE(nullptr, GetModuleHandleW(TEST_SERVER));
    object->Release();
    EXPECT_EQ(S_FALSE, CoInitialize(nullptr));
    CoUninitialize();
    EXPECT_NE(nullptr, GetModuleHandleW(TEST_SERVER)); // COM is still in use
    CoUninitialize();
    EXPECT_EQ(nullptr, GetModuleHandleW(TEST_SERVER));
    EXPECT_EQ(S_OK, CoInitialize(nullptr));
    EXPECT_EQ(S_OK, Create(ServedClass));
}

TEST_F(Com, ABrokenServerIsTold) {
    EXPECT_EQ(REGDB_E_CLASSNOTREG, Create(ServedClass));
    RegisterServer(L"/no/such/server.dll");
    EXPECT_EQ(RunsOnWine() ? REGDB_E_CLASSNOTREG : CO_E_DLLNOTFOUND, Create(ServedClass));
    RegisterServer(TEST_MODULE); // no server
    EXPECT_EQ(RunsOnWine() ? REGDB_E_CLASSNOTREG : CO_E_ERRORINDLL, Create(ServedClass));
    void* object = nullptr;
    RegisterServer(TEST_SERVER);
    EXPECT_EQ(REGDB_E_CLASSNOTREG,
              CoGetClassObject(ServedClass, CLSCTX_LOCAL_SERVER, nullptr, IID_IUnknown, &object));
}

} // namespace
