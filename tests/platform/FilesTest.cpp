#include "tests/support/TemporaryFolder.h"
#include "tests/support/Wine.h"

#include <windows.h>

#include <gtest/gtest.h>
#include <wchar.h> // NOLINT(modernize-deprecated-headers): Microsoft's wide functions are in it

#include <string>

namespace {

constexpr DWORD Read = FILE_SHARE_READ;
constexpr DWORD Write = FILE_SHARE_WRITE;

/// Opens a file and closes it again.
class File {
public:
    File(const std::filesystem::path& path, DWORD access, DWORD share,
         DWORD disposition = OPEN_EXISTING)
        : m_handle(CreateFileW(path.wstring().c_str(), access, share, nullptr, disposition,
                               FILE_ATTRIBUTE_NORMAL, nullptr)),
          m_error(GetLastError()) {}
    ~File() {
        if (IsOpen())
            CloseHandle(m_handle);
    }
    File(const File&) = delete;
    File& operator=(const File&) = delete;

    bool IsOpen() const { return m_handle != INVALID_HANDLE_VALUE; }
    DWORD Error() const { return IsOpen() ? ERROR_SUCCESS : m_error; }
    DWORD LastError() const { return m_error; }
    HANDLE Handle() const { return m_handle; }

private:
    HANDLE m_handle;
    DWORD m_error;
};

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
        bool together;
    } cases[] = {
        {GENERIC_READ, 0, GENERIC_READ, Read, false},
        {GENERIC_READ, Read, GENERIC_READ, 0, false},
        {GENERIC_READ, Read, GENERIC_READ, Read, true},
        {GENERIC_READ, Read, GENERIC_WRITE, Read, false},
        {GENERIC_READ, Read | Write, GENERIC_WRITE, Read, true},
        {GENERIC_READ, Read | Write, GENERIC_WRITE, Write, false},
        {GENERIC_WRITE, Read, GENERIC_READ, Read, false},
        {GENERIC_WRITE, Read, GENERIC_READ, Read | Write, true},
        {GENERIC_WRITE, Read | Write, GENERIC_WRITE, Read | Write, true},
        {GENERIC_READ | GENERIC_WRITE, 0, GENERIC_READ, Read | Write, false},
    };
    for (const auto& expected : cases) {
        const File first(m_path, expected.access, expected.share);
        ASSERT_TRUE(first.IsOpen());
        const File second(m_path, expected.otherAccess, expected.otherShare);
        EXPECT_EQ(expected.together ? DWORD{ERROR_SUCCESS} : DWORD{ERROR_SHARING_VIOLATION},
                  second.Error())
            << "case " << &expected - cases;
    }
    EXPECT_EQ(10U, std::filesystem::file_size(m_path));
}

TEST_F(Files, ATruncatingOpenThatIsRefusedTruncatesNothing) {
    const File reader(m_path, GENERIC_READ, Read);
    const File writer(m_path, GENERIC_WRITE, Read, CREATE_ALWAYS);
    EXPECT_EQ(DWORD{ERROR_SHARING_VIOLATION}, writer.Error());
    EXPECT_EQ("0123456789", ReadBytes(m_path));
}

TEST_F(Files, DispositionsDecideWhatMustBeThere) {
    const struct {
        DWORD disposition;
        bool existing;
        DWORD error;     // of the open
        DWORD lastError; // after an open that may do either
        std::uintmax_t size;
    } cases[] = {
        {CREATE_NEW, false, ERROR_SUCCESS, ERROR_SUCCESS, 0},
        {CREATE_NEW, true, ERROR_FILE_EXISTS, ERROR_FILE_EXISTS, 3},
        {CREATE_ALWAYS, false, ERROR_SUCCESS, ERROR_SUCCESS, 0},
        {CREATE_ALWAYS, true, ERROR_SUCCESS, ERROR_ALREADY_EXISTS, 0},
        {OPEN_ALWAYS, false, ERROR_SUCCESS, ERROR_SUCCESS, 0},
        {OPEN_ALWAYS, true, ERROR_SUCCESS, ERROR_ALREADY_EXISTS, 3},
        {OPEN_EXISTING, true, ERROR_SUCCESS, ERROR_SUCCESS, 3},
        {TRUNCATE_EXISTING, true, ERROR_SUCCESS, ERROR_SUCCESS, 0},
    };
    for (const auto& expected : cases) {
        const auto path = m_folder / "disposition";
        std::filesystem::remove(path);
        if (expected.existing)
            m_folder.Write("disposition", "abc");
        SetLastError(ERROR_SUCCESS);
        const File file(path, GENERIC_READ | GENERIC_WRITE, 0, expected.disposition);
        EXPECT_EQ(expected.error, file.Error()) << "case " << &expected - cases;
        EXPECT_EQ(expected.lastError, file.LastError()) << "case " << &expected - cases;
        EXPECT_EQ(expected.size, std::filesystem::file_size(path)) << "case " << &expected - cases;
    }
}

