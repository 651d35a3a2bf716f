#include "tests/platform/ErrorOf.h"
#include "tests/support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <memory>

namespace {

struct Unload {
    using pointer = HMODULE;
    void operator()(HMODULE module) const { FreeLibrary(module); }
};
using Module = std::unique_ptr<HMODULE, Unload>;

Module Load(const std::filesystem::path& path) {
    return Module(LoadLibraryW(path.wstring().c_str()));
}

std::wstring NameOf(HMODULE module) {
    wchar_t name[4096];
    EXPECT_GT(GetModuleFileNameW(module, name, 4096), 0U);
    return std::filesystem::path(name).filename().wstring();
}

TEST(Modules, AreLoadedAndUnloaded) {
    EXPECT_EQ(ERROR_MOD_NOT_FOUND, ErrorOf(GetModuleHandleW(TEST_MODULE)));
    Module first = Load(TEST_MODULE);
    Module second = Load(TEST_MODULE);
    ASSERT_TRUE(first);
    const HMODULE module = first.get();
    EXPECT_EQ(module, second.get());
    EXPECT_EQ(module, GetModuleHandleW(TEST_MODULE));
    EXPECT_EQ(std::filesystem::path(TEST_MODULE).filename().wstring(), NameOf(module));
    first.reset();
    const auto answer = reinterpret_cast<int (*)()>(
        reinterpret_cast<void*>(GetProcAddress(module, "TestModuleAnswer")));
    ASSERT_NE(nullptr, answer);
    EXPECT_EQ(42, answer()); // one reference is left
    second.reset();
    EXPECT_EQ(nullptr, GetModuleHandleW(TEST_MODULE));
    EXPECT_FALSE(FreeLibrary(module));
}

TEST(Modules, ExportWhatIsTheirOwn) {
    const Module module = Load(TEST_SERVER);
    EXPECT_EQ(ERROR_SUCCESS, ErrorOf(GetProcAddress(module.get(), "DllCanUnloadNow")));
    for (const char* name : {"NoSuchExport", "memcpy"}) // the other one is of a library below
        EXPECT_EQ(ERROR_PROC_NOT_FOUND, ErrorOf(GetProcAddress(module.get(), name))) << name;
}

TEST(Modules, FailuresHaveTheirCodes) {
    const TemporaryFolder folder;
    EXPECT_EQ(ERROR_MOD_NOT_FOUND, ErrorOf(Load(folder / "none.dll")));
    EXPECT_EQ(ERROR_MOD_NOT_FOUND, ErrorOf(Load("quillon-none")));
    EXPECT_EQ(ERROR_BAD_EXE_FORMAT, ErrorOf(Load(folder.Write("text.dll", "This is no module."))));
}

TEST(Modules, ANameIsCutToTheBuffer) {
    wchar_t whole[4096];
    const DWORD length = GetModuleFileNameW(nullptr, whole, 4096);
    wchar_t cut[8];
    EXPECT_EQ(8U, GetModuleFileNameW(nullptr, cut, 8));
    EXPECT_EQ(DWORD{ERROR_INSUFFICIENT_BUFFER}, GetLastError());
    EXPECT_EQ(std::wstring(whole, 7), std::wstring(cut, 7));
    EXPECT_EQ(length, GetModuleFileNameW(nullptr, whole, length + 1));
}

TEST(Modules, AreFoundByAnAddressInThem) {
    const auto find = [](const void* address) {
        HMODULE found = nullptr;
        GetModuleHandleExW(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS |
                               GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                           static_cast<LPCWSTR>(address), &found);
        return found;
    };
    static const char inTheProgram = 0;
    EXPECT_EQ(GetModuleHandleW(nullptr), find(&inTheProgram));
    Module module = Load(TEST_MODULE);
    const void* code = reinterpret_cast<void*>(GetProcAddress(module.get(), "TestModuleAnswer"));
    EXPECT_EQ(module.get(), find(code));
    module.reset();
    EXPECT_EQ(ERROR_MOD_NOT_FOUND, ErrorOf(find(code)));
}

} // namespace
