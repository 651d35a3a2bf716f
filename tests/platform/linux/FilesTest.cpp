// Files as only a POSIX system has them.

#include "tests/support/TemporaryFolder.h"

#include <windows.h>

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>

namespace {

DWORD OpenError(const std::wstring& path, DWORD access, DWORD share) {
    HANDLE file = CreateFileW(path.c_str(), access, share, nullptr, OPEN_EXISTING,
                              FILE_ATTRIBUTE_NORMAL, nullptr);
    if (file == INVALID_HANDLE_VALUE)
        return GetLastError();
    CloseHandle(file);
    return ERROR_SUCCESS;
}

/// Runs `work` in another process.
/// @return what it returns
template <typename Work>
int InAnotherProcess(Work work) {
    const pid_t child = fork();
    if (child == 0)
        _exit(work());
    int status = 0;
    waitpid(child, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

TEST(LinuxFiles, NothingThatCouldWaitIsOpened) {
    const TemporaryFolder folder;
    const auto fifo = folder / "fifo";
    ASSERT_EQ(0, mkfifo(fifo.c_str(), 0600));
    for (const DWORD access : {GENERIC_READ, GENERIC_WRITE, GENERIC_READ | GENERIC_WRITE})
        EXPECT_EQ(DWORD{ERROR_ACCESS_DENIED}, OpenError(fifo.wstring(), access, 0));
    EXPECT_EQ(DWORD{ERROR_ACCESS_DENIED}, OpenError(L"/dev/zero", GENERIC_READ, FILE_SHARE_READ));
}

TEST(LinuxFiles, ANameWithoutUtf8IsInvalid) {
    const TemporaryFolder folder;
    const std::wstring name = folder.Path().wstring() + L"/\xD800.doc";
    EXPECT_EQ(DWORD{ERROR_INVALID_NAME}, OpenError(name, GENERIC_READ, 0));
    EXPECT_FALSE(DeleteFileW(name.c_str()));
    EXPECT_EQ(DWORD{ERROR_INVALID_NAME}, GetLastError());
}

TEST(LinuxFiles, OtherProcessesAreKeptOut) {
    const TemporaryFolder folder;
    const std::wstring path = folder.Write("file", "x").wstring();
    const auto tryToOpen = [&](DWORD share) {
        return InAnotherProcess(
            [&] { return static_cast<int>(OpenError(path, GENERIC_READ, share)); });
    };
    // A process that was started while the file was open must not keep its lock.
    int gate[2];
    ASSERT_EQ(0, pipe(gate));
    HANDLE file = CreateFileW(path.c_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr, OPEN_EXISTING,
                              FILE_ATTRIBUTE_NORMAL, nullptr);
    ASSERT_NE(INVALID_HANDLE_VALUE, file);
    const pid_t heir = fork();
    if (heir == 0) {
        char byte = 0;
        close(gate[1]);
        _exit(static_cast<int>(read(gate[0], &byte, 1)));
    }
    // The table of share modes goes along with a fork; a process of its own would start empty.
    EXPECT_EQ(ERROR_SHARING_VIOLATION, tryToOpen(FILE_SHARE_READ | FILE_SHARE_WRITE));
    EXPECT_EQ(1, InAnotherProcess([&] {
                  return execlp("flock", "flock", "-n", std::filesystem::path(path).c_str(), "true",
                                nullptr);
              }));
    CloseHandle(file);
    EXPECT_EQ(ERROR_SUCCESS, tryToOpen(0));
    close(gate[1]);
    close(gate[0]);
    waitpid(heir, nullptr, 0);
}

TEST(LinuxFiles, AFullDiskIsTold) {
    const TemporaryFolder folder;
    const std::wstring path = folder.Write("file", "").wstring();
    EXPECT_EQ(0, InAnotherProcess([&] {
                  std::signal(SIGXFSZ, SIG_IGN);
                  const rlimit limit{10, 10};
                  setrlimit(RLIMIT_FSIZE, &limit);
                  HANDLE file = CreateFileW(path.c_str(), GENERIC_WRITE, 0, nullptr, OPEN_EXISTING,
                                            FILE_ATTRIBUTE_NORMAL, nullptr);
                  DWORD written = 0;
                  const BOOL result = WriteFile(file, "more than ten bytes", 19, &written, nullptr);
                  const bool told = !result && GetLastError() == ERROR_DISK_FULL && written == 10;
                  return told ? 0 : 1;
              }));
}

} // namespace
