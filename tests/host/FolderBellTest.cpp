// What a watch asks the system for: that something happens in a folder, and who writes to a file.

#include "host/program/system/FolderBell.h"

#include "host/program/system/FileSystemKind.h"
#include "tests/support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <fstream>
#include <functional>
#include <thread>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

constexpr auto LongEnough = 10s;

TEST(FolderBellTest, RingsForWhateverHappensInAFolder) {
    const TemporaryFolder folder;
    fs::create_directory(folder / "in");
    const std::pair<const char*, std::function<void()>> events[] = {
        {"a new file", [&] { folder.Write("in/a", "a"); }},
        {"a file that is written", [&] { folder.Write("in/a", "ab"); }},
        {"a file that is moved in", [&] { fs::rename(folder.Write("b", "b"), folder / "in/b"); }},
        {"a file that is renamed", [&] { fs::rename(folder / "in/b", folder / "in/c"); }},
        {"a file that is moved out", [&] { fs::rename(folder / "in/c", folder / "c"); }},
        {"a file that goes", [&] { fs::remove(folder / "in/a"); }},
        {"a new folder", [&] { fs::create_directory(folder / "in/more"); }},
        {"a folder that goes", [&] { fs::remove(folder / "in/more"); }},
    };
    for (const auto& [what, happen] : events) {
        FolderBell bell;
        ASSERT_TRUE(bell.Watch(folder / "in") && bell.Watch(folder / "in"));
        happen();
        EXPECT_TRUE(bell.Wait(LongEnough)) << what;
    }
}

TEST(FolderBellTest, RingsByHandAndIsSilentOtherwise) {
    const TemporaryFolder folder;
    folder.Write("a", "a");
    FolderBell bell;
    ASSERT_TRUE(bell.Watch(folder.Path()));
    EXPECT_FALSE(bell.Watch(folder / "missing"));
    EXPECT_EQ(ReadBytes(folder / "a"), "a");
    EXPECT_NE(AskForWriters(folder / "a"), Writers::Some);
    EXPECT_FALSE(bell.Wait(0s));
    std::thread other([&bell] { bell.Ring(); });
    EXPECT_TRUE(bell.Wait(LongEnough));
    other.join();
    bell.Ring();
    bell.Ring();
    EXPECT_TRUE(bell.Wait(0s));
    EXPECT_FALSE(bell.Wait(0s));
}

TEST(FolderBellTest, FollowsAFolderThatIsAnotherUnderTheSameName) {
    const TemporaryFolder folder;
    fs::create_directories(folder / "in/below");
    FolderBell bell;
    ASSERT_TRUE(bell.Watch(folder / "in") && bell.Watch(folder / "in/below"));
    fs::rename(folder / "in", folder / "old");
    while (bell.Wait(100ms)) // on some systems that is not told
        continue;
    EXPECT_FALSE(bell.Watch(folder / "in"));
    EXPECT_FALSE(bell.Watch(folder / "in/below"));
    folder.Write("old/a", "a");
    folder.Write("old/below/a", "a");
    EXPECT_FALSE(bell.Wait(0s));
    fs::create_directory(folder / "in");
    ASSERT_TRUE(bell.Watch(folder / "in"));
    folder.Write("in/a", "a");
    EXPECT_TRUE(bell.Wait(LongEnough));
}

TEST(AskForWritersTest, TellsWhetherSomebodyWrites) {
    const TemporaryFolder folder;
    const fs::path file = folder.Write("a", "a");
    EXPECT_FALSE(IsShare(folder.Path()));
    if (AskForWriters(file) == Writers::Unknown)
        GTEST_SKIP() << "the file system cannot tell";
    {
        const std::ifstream reader(file);
        EXPECT_EQ(AskForWriters(file), Writers::None);
        const std::ofstream writer(file, std::ios::app);
        EXPECT_EQ(AskForWriters(file), Writers::Some);
        EXPECT_EQ(AskForWriters(file), Writers::Some);
    }
    EXPECT_EQ(AskForWriters(file), Writers::None);
    EXPECT_TRUE(std::ofstream(file).is_open()) << "the question has kept the file";
    EXPECT_EQ(AskForWriters(folder / "missing"), Writers::Unknown);
    EXPECT_EQ(AskForWriters(folder.Path()), Writers::Unknown);
    EXPECT_NE(WritersKnownIn(folder.Path()), WritersKnown::OfNone);
    EXPECT_EQ(WritersKnownIn(folder / "missing"), WritersKnown::OfNone);
}

} // namespace
