#include "tests/support/TemporaryFolder.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <filesystem>

namespace {

using Answer = int (*)();

std::wstring NameOf(HMODULE module) {
    wchar_t name[4096];
    EXPECT_GT(GetModuleFileNameW(module, name, 4096), 0U);
    return std::filesystem::path(name).filename().wstring();
}

const std::wstring TestModuleName = std::filesystem::path(TEST_MODULE).filename().wstring();

TEST(Modules, AreLoadedAndUnloaded) {
    EXPECT_EQ(nullptr, GetModuleHandleW(TEST_MODULE));
    EXPECT_EQ(DWORD{ERROR_MOD_NOT_FOUND}, GetLastError());
    const HMODULE module = LoadLibraryW(TEST_MODULE);
    ASSERT_NE(nullptr, module);
    EXPECT_EQ(module, LoadLibraryW(TEST_MODULE));
    EXPECT_EQ(module, GetModuleHandleW(TEST_MODULE));
    const auto answer = reinterpret_cast<Answer>(
        reinterpret_cast<void*>(GetProcAddress(module, "TestModuleAnswer")));
    ASSERT_NE(nullptr, answer);
    EXPECT_EQ(42, answer());
    EXPECT_TRUE(FreeLibrary(module));
    EXPECT_EQ(42, answer()); // one reference is left
    EXPECT_TRUE(FreeLibrary(module));
    EXPECT_EQ(nullptr, GetModuleHandleW(TEST_MODULE));
    EXPECT_FALSE(FreeLibrary(module));
}

TEST(Modules, ExportWhatIsTheirOwn) {
    const HMODULE module = LoadLibraryW(TEST_SERVER);
    ASSERT_NE(nullptr, module);
    EXPECT_NE(nullptr, GetProcAddress(module, "DllCanUnloadNow"));
    for (const char* name : {"NoSuchExport", "memcpy"}) { // the other one is of a library below
        EXPECT_EQ(nullptr, GetProcAddress(module, name)) << name;
        EXPECT_EQ(DWORD{ERROR_PROC_NOT_FOUND}, GetLastError()) << name;
    }
    FreeLibrary(module);
}

TEST(Modules, FailuresHaveTheirCodes) {
    const TemporaryFolder folder;
    const auto errorOf = [](const std::wstring& path) {
        return LoadLibraryW(path.c_str()) ? DWORD{ERROR_SUCCESS} : GetLastError();
    };
    EXPECT_EQ(DWORD{ERROR_MOD_NOT_FOUND}, errorOf((folder / "none.dll").wstring()));
    EXPECT_EQ(DWORD{ERROR_MOD_NOT_FOUND}, errorOf(L"quillon-none"));
    EXPECT_EQ(DWORD{ERROR_BAD_EXE_FORMAT},
              errorOf(folder.Write("text.dll", "This is no module.").wstring()));
}

TEST(Modules, ABareNameStandsBesideTheProgram) {
    const auto beside = std::filesystem::path(TEST_MODULE).parent_path() / "quillon-bare.dll";
    std::filesystem::copy_file(TEST_MODULE, beside,
                               std::filesystem::copy_options::overwrite_existing);
    for (const wchar_t* name : {L"quillon-bare.dll", L"quillon-bare"}) {
        const HMODULE module = LoadLibraryW(name);
        ASSERT_NE(nullptr, module) << name;
        EXPECT_EQ(L"quillon-bare.dll", NameOf(module));
        FreeLibrary(module);
    }
    std::filesystem::remove(beside);
}

TEST(Modules, KnowTheirNames) {
    EXPECT_EQ(NameOf(nullptr), NameOf(GetModuleHandleW(nullptr)));
    const HMODULE module = LoadLibraryW(TEST_MODULE);
    EXPECT_EQ(TestModuleName, NameOf(module));
    FreeLibrary(module);

    wchar_t whole[4096];
    const DWORD length = GetModuleFileNameW(nullptr, whole, 4096);
    wchar_t cut[8];
    EXPECT_EQ(8U, GetModuleFileNameW(nullptr, cut, 8));
    EXPECT_EQ(DWORD{ERROR_INSUFFICIENT_BUFFER}, GetLastError());
    EXPECT_EQ(std::wstring(whole, 7), std::wstring(cut, 7));
    EXPECT_EQ(length, GetModuleFileNameW(nullptr, whole, length + 1));
}

TEST(Modules, AreFoundByAnAddressInThem) {
    constexpr DWORD Peek =
        GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT;
    const auto find = [](DWORD flags, const void* address) {
        HMODULE found = nullptr;
        const BOOL result = GetModuleHandleExW(flags, static_cast<LPCWSTR>(address), &found);
        EXPECT_EQ(result != FALSE, found != nullptr);
        return found;
    };
    EXPECT_EQ(GetModuleHandleW(nullptr), find(Peek, &TestModuleName));
    const HMODULE module = LoadLibraryW(TEST_MODULE);
    const void* code = reinterpret_cast<void*>(GetProcAddress(module, "TestModuleAnswer"));
    EXPECT_EQ(module, find(Peek, code));
    EXPECT_EQ(module, find(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS, code)); // one reference more
    EXPECT_TRUE(FreeLibrary(module));
    EXPECT_EQ(module, GetModuleHandleW(TEST_MODULE));
    EXPECT_TRUE(FreeLibrary(module));
    EXPECT_EQ(nullptr, GetModuleHandleW(TEST_MODULE));
    const int onTheStack = 0;
    EXPECT_EQ(nullptr, find(Peek, &onTheStack));
    EXPECT_EQ(DWORD{ERROR_MOD_NOT_FOUND}, GetLastError());
}

TEST(Process, HasACommandLine) {
    const std::wstring line = GetCommandLineW();
    EXPECT_NE(std::wstring::npos, line.find(NameOf(nullptr)));
}

} // namespace
