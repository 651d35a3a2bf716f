#include "tests/platform/TestServer.h"
#include "tests/support/CountedObject.h"
#include "tests/support/RegistryText.h"
#include "tests/support/Wine.h"

#include <gtest/gtest.h>

#include <string>
#include <thread>

namespace {

constexpr CLSID RegisteredClass = {
    0x0A6F3B10, 0x2C55, 0x4D0B, {0x8E, 0x11, 0x90, 0x3D, 0x6A, 0x72, 0x55, 0x01}};
constexpr wchar_t ProgId[] = L"QuillonTest.Thing";

HRESULT Create(REFCLSID clsid) {
    IUnknown* object = nullptr;
    const HRESULT result = CoCreateInstance(clsid, nullptr, CLSCTX_ALL, IID_IUnknown,
                                            reinterpret_cast<void**>(&object));
    if (object)
        object->Release();
    return result;
}

void RegisterServer(const std::wstring& path) {
    WriteRegistryText(HKEY_CLASSES_ROOT, ServerKey, L"", path);
}

class Com : public testing::Test {
protected:
    Com() { EXPECT_EQ(S_OK, CoInitialize(nullptr)); }
    ~Com() override {
        CoUninitialize();
        RegDeleteTreeW(HKEY_CLASSES_ROOT, ServedClassKey);
        RegDeleteTreeW(HKEY_CLASSES_ROOT, ProgId);
    }
};

TEST_F(Com, IsThereForTheThreadsThatEnteredIt) {
    std::thread([] {
        EXPECT_EQ(CO_E_NOTINITIALIZED, Create(ServedClass));
        EXPECT_EQ(S_OK, CoInitialize(nullptr));
        EXPECT_EQ(S_FALSE, CoInitialize(nullptr));
        CoUninitialize();
        EXPECT_EQ(REGDB_E_CLASSNOTREG, Create(ServedClass));
        CoUninitialize();
        EXPECT_EQ(CO_E_NOTINITIALIZED, Create(ServedClass));
    }).join();
}

TEST_F(Com, AProgIdLeadsToTheClassIdThatIsEnteredForIt) {
    CLSID clsid{};
    EXPECT_EQ(CO_E_CLASSSTRING, CLSIDFromProgID(ProgId, &clsid));
    const struct {
        const wchar_t* entered;
        HRESULT result;
    } cases[] = {
        {ServedClassId, S_OK},
        {L"{5d3a1c52-7b0e-4e86-9c0f-2f6b1d0a9e41}", S_OK},
        {L"{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E4}", CO_E_CLASSSTRING},
        {L"{5D3A1C52-7B0E-4E86-9C0F-2F6B1D0A9E4G}", CO_E_CLASSSTRING},
        {L"{5D3A1C52-7B0E-4E86-9C0F02F6B1D0A9E41}", CO_E_CLASSSTRING},
        {L"no class id", CO_E_CLASSSTRING},
    };
    for (const auto& expected : cases) {
        WriteRegistryText(HKEY_CLASSES_ROOT, std::wstring(ProgId) + L"\\CLSID", L"",
                          expected.entered);
        clsid = {};
        EXPECT_EQ(expected.result, CLSIDFromProgID(ProgId, &clsid)) << expected.entered;
        EXPECT_EQ(expected.result == S_OK, clsid == ServedClass) << expected.entered;
    }
}

TEST_F(Com, AClassObjectServesUntilItIsRevoked) {
    CountedFactory<Counted<IUnknown>> factory;
    DWORD cookie = 0;
    ASSERT_EQ(S_OK, CoRegisterClassObject(RegisteredClass, &factory, CLSCTX_INPROC_SERVER,
                                          REGCLS_MULTIPLEUSE, &cookie));
    EXPECT_GE(factory.References(), 2U);
    EXPECT_EQ(S_OK, Create(RegisteredClass));
    EXPECT_EQ(S_OK, Create(RegisteredClass));
    EXPECT_EQ(1U, factory.product.References());
    void* storage = &factory;
    EXPECT_EQ(E_NOINTERFACE,
              CoCreateInstance(RegisteredClass, nullptr, CLSCTX_ALL, IID_IStorage, &storage));
    EXPECT_EQ(nullptr, storage);
    EXPECT_EQ(S_OK, CoRevokeClassObject(cookie));
    EXPECT_EQ(1U, factory.References());
    EXPECT_EQ(REGDB_E_CLASSNOTREG, Create(RegisteredClass));
    EXPECT_EQ(E_INVALIDARG, CoRevokeClassObject(cookie));
}

TEST_F(Com, AnInProcessServerIsLoadedAndGoesWithTheLastApartment) {
    RegisterServer(TEST_SERVER);
    ASSERT_EQ(S_OK, Create(ServedClass));
    EXPECT_NE(nullptr, GetModuleHandleW(TEST_SERVER));
    EXPECT_EQ(S_FALSE, CoInitialize(nullptr));
    CoUninitialize();
    EXPECT_NE(nullptr, GetModuleHandleW(TEST_SERVER)); // COM is still in use
    CoUninitialize();
    EXPECT_EQ(nullptr, GetModuleHandleW(TEST_SERVER));
    EXPECT_EQ(S_OK, CoInitialize(nullptr));
    EXPECT_EQ(S_OK, Create(ServedClass));
}

TEST_F(Com, ABrokenServerIsTold) {
    RegisterServer(L"/no/such/server.dll");
    EXPECT_EQ(RunsOnWine() ? REGDB_E_CLASSNOTREG : CO_E_DLLNOTFOUND, Create(ServedClass));
    RegisterServer(TEST_MODULE); // no server
    EXPECT_EQ(RunsOnWine() ? REGDB_E_CLASSNOTREG : CO_E_ERRORINDLL, Create(ServedClass));
}

} // namespace
