#include "tests/support/RegistryText.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <vector>

namespace {

constexpr wchar_t Folder[] = L"Software\\QuillonPlatformTest";

class Registry : public testing::Test {
protected:
    ~Registry() override {
        for (HKEY key : m_keys)
            RegCloseKey(key);
        RegDeleteTreeW(HKEY_CURRENT_USER, Folder);
    }

    /// Opens a key below the test's folder, and makes it if need be.
    HKEY Create(const std::wstring& path, REGSAM access = KEY_ALL_ACCESS) {
        HKEY key = nullptr;
        const std::wstring full = std::wstring(Folder) + L"\\" + path;
        EXPECT_EQ(ERROR_SUCCESS,
                  RegCreateKeyExW(HKEY_CURRENT_USER, full.c_str(), 0, nullptr,
                                  REG_OPTION_NON_VOLATILE, access, nullptr, &key, nullptr));
        m_keys.push_back(key);
        return key;
    }

    static LSTATUS Set(HKEY key, LPCWSTR name, DWORD number) {
        return RegSetValueExW(key, name, 0, REG_DWORD, reinterpret_cast<const BYTE*>(&number),
                              sizeof number);
    }

    static DWORD Get(HKEY key, LPCWSTR name) {
        DWORD number = 0;
        DWORD size = sizeof number;
        EXPECT_EQ(ERROR_SUCCESS, RegQueryValueExW(key, name, nullptr, nullptr,
                                                  reinterpret_cast<BYTE*>(&number), &size));
        return number;
    }

    static LSTATUS Find(HKEY key, LPCWSTR name) {
        return RegQueryValueExW(key, name, nullptr, nullptr, nullptr, nullptr);
    }

