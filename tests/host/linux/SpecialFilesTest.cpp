// Files of which only this system knows.

#include "tests/host/ScreenRun.h"

#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

class SpecialFilesTest : public ScreenTest {};

TEST_F(SpecialFilesTest, AreToldByTheirKind) {
    ASSERT_EQ(mkfifo((m_folder / "pipe.doc").c_str(), 0600), 0);
    ExpectRefused(m_folder / "pipe.doc", -1005, "named pipe");
    fs::create_symlink("/dev/zero", m_folder / "device.doc");
    ExpectRefused(m_folder / "device.doc", -1005, "device");
    fs::create_symlink("loop.doc", m_folder / "loop.doc");
    ExpectRefused(m_folder / "loop.doc", -1002, "cannot be reached");
    if (geteuid() != 0) { // nothing is unreadable to root
        fs::permissions(m_folder.Write("secret.doc", "x"), fs::perms::none);
        ExpectRefused(m_folder / "secret.doc", -1002, "cannot be read");
    }
}

} // namespace
