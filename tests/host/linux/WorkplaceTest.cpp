// Where an output is made and how it comes to its place, with a disk that fails when it is told to.

#include "host/program/documents/Workplace.h"

#include "host/program/documents/Conversion.h"
#include "host/program/documents/Delivery.h"
#include "host/program/documents/OutputFolder.h"
#include "tests/support/RecordingProgress.h"
#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <chrono>

namespace fs = std::filesystem;
using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;

namespace {

struct Disk {
    int fileError = 0; ///< what it answers to a request to write a file out
    int folderError = 0;
    std::vector<std::string> synced{}; ///< what it was asked for
};

Disk g_disk;

} // namespace

/// In the place of the C library's.
extern "C" int fsync(int descriptor) {
    const fs::path path = fs::read_symlink("/proc/self/fd/" + std::to_string(descriptor));
    g_disk.synced.push_back(path);
    errno = fs::is_directory(path) ? g_disk.folderError : g_disk.fileError;
    return errno != 0 ? -1 : static_cast<int>(syscall(SYS_fsync, descriptor));
}

namespace {

class WorkplaceTest : public testing::Test {
protected:
    void SetUp() override { fs::create_directory(Out()); }
    void TearDown() override { g_disk = {}; }

    fs::path Out() const { return m_folder / "out"; }

    /// Makes a folder in the output folder.
    /// @param mark a file's name in it; empty for none
    fs::path Make(const std::string& name, const std::string& mark, std::chrono::hours age) const {
        fs::create_directory(Out() / name);
        if (!mark.empty())
            m_folder.Write("out/" + name + "/" + mark, "");
        fs::last_write_time(Out() / name, fs::file_time_type::clock::now() - age);
        return Out() / name;
    }

    /// Converts a document whose output has a companion.
    Outcome Convert() const {
        const fs::path document = m_folder.Write("a.doc", "companion=.log");
        Fault fault;
        const FilterSet filters(TEST_FILTERS);
        RecordingProgress progress;
        const auto workplace = Workplace::Create(OutputFolder::Open(Out(), fault)->Path(), fault);
        Outcome outcome = ConvertInput({document, document}, filters, workplace->Path(), progress);
        Deliver(*workplace, "a", filters, outcome);
        return outcome;
    }

    TemporaryFolder m_folder;
};

TEST_F(WorkplaceTest, OnesThatNobodyHasAreRemovedAndNothingElse) {
    Fault fault;
    const auto used = Workplace::Create(Out(), fault);
    ASSERT_TRUE(used) << fault.what;
    const fs::path gone[] = {Make(".quillon-1-1", "in use", 0h), Make(".quillon-1-2", "a.ps", 2h),
                             Make(".quillon-1-3", "", 0h)};
    const fs::path target = Make("target", "in use", 2h);
    fs::create_directory_symlink(target, Out() / ".quillon-1-4");
    const fs::path kept[] = {
        used->Path(),
        Make(".quillon-1-6", "a.ps", 0h), // on a system that has no locks
        Out() / ".quillon-1-4",
        target / "in use",
        Make(".quillon-1", "", 2h),
        Make(".quillon-1-x", "in use", 2h),
        m_folder.Write("out/.quillon-1-5", "a file"),
    };
    Workplace::RemoveAbandoned(Out());
    for (const fs::path& path : gone)
        EXPECT_FALSE(fs::exists(path)) << path;
    for (const fs::path& path : kept)
        EXPECT_TRUE(fs::exists(path)) << path;
}

TEST_F(WorkplaceTest, AnOutputIsToldWhenItIsOnTheDisk) {
    fs::remove(Out()); // a new one must be on the disk, too
    EXPECT_EQ(Convert().state, State::Converted);
    EXPECT_THAT(g_disk.synced,
                ElementsAre(m_folder.Path(), EndsWith("-0/a.log"), EndsWith("-0/a.ps"), Out()));
}

TEST_F(WorkplaceTest, AnOutputThatIsNotOnTheDiskIsAFailure) {
    for (const int error : {ENOSPC, EIO}) {
        g_disk = {error, 0};
        const Outcome notWritten = Convert();
        EXPECT_EQ(notWritten.state, State::Failed);
        EXPECT_THAT(notWritten.fault->what.utf8_string(), EndsWith(strerror(error)));
        EXPECT_TRUE(fs::is_empty(Out()));
    }
    g_disk = {0, EIO};
    const Outcome notListed = Convert();
    EXPECT_EQ(notListed.state, State::Failed);
    EXPECT_THAT(notListed.fault->what.utf8_string(), HasSubstr("may be lost if the power fails"));
}

TEST_F(WorkplaceTest, ADiskThatCannotBeAskedIsTakenAtItsWord) {
    for (const int error : {EINVAL, EROFS}) {
        g_disk = {error, error};
        EXPECT_EQ(Convert().state, State::Converted);
    }
}

} // namespace
