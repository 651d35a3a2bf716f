#include "tests/platform/ErrorOf.h"
#include "tests/platform/OpenPath.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/Wine.h"

#include <gtest/gtest.h>
#include <wchar.h> // NOLINT(modernize-deprecated-headers): Microsoft's wide functions are in it

#include <string>

namespace {

constexpr DWORD Read = FILE_SHARE_READ;

class Files : public testing::Test {
protected:
    TemporaryFolder m_folder;
    std::filesystem::path m_path = m_folder.Write("file.ps", "0123456789");
};

TEST_F(Files, HandlesShareAsBothAllow) {
    const struct {
        DWORD access;
        DWORD share;
        DWORD otherAccess;
        DWORD otherShare;
        LSTATUS error;
    } cases[] = {
        {GENERIC_READ, 0, GENERIC_READ, Read, ERROR_SHARING_VIOLATION},
        {GENERIC_READ, Read, GENERIC_READ, 0, ERROR_SHARING_VIOLATION},
        {GENERIC_READ, Read, GENERIC_READ, Read, ERROR_SUCCESS},
        {GENERIC_READ, Read, GENERIC_WRITE, Read, ERROR_SHARING_VIOLATION},
        {GENERIC_WRITE, Read, GENERIC_READ, Read, ERROR_SHARING_VIOLATION},
        {GENERIC_READ | GENERIC_WRITE, 0, GENERIC_READ, Read, ERROR_SHARING_VIOLATION},
    };
    for (const auto& expected : cases) {
        const FileHandle first = OpenPath(m_path, expected.access, expected.share);
        ASSERT_TRUE(first);
        EXPECT_EQ(expected.error,
                  ErrorOf(OpenPath(m_path, expected.otherAccess, expected.otherShare)))
            << "case " << &expected - cases;
    }
}

TEST_F(Files, DispositionsDecideWhatMustBeThere) {
    constexpr DWORD Both = GENERIC_READ | GENERIC_WRITE;
    const struct {
        const char* name;
        DWORD access;
        DWORD disposition;
        bool opens;
        DWORD lastError;
        const char* content; // null when there is no such file
    } cases[] = {
        {"new", Both, CREATE_NEW, true, ERROR_SUCCESS, ""},
        {"new", Both, OPEN_EXISTING, false, ERROR_FILE_NOT_FOUND, nullptr},
        {"old", Both, CREATE_NEW, false, ERROR_FILE_EXISTS, "abc"},
        {"old", Both, OPEN_EXISTING, true, ERROR_SUCCESS, "abc"},
        {"old", GENERIC_READ, 0, false, ERROR_INVALID_PARAMETER, "abc"},
        {"none/file", GENERIC_READ, OPEN_EXISTING, false, ERROR_PATH_NOT_FOUND, nullptr},
        {"none/file", GENERIC_WRITE, CREATE_NEW, false, ERROR_PATH_NOT_FOUND, nullptr},
        {".", GENERIC_READ, OPEN_EXISTING, false, ERROR_ACCESS_DENIED, nullptr},
        {".", GENERIC_WRITE, OPEN_EXISTING, false, ERROR_ACCESS_DENIED, nullptr},
    };
    for (const auto& expected : cases) {
        const TemporaryFolder folder;
        const auto path = folder / expected.name;
        folder.Write("old", "abc");
        SetLastError(ERROR_SUCCESS);
        FileHandle file = OpenPath(path, expected.access, Read, expected.disposition);
        EXPECT_EQ(expected.lastError, GetLastError()) << "case " << &expected - cases;
        EXPECT_EQ(expected.opens, static_cast<bool>(file)) << "case " << &expected - cases;
        file.Reset();
        ASSERT_EQ(expected.content != nullptr, std::filesystem::is_regular_file(path));
        if (expected.content) {
            EXPECT_EQ(expected.content, ReadBytes(path)) << "case " << &expected - cases;
        }
    }
    EXPECT_EQ(ERROR_PATH_NOT_FOUND, ErrorOf(OpenPath("", GENERIC_READ, Read)));
}

TEST_F(Files, AHandleForReadingReadsToTheEndAndChangesNothing) {
    const FileHandle reader = OpenPath(m_path, GENERIC_READ, Read);
    DWORD done = 99;
    EXPECT_EQ(ERROR_ACCESS_DENIED, ErrorOf(WriteFile(reader.Get(), "abc", 3, &done, nullptr)));
    EXPECT_EQ(RunsOnWine() ? ERROR_INVALID_PARAMETER : ERROR_ACCESS_DENIED,
              ErrorOf(SetEndOfFile(reader.Get())));
    char buffer[16] = {};
    ASSERT_TRUE(ReadFile(reader.Get(), buffer, 4, &done, nullptr));
    EXPECT_EQ("0123", std::string(buffer, done));
    ASSERT_TRUE(ReadFile(reader.Get(), buffer, 16, &done, nullptr));
    EXPECT_EQ("456789", std::string(buffer, done));
    ASSERT_TRUE(ReadFile(reader.Get(), buffer, 16, &done, nullptr)); // the end is no failure
    EXPECT_EQ(0U, done);
}

TEST_F(Files, PositionsGoBeyondFourGibibytes) {
    const FileHandle file = OpenPath(m_path, GENERIC_READ | GENERIC_WRITE, 0);
    const struct {
        LONGLONG distance;
        DWORD method;
        LSTATUS error;
        LONGLONG position;
    } moves[] = {
        {0x100000005, FILE_BEGIN, ERROR_SUCCESS, 0x100000005},
        {2, FILE_CURRENT, ERROR_SUCCESS, 0x100000007},
        {-5, FILE_END, ERROR_SUCCESS, 5},
        {0x100000000, FILE_CURRENT, ERROR_SUCCESS, 0x100000005},
        {-1, FILE_BEGIN, ERROR_NEGATIVE_SEEK, 0},
        {0, 7, ERROR_INVALID_PARAMETER, 0},
    };
    for (const auto& move : moves) {
        LARGE_INTEGER distance{};
        distance.QuadPart = move.distance;
        LARGE_INTEGER position{};
        EXPECT_EQ(move.error,
                  ErrorOf(SetFilePointerEx(file.Get(), distance, &position, move.method)));
        EXPECT_EQ(move.position, position.QuadPart);
    }
    ASSERT_TRUE(SetEndOfFile(file.Get())); // where the last move led that was none too far
    LARGE_INTEGER size{};
    EXPECT_TRUE(GetFileSizeEx(file.Get(), &size));
    EXPECT_EQ(0x100000005, size.QuadPart);
}

TEST_F(Files, StatusHasTheSizeInSixtyFourBits) {
    struct __stat64 status {};
    std::filesystem::resize_file(m_path, 0x180000000ULL);
    ASSERT_EQ(0, _wstat64(m_path.wstring().c_str(), &status));
    EXPECT_EQ(0x180000000LL, status.st_size);
    EXPECT_EQ(-1, _wstat64((m_folder / "none").wstring().c_str(), &status));
    EXPECT_EQ(ENOENT, errno);
    EXPECT_EQ(0x180000000LL, status.st_size); // as it was
}

TEST_F(Files, AClosedHandleIsInvalid) {
    FileHandle file = OpenPath(m_path, GENERIC_READ, Read);
    const HANDLE handle = file.Get();
    file.Reset();
    DWORD done = 0;
    char byte = 0;
    EXPECT_EQ(ERROR_INVALID_HANDLE, ErrorOf(ReadFile(handle, &byte, 1, &done, nullptr)));
    EXPECT_EQ(ERROR_INVALID_HANDLE, ErrorOf(CloseHandle(handle)));
}

TEST(SplitPath, FindsTheParts) {
    const struct {
        const wchar_t* path;
        const wchar_t* drive;
        const wchar_t* dir;
        const wchar_t* name;
        const wchar_t* extension;
    } cases[] = {
        {L"/etc/cups/ppd/a.PPD", L"", L"/etc/cups/ppd/", L"a", L".PPD"},
        {L"C:\\drivers\\x64/b.ppd.bak", L"C:", L"\\drivers\\x64/", L"b.ppd", L".bak"},
        {L"c.ppd", L"", L"", L"c", L".ppd"},
        {L"/no.dot/here", L"", L"/no.dot/", L"here", L""},
        {L"/.hidden", L"", L"/", L"", L".hidden"},
        {L"", L"", L"", L"", L""},
    };
    for (const auto& expected : cases) {
        wchar_t drive[_MAX_DRIVE];
        wchar_t dir[_MAX_DIR];
        wchar_t name[_MAX_FNAME];
        wchar_t extension[_MAX_EXT];
        _wsplitpath(expected.path, drive, dir, name, extension);
        EXPECT_STREQ(expected.drive, drive);
        EXPECT_STREQ(expected.dir, dir);
        EXPECT_STREQ(expected.name, name);
        EXPECT_STREQ(expected.extension, extension);
        _wsplitpath(expected.path, nullptr, nullptr, nullptr, extension);
        EXPECT_STREQ(expected.extension, extension);
    }
}

} // namespace