TEST_F(Files, FailuresHaveTheirCodes) {
    const auto errorOf = [](const std::filesystem::path& path, DWORD access, DWORD disposition) {
        return File(path, access, Read, disposition).Error();
    };
    EXPECT_EQ(DWORD{ERROR_FILE_NOT_FOUND}, errorOf(m_folder / "none", GENERIC_READ, OPEN_EXISTING));
    EXPECT_EQ(DWORD{ERROR_FILE_NOT_FOUND},
              errorOf(m_folder / "none", GENERIC_WRITE, TRUNCATE_EXISTING));
    EXPECT_EQ(DWORD{ERROR_PATH_NOT_FOUND},
              errorOf(m_folder / "none" / "file", GENERIC_READ, OPEN_EXISTING));
    EXPECT_EQ(DWORD{ERROR_PATH_NOT_FOUND},
              errorOf(m_folder / "none" / "file", GENERIC_WRITE, CREATE_ALWAYS));
    EXPECT_EQ(DWORD{ERROR_ACCESS_DENIED}, errorOf(m_folder.Path(), GENERIC_READ, OPEN_EXISTING));
    EXPECT_EQ(DWORD{ERROR_ACCESS_DENIED}, errorOf(m_folder.Path(), GENERIC_WRITE, CREATE_ALWAYS));
    if (!RunsOnWine()) { // which truncates without the right to write
        EXPECT_EQ(DWORD{ERROR_INVALID_PARAMETER}, errorOf(m_path, GENERIC_READ, TRUNCATE_EXISTING));
    }
    EXPECT_EQ(DWORD{ERROR_INVALID_PARAMETER}, errorOf(m_path, GENERIC_READ, 0));
    EXPECT_EQ(DWORD{ERROR_PATH_NOT_FOUND}, errorOf("", GENERIC_READ, OPEN_EXISTING));
}

TEST_F(Files, ReadsAndWritesWhereThePositionIs) {
    const File file(m_path, GENERIC_READ | GENERIC_WRITE, FILE_SHARE_READ | FILE_SHARE_WRITE);
    char buffer[16] = {};
    DWORD done = 99;
    ASSERT_TRUE(ReadFile(file.Handle(), buffer, 4, &done, nullptr));
    EXPECT_EQ("0123", std::string(buffer, done));
    EXPECT_EQ(8U, SetFilePointer(file.Handle(), 4, nullptr, FILE_CURRENT));
    ASSERT_TRUE(ReadFile(file.Handle(), buffer, 16, &done, nullptr));
    EXPECT_EQ("89", std::string(buffer, done));
    ASSERT_TRUE(ReadFile(file.Handle(), buffer, 16, &done, nullptr)); // the end is no failure
    EXPECT_EQ(0U, done);
    EXPECT_EQ(0U, SetFilePointer(file.Handle(), 0, nullptr, FILE_BEGIN));
    ASSERT_TRUE(WriteFile(file.Handle(), "abc", 3, &done, nullptr));
    EXPECT_EQ(3U, done);
    EXPECT_TRUE(SetEndOfFile(file.Handle()));
    EXPECT_EQ(3U, GetFileSize(file.Handle(), nullptr));
    EXPECT_EQ("abc", ReadBytes(m_path));

    const File reader(m_folder.Write("other", "x"), GENERIC_READ, Read);
    EXPECT_FALSE(WriteFile(reader.Handle(), "abc", 3, &done, nullptr));
    EXPECT_EQ(DWORD{ERROR_ACCESS_DENIED}, GetLastError());
    EXPECT_FALSE(SetEndOfFile(reader.Handle()));
    EXPECT_EQ(RunsOnWine() ? DWORD{ERROR_INVALID_PARAMETER} : DWORD{ERROR_ACCESS_DENIED},
              GetLastError());
}

