#include "common/UniqueHandle.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <string>

namespace {

constexpr wchar_t Folder[] = L"Software\\QuillonPlatformTest";

/// Opens a key below the test's folder, and makes it if need be.
RegistryKeyHandle Create(const std::wstring& path, REGSAM access = KEY_READ | KEY_WRITE) {
    RegistryKeyHandle key;
    const std::wstring full = std::wstring(Folder) + L"\\" + path;
    EXPECT_EQ(ERROR_SUCCESS,
              RegCreateKeyExW(HKEY_CURRENT_USER, full.c_str(), 0, nullptr, REG_OPTION_NON_VOLATILE,
                              access, nullptr, key.Receive(), nullptr));
    return key;
}

LSTATUS Set(const RegistryKeyHandle& key, LPCWSTR name, DWORD number) {
    return RegSetValueExW(key.Get(), name, 0, REG_DWORD, reinterpret_cast<const BYTE*>(&number),
                          sizeof number);
}

DWORD Get(const RegistryKeyHandle& key, LPCWSTR name) {
    DWORD number = 0;
    DWORD size = sizeof number;
    EXPECT_EQ(ERROR_SUCCESS, RegQueryValueExW(key.Get(), name, nullptr, nullptr,
                                              reinterpret_cast<BYTE*>(&number), &size));
    return number;
}

LSTATUS Find(HKEY key, LPCWSTR name) {
    return RegQueryValueExW(key, name, nullptr, nullptr, nullptr, nullptr);
}

class Registry : public testing::Test {
protected:
    ~Registry() override { RegDeleteTreeW(HKEY_CURRENT_USER, Folder); }
};

TEST_F(Registry, NamesAreOneWhateverTheirCase) {
    const RegistryKeyHandle key = Create(L"Mixed\\Größe");
    ASSERT_EQ(ERROR_SUCCESS, Set(key, L"Value", 1));
    EXPECT_EQ(ERROR_SUCCESS, Set(key, L"VALUE", 2));
    EXPECT_EQ(2U, Get(key, L"value"));
    EXPECT_EQ(2U, Get(Create(L"MIXED\\GRÖßE\\"), L"Value"));
}

TEST_F(Registry, AShortBufferIsToldTheSize) {
    const RegistryKeyHandle key = Create(L"Sizes");
    const BYTE value[] = {1, 2, 3, 4, 5};
    ASSERT_EQ(ERROR_SUCCESS, RegSetValueExW(key.Get(), L"v", 0, REG_BINARY, value, sizeof value));
    BYTE buffer[16] = {};
    const struct {
        BYTE* buffer;
        DWORD room;
        LSTATUS result;
    } cases[] = {
        {nullptr, 0, ERROR_SUCCESS}, {buffer, 0, ERROR_MORE_DATA}, {buffer, 4, ERROR_MORE_DATA},
        {buffer, 5, ERROR_SUCCESS},  {buffer, 16, ERROR_SUCCESS},
    };
    for (const auto& expected : cases) {
        DWORD size = expected.room;
        DWORD type = REG_NONE;
        EXPECT_EQ(expected.result,
                  RegQueryValueExW(key.Get(), L"v", nullptr, &type, expected.buffer, &size));
        EXPECT_EQ(sizeof value, size);
        EXPECT_EQ(DWORD{REG_BINARY}, type);
    }
    EXPECT_TRUE(std::equal(std::begin(value), std::end(value), buffer));
    EXPECT_EQ(ERROR_INVALID_PARAMETER,
              RegQueryValueExW(key.Get(), L"v", nullptr, nullptr, buffer, nullptr));

    ASSERT_EQ(ERROR_SUCCESS, RegSetValueExW(key.Get(), L"empty", 0, REG_NONE, nullptr, 0));
    DWORD size = sizeof buffer;
    EXPECT_EQ(ERROR_SUCCESS,
              RegQueryValueExW(key.Get(), L"empty", nullptr, nullptr, buffer, &size));
    EXPECT_EQ(0U, size);
}

TEST_F(Registry, AHandleHasTheRightsItWasOpenedWith) {
    ASSERT_EQ(ERROR_SUCCESS, Set(Create(L"Rights"), L"v", 1));
    const RegistryKeyHandle reader = Create(L"Rights", KEY_READ);
    const RegistryKeyHandle writer = Create(L"Rights", KEY_SET_VALUE);
    EXPECT_EQ(ERROR_ACCESS_DENIED, Set(reader, L"v", 2));
    EXPECT_EQ(ERROR_ACCESS_DENIED, RegDeleteValueW(reader.Get(), L"v"));
    EXPECT_EQ(ERROR_ACCESS_DENIED, Find(writer.Get(), L"v"));
    EXPECT_EQ(ERROR_SUCCESS, Set(writer, L"v", 3));
    EXPECT_EQ(3U, Get(reader, L"v"));
}

TEST_F(Registry, ATreeIsDeletedWithAllThatIsOpenOfIt) {
    const std::wstring branch = std::wstring(Folder) + L"\\Tree\\Branch";
    const RegistryKeyHandle leaf = Create(L"Tree\\Branch\\Leaf");
    ASSERT_EQ(ERROR_SUCCESS, Set(leaf, L"v", 1));
    ASSERT_EQ(ERROR_SUCCESS, RegDeleteTreeW(HKEY_CURRENT_USER, branch.c_str()));
    EXPECT_EQ(ERROR_KEY_DELETED, Set(leaf, L"v", 2));
    EXPECT_EQ(ERROR_FILE_NOT_FOUND, RegDeleteTreeW(HKEY_CURRENT_USER, branch.c_str()));

    const RegistryKeyHandle again = Create(L"Tree\\Branch\\Leaf"); // another key of that name
    EXPECT_EQ(ERROR_FILE_NOT_FOUND, Find(again.Get(), L"v"));
    EXPECT_EQ(ERROR_KEY_DELETED, Find(leaf.Get(), L"v"));
}

} // namespace