    static std::vector<std::wstring> SubKeys(HKEY key) {
        std::vector<std::wstring> names;
        wchar_t name[256];
        DWORD size = 256;
        while (RegEnumKeyExW(key, static_cast<DWORD>(names.size()), name, &size, nullptr, nullptr,
                             nullptr, nullptr) == ERROR_SUCCESS) {
            EXPECT_EQ(std::wstring(name).size(), size);
            names.emplace_back(name);
            size = 256;
        }
        return names;
    }

private:
    std::vector<HKEY> m_keys;
};

TEST_F(Registry, NamesAreOneWhateverTheirCaseAndKeepTheFirst) {
    HKEY key = Create(L"Mixed\\Größe");
    ASSERT_EQ(ERROR_SUCCESS, Set(key, L"Value", 1));
    EXPECT_EQ(ERROR_SUCCESS, Set(key, L"VALUE", 2));
    EXPECT_EQ(2U, Get(key, L"value"));
    EXPECT_EQ(2U, Get(Create(L"MIXED\\GRÖßE\\"), L"Value"));
    EXPECT_EQ(std::vector<std::wstring>{L"Größe"}, SubKeys(Create(L"mixed")));
}

TEST_F(Registry, TheDefaultValueHasNoName) {
    HKEY key = Create(L"Default");
    EXPECT_EQ(ERROR_FILE_NOT_FOUND, Find(key, nullptr));
    ASSERT_EQ(ERROR_SUCCESS, Set(key, nullptr, 7));
    EXPECT_EQ(7U, Get(key, L""));
    EXPECT_EQ(ERROR_SUCCESS, RegDeleteValueW(key, L""));
    EXPECT_EQ(ERROR_FILE_NOT_FOUND, RegDeleteValueW(key, nullptr));
}

TEST_F(Registry, AShortBufferIsToldTheSize) {
    HKEY key = Create(L"Sizes");
    const BYTE value[] = {1, 2, 3, 4, 5};
    ASSERT_EQ(ERROR_SUCCESS, RegSetValueExW(key, L"v", 0, REG_BINARY, value, sizeof value));
    ASSERT_EQ(ERROR_SUCCESS, RegSetValueExW(key, L"empty", 0, REG_NONE, nullptr, 0));
    const struct {
        bool hasBuffer;
        DWORD room;
        LSTATUS result;
    } cases[] = {
        {false, 0, ERROR_SUCCESS}, {true, 0, ERROR_MORE_DATA}, {true, 4, ERROR_MORE_DATA},
        {true, 5, ERROR_SUCCESS},  {true, 16, ERROR_SUCCESS},
    };
    for (const auto& expected : cases) {
        BYTE buffer[16] = {};
        DWORD size = expected.room;
        DWORD type = REG_NONE;
        EXPECT_EQ(expected.result, RegQueryValueExW(key, L"v", nullptr, &type,
                                                    expected.hasBuffer ? buffer : nullptr, &size));
        EXPECT_EQ(sizeof value, size);
        EXPECT_EQ(DWORD{REG_BINARY}, type);
        if (expected.hasBuffer && expected.result == ERROR_SUCCESS) {
            EXPECT_TRUE(std::equal(std::begin(value), std::end(value), buffer));
        }
    }
    BYTE buffer[4];
    EXPECT_EQ(ERROR_INVALID_PARAMETER,
              RegQueryValueExW(key, L"v", nullptr, nullptr, buffer, nullptr));
    DWORD size = sizeof buffer;
    EXPECT_EQ(ERROR_SUCCESS, RegQueryValueExW(key, L"empty", nullptr, nullptr, buffer, &size));
    EXPECT_EQ(0U, size);
}

TEST_F(Registry, CreatingTellsWhetherTheKeyIsNew) {
    for (const DWORD expected : {REG_CREATED_NEW_KEY, REG_OPENED_EXISTING_KEY}) {
        HKEY key = nullptr;
        DWORD disposition = 0;
        ASSERT_EQ(ERROR_SUCCESS,
                  RegCreateKeyExW(HKEY_CURRENT_USER, Folder, 0, nullptr, REG_OPTION_NON_VOLATILE,
                                  KEY_READ, nullptr, &key, &disposition));
        EXPECT_EQ(expected, disposition);
        RegCloseKey(key);
    }
    HKEY key = nullptr;
    EXPECT_EQ(ERROR_FILE_NOT_FOUND,
              RegOpenKeyExW(HKEY_CURRENT_USER, L"Software\\QuillonPlatformTest\\None", 0, KEY_READ,
                            &key));
}

TEST_F(Registry, AHandleHasTheRightsItWasOpenedWith) {
    ASSERT_EQ(ERROR_SUCCESS, Set(Create(L"Rights"), L"v", 1));
    HKEY reader = Create(L"Rights", KEY_READ);
    HKEY writer = Create(L"Rights", KEY_SET_VALUE);
    EXPECT_EQ(ERROR_ACCESS_DENIED, Set(reader, L"v", 2));
    EXPECT_EQ(ERROR_ACCESS_DENIED, RegDeleteValueW(reader, L"v"));
    EXPECT_EQ(ERROR_ACCESS_DENIED, Find(writer, L"v"));
    wchar_t name[8];
    DWORD size = 8;
    EXPECT_EQ(ERROR_ACCESS_DENIED,
              RegEnumKeyExW(writer, 0, name, &size, nullptr, nullptr, nullptr, nullptr));
    EXPECT_EQ(ERROR_SUCCESS, Set(writer, L"v", 3));
    EXPECT_EQ(3U, Get(reader, L"v"));
}

TEST_F(Registry, AClosedHandleIsInvalid) {
    HKEY key = nullptr;
    ASSERT_EQ(ERROR_SUCCESS, RegOpenKeyExW(HKEY_CURRENT_USER, nullptr, 0, KEY_READ, &key));
    Create(L"Closed");
    ASSERT_EQ(ERROR_SUCCESS, RegOpenKeyExW(HKEY_CURRENT_USER, Folder, 0, KEY_READ, &key));
    EXPECT_EQ(ERROR_SUCCESS, RegCloseKey(key));
    EXPECT_EQ(ERROR_INVALID_HANDLE, Find(key, L"v"));
    EXPECT_EQ(ERROR_INVALID_HANDLE, RegCloseKey(key));
    EXPECT_EQ(ERROR_INVALID_HANDLE, Find(nullptr, L"v"));
}

TEST_F(Registry, ATreeIsDeletedWithAllThatIsOpenOfIt) {
    HKEY parent = Create(L"Tree");
    HKEY leaf = Create(L"Tree\\Branch\\Leaf");
    ASSERT_EQ(ERROR_SUCCESS, Set(leaf, L"v", 1));
    ASSERT_EQ(ERROR_SUCCESS, RegDeleteTreeW(parent, L"Branch"));
    EXPECT_EQ(ERROR_KEY_DELETED, Find(leaf, L"v"));
    EXPECT_EQ(ERROR_KEY_DELETED, Set(leaf, L"v", 2));
    EXPECT_EQ(ERROR_FILE_NOT_FOUND, RegDeleteTreeW(parent, L"Branch"));

    HKEY again = Create(L"Tree\\Branch\\Leaf"); // another key of that name
    EXPECT_EQ(ERROR_FILE_NOT_FOUND, Find(again, L"v"));
    EXPECT_EQ(ERROR_KEY_DELETED, Find(leaf, L"v"));

    ASSERT_EQ(ERROR_SUCCESS, Set(parent, L"v", 1));
    ASSERT_EQ(ERROR_SUCCESS, RegDeleteTreeW(parent, nullptr)); // what is in it, not the key
    EXPECT_EQ(ERROR_FILE_NOT_FOUND, Find(parent, L"v"));
    EXPECT_TRUE(SubKeys(parent).empty());
}

TEST_F(Registry, SubKeysAreListedByIndex) {
    HKEY key = Create(L"List");
    for (const wchar_t* name : {L"List\\beta", L"List\\Alpha", L"List\\gamma"})
        Create(name);
    EXPECT_EQ((std::vector<std::wstring>{L"Alpha", L"beta", L"gamma"}), SubKeys(key));
    wchar_t name[8];
    DWORD size = 5; // one short of "Alpha" with its end
    EXPECT_EQ(ERROR_MORE_DATA,
              RegEnumKeyExW(key, 0, name, &size, nullptr, nullptr, nullptr, nullptr));
    size = 8;
    EXPECT_EQ(ERROR_NO_MORE_ITEMS,
              RegEnumKeyExW(key, 3, name, &size, nullptr, nullptr, nullptr, nullptr));
}

TEST_F(Registry, ClassesRootShowsTheClassesOfTheMachine) {
    constexpr wchar_t Name[] = L"Quillon.PlatformTest";
    WriteRegistryText(HKEY_CLASSES_ROOT, Name, L"", L"A class");
    HKEY key = nullptr;
    ASSERT_EQ(ERROR_SUCCESS,
              RegOpenKeyExW(HKEY_LOCAL_MACHINE, L"Software\\Classes\\Quillon.PlatformTest", 0,
                            KEY_READ, &key));
    EXPECT_EQ(ERROR_SUCCESS, Find(key, nullptr));
    RegCloseKey(key);
    EXPECT_EQ(ERROR_SUCCESS, RegDeleteTreeW(HKEY_CLASSES_ROOT, Name));
}

} // namespace
