// Files as only a POSIX system has them.

#include "tests/platform/ErrorOf.h"
#include "tests/platform/OpenPath.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/linux/ResourceLimit.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>

namespace {

TEST(LinuxFiles, NothingThatCouldWaitIsOpened) {
    const TemporaryFolder folder;
    const auto fifo = folder / "fifo";
    ASSERT_EQ(0, mkfifo(fifo.c_str(), 0600));
    for (const DWORD access : {GENERIC_READ, GENERIC_WRITE, GENERIC_READ | GENERIC_WRITE})
        EXPECT_EQ(ERROR_ACCESS_DENIED, ErrorOf(OpenPath(fifo, access, 0)));
    EXPECT_EQ(ERROR_ACCESS_DENIED, ErrorOf(OpenPath("/dev/zero", GENERIC_READ, FILE_SHARE_READ)));
}

TEST(LinuxFiles, ANameWithoutUtf8IsInvalid) {
    constexpr wchar_t Name[] = L"\xD800.doc";
    EXPECT_EQ(INVALID_HANDLE_VALUE, CreateFileW(Name, GENERIC_READ, 0, nullptr, OPEN_EXISTING,
                                                FILE_ATTRIBUTE_NORMAL, nullptr));
    EXPECT_EQ(DWORD{ERROR_INVALID_NAME}, GetLastError());
}

TEST(LinuxFiles, LocksAreSharedWithOtherProcesses) {
    const TemporaryFolder folder;
    const auto path = folder.Write("file", "x");
    const int other = open(path.c_str(), O_RDONLY); // no matter whose: not the layer's
    FileHandle file = OpenPath(path, GENERIC_READ | GENERIC_WRITE, 0);
    ASSERT_TRUE(file);
    // A process that was started while the file was open must not keep its lock.
    int gate[2];
    ASSERT_EQ(0, pipe(gate));
    const pid_t heir = fork();
    if (heir == 0) {
        char byte = 0;
        close(gate[1]);
        _exit(static_cast<int>(read(gate[0], &byte, 1)));
    }
    EXPECT_EQ(-1, flock(other, LOCK_SH | LOCK_NB));
    file.Reset();
    EXPECT_EQ(0, flock(other, LOCK_EX | LOCK_NB));
    EXPECT_EQ(ERROR_SHARING_VIOLATION, ErrorOf(OpenPath(path, GENERIC_READ, FILE_SHARE_READ)));
    for (const int descriptor : {other, gate[0], gate[1]})
        close(descriptor);
    waitpid(heir, nullptr, 0);
}

TEST(LinuxFiles, AFullDiskIsTold) {
    const TemporaryFolder folder;
    const FileHandle file = OpenPath(folder.Write("file", ""), GENERIC_WRITE, 0);
    std::signal(SIGXFSZ, SIG_IGN);
    DWORD written = 0;
    LSTATUS error = ERROR_SUCCESS;
    {
        const ResourceLimit small(RLIMIT_FSIZE, 10);
        error = ErrorOf(WriteFile(file.Get(), "more than ten bytes", 19, &written, nullptr));
    }
    EXPECT_EQ(ERROR_DISK_FULL, error);
    EXPECT_EQ(10U, written);
}

} // namespace
