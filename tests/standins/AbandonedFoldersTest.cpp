#include "tests/standins/StandInTest.h"

#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

#include <chrono>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

constexpr uid_t SomebodyElse = 12345;

class AbandonedFoldersTest : public StandInTest {
protected:
    AbandonedFoldersTest()
        : StandInTest(STANDINS_FOLDER "/office.so", "SOFTWARE\\Orvanta\\Office Stand-Ins") {}

    void TearDown() override {
        for (const fs::directory_entry& entry : fs::directory_iterator(m_temporary.Path()))
            fs::remove_all(entry);
        StandInTest::TearDown();
    }

    /// Makes a folder among the temporary files, with a document in it.
    /// @param mark a further file's name; empty for none
    /// @return its path
    fs::path Make(const std::string& name, const std::string& mark = "in use",
                  std::chrono::hours age = 2h) const {
        fs::path folder = m_temporary / name;
        fs::create_directory(folder);
        m_temporary.Write(name + "/document.docx", "A copy");
        if (!mark.empty())
            m_temporary.Write(name + "/" + mark, "");
        fs::last_write_time(folder, fs::file_time_type::clock::now() - age);
        return folder;
    }

    /// Has a client start, and expects that folders are gone then or still there.
    void ExpectAfterStart(bool isThere, const std::vector<fs::path>& folders) const {
        Call("DllRegisterServer");
        for (const fs::path& folder : folders)
            EXPECT_EQ(isThere, fs::exists(folder)) << folder;
    }
};

} // namespace

TEST_F(AbandonedFoldersTest, GoWithTheNextStart) {
    const fs::path outside = m_files.Write("outside", "");
    const fs::path marked = Make("quillon-office-1-1", "in use", 0h);
    fs::create_directory_symlink(m_files.Path(), marked / "link");
    const fs::path markIsLink = Make("quillon-office-1-2", "");
    fs::create_symlink(outside, markIsLink / "in use");
    fs::last_write_time(markIsLink, fs::file_time_type::clock::now() - 2h);
    ExpectAfterStart(false, {marked, markIsLink, Make("quillon-office-1-3", ""),
                             Make("quillon-office-1-4", "in use soon")});
    EXPECT_TRUE(fs::exists(outside));
}

TEST_F(AbandonedFoldersTest, AreNotThoseThatSomebodyHasOrIsAboutToMark) {
    const fs::path folder = Make("quillon-office-1-1");
    const int mark = open((folder / "in use").c_str(), O_RDWR | O_CLOEXEC);
    ASSERT_EQ(0, flock(mark, LOCK_EX));
    ExpectAfterStart(true, {folder, Make("quillon-office-1-2", "", 0h),
                            Make("quillon-office-1-3", "in use soon", 0h)});
    close(mark);
    ExpectAfterStart(false, {folder});
}

TEST_F(AbandonedFoldersTest, AreNotThoseOfOthers) {
    const fs::path target = Make("target");
    fs::create_directory_symlink(target, m_temporary / "quillon-office-1-1");
    std::vector<fs::path> folders = {target / "document.docx", m_temporary / "quillon-office-1-1"};
    for (const char* name : {"quillon-office-1", "quillon-office-1-2-3", "quillon-office-1-x",
                             "quillon-office--1", "quillon-other-1-2", "my quillon-office-1-2"})
        folders.push_back(Make(name));
    if (geteuid() == 0) {
        folders.push_back(Make("quillon-office-1-2"));
        ASSERT_EQ(0, chown(folders.back().c_str(), SomebodyElse, SomebodyElse));
    }
    ExpectAfterStart(true, folders);
}