TEST_F(Files, PositionsGoBeyondFourGibibytes) {
    const File file(m_path, GENERIC_READ | GENERIC_WRITE, 0);
    HANDLE handle = file.Handle();
    EXPECT_EQ(INVALID_SET_FILE_POINTER, SetFilePointer(handle, -1, nullptr, FILE_BEGIN));
    EXPECT_EQ(DWORD{ERROR_NEGATIVE_SEEK}, GetLastError());
    EXPECT_EQ(INVALID_SET_FILE_POINTER, SetFilePointer(handle, 0, nullptr, 7));
    EXPECT_EQ(DWORD{ERROR_INVALID_PARAMETER}, GetLastError());

    LONG high = 1;
    EXPECT_EQ(5U, SetFilePointer(handle, 5, &high, FILE_BEGIN));
    EXPECT_EQ(1, high);
    if (!RunsOnWine()) { // which loses the upper half
        EXPECT_EQ(INVALID_SET_FILE_POINTER, SetFilePointer(handle, 0, nullptr, FILE_CURRENT));
        EXPECT_EQ(DWORD{ERROR_INVALID_PARAMETER}, GetLastError());
    }

    high = -1;
    EXPECT_EQ(4U, SetFilePointer(handle, -1, &high, FILE_CURRENT));
    EXPECT_EQ(1, high);
    ASSERT_TRUE(SetEndOfFile(handle));
    DWORD sizeHigh = 0;
    EXPECT_EQ(4U, GetFileSize(handle, &sizeHigh));
    EXPECT_EQ(1U, sizeHigh);
    LARGE_INTEGER size{};
    EXPECT_TRUE(GetFileSizeEx(handle, &size));
    EXPECT_EQ(0x100000004LL, size.QuadPart);

    high = 0;
    EXPECT_EQ(0xFFFFFFFFU, SetFilePointer(handle, -1, &high, FILE_BEGIN) & 0xFFFFFFFFU);
    LARGE_INTEGER distance{};
    distance.QuadPart = -4;
    EXPECT_TRUE(SetFilePointerEx(handle, distance, &size, FILE_END));
    EXPECT_EQ(0x100000000LL, size.QuadPart);
}

TEST_F(Files, AClosedHandleIsInvalid) {
    HANDLE handle = nullptr;
    {
        const File file(m_path, GENERIC_READ, Read);
        handle = file.Handle();
    }
    DWORD done = 0;
    char byte = 0;
    EXPECT_FALSE(ReadFile(handle, &byte, 1, &done, nullptr));
    EXPECT_EQ(DWORD{ERROR_INVALID_HANDLE}, GetLastError());
    EXPECT_EQ(INVALID_FILE_SIZE, GetFileSize(handle, nullptr));
    EXPECT_EQ(DWORD{ERROR_INVALID_HANDLE}, GetLastError());
    EXPECT_FALSE(CloseHandle(handle));
    EXPECT_EQ(DWORD{ERROR_INVALID_HANDLE}, GetLastError());
}

TEST_F(Files, AreDeletedUnlessSomebodyMinds) {
    const auto deleteError = [](const std::filesystem::path& path) {
        return DeleteFileW(path.wstring().c_str()) ? DWORD{ERROR_SUCCESS} : GetLastError();
    };
    EXPECT_EQ(DWORD{ERROR_FILE_NOT_FOUND}, deleteError(m_folder / "none"));
    EXPECT_EQ(DWORD{ERROR_PATH_NOT_FOUND}, deleteError(m_folder / "none" / "file"));
    EXPECT_EQ(DWORD{ERROR_ACCESS_DENIED}, deleteError(m_folder.Path()));
    {
        const File minds(m_path, GENERIC_READ, Read | Write);
        EXPECT_EQ(DWORD{ERROR_SHARING_VIOLATION}, deleteError(m_path));
    }
    EXPECT_EQ(DWORD{ERROR_SUCCESS}, deleteError(m_path));
    EXPECT_FALSE(std::filesystem::exists(m_path));
}

TEST_F(Files, StatusHasTheSizeInSixtyFourBits) {
    struct __stat64 status {};
    const auto large = m_folder / "large";
    m_folder.Write("large", "");
    std::filesystem::resize_file(large, 0x180000000ULL);
    ASSERT_EQ(0, _wstat64(large.wstring().c_str(), &status));
    EXPECT_EQ(0x180000000LL, status.st_size);
    EXPECT_EQ(-1, _wstat64((m_folder / "none").wstring().c_str(), &status));
    EXPECT_EQ(ENOENT, errno);
    EXPECT_EQ(0x180000000LL, status.st_size);
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
