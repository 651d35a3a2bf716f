#include "host/program/system/FileIdentity.h"

#include "host/program/journal/PathMap.h"
#include "host/program/system/Digest.h"
#include "tests/support/TemporaryFolder.h"

#include <gtest/gtest.h>

#include <chrono>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

FileIdentity Identify(const fs::path& path) {
    std::error_code error;
    const FileLook look = LookAt(path, error);
    EXPECT_FALSE(error) << error.message();
    EXPECT_EQ(look.type, fs::file_type::regular);
    return look.identity;
}

TEST(FileIdentityTest, StaysWithAFileUntilItIsWrittenTo) {
    const TemporaryFolder folder;
    const fs::path file = folder.Write("a.doc", "text");
    const FileIdentity before = Identify(file);
    EXPECT_EQ(before.size, 4U);
    fs::rename(file, folder / "b.doc");
    EXPECT_EQ(Identify(folder / "b.doc"), before);
    EXPECT_NE(Identify(folder.Write("a.doc", "text")), before);
    const auto now = fs::file_time_type::clock::now();
    fs::last_write_time(folder / "b.doc", now - 9s);
    const FileIdentity older = Identify(folder / "b.doc");
    fs::last_write_time(folder / "b.doc", now - 8s);
    EXPECT_EQ(Identify(folder / "b.doc").modified - older.modified, 1'000'000'000);
}

TEST(FileIdentityTest, IsKnownByItsContentWhereMachinesNumberFilesDifferently) {
    const TemporaryFolder folder;
    std::error_code error;
    EXPECT_EQ(DigestOf(folder.Write("a", "abc"), error),
              "ba7816bf8f01cfea414140de5dae2223b00361a396177a9cb410ff61f20015ad");
    EXPECT_EQ(DigestOf(folder.Write("b", std::string(3 << 20, 'x')), error).substr(0, 16),
              "3bea8a9a07c1e8dc");
    EXPECT_FALSE(error);
    EXPECT_EQ(DigestOf(folder / "none", error), "");
    EXPECT_TRUE(error);
    const FileIdentity one = {1, 2, 3, 4'000'000'000};
    EXPECT_TRUE(MayBeSame(one, {5, 6, 3, 4'900'000'000}));
    EXPECT_FALSE(MayBeSame(one, {1, 2, 4, 4'000'000'000}));
    EXPECT_FALSE(MayBeSame(one, {1, 2, 3, 1'000'000'000}));
}

TEST(PathMapTest, CallsPathsAsAllMachinesDo) {
    const PathMap here({{"office", "/mnt/office"}, {"old", "/mnt/office/old"}, {"all", "/"}});
    const PathMap there({{"office", "/srv/o"}, {"old", "/old"}});
    const struct {
        const char* here;
        const char* shared;
        const char* there;
    } cases[] = {
        {"/mnt/office/in/a b.doc", "office:/in/a b.doc", "/srv/o/in/a b.doc"},
        {"/mnt/office", "office:/", "/srv/o"},
        {"/mnt/office/old/a.doc", "old:/a.doc", "/old/a.doc"},
        {"/mnt/officer/a.doc", "all:/mnt/officer/a.doc", "all:/mnt/officer/a.doc"},
    };
    for (const auto& each : cases) {
        EXPECT_EQ(here.ToShared(each.here), each.shared);
        EXPECT_EQ(here.ToLocal(each.shared), fs::path(each.here));
        EXPECT_EQ(there.ToLocal(each.shared), fs::path(each.there));
    }
    EXPECT_TRUE(there.Has("office:/in"));
    EXPECT_FALSE(there.Has("all:/in"));
    EXPECT_TRUE(there.Has("/in"));
    EXPECT_EQ(PathMap().ToShared("/in/office:/a"), "/in/office:/a");
    EXPECT_EQ(PathMap().ToLocal("/in/office:/a"), fs::path("/in/office:/a"));
    for (const char* const name : {"", "c", "a/b", "a:b", "a\\b"})
        EXPECT_FALSE(PathMap::IsName(name)) << name;
}

TEST(FileIdentityTest, IsToldWithWhatTheNameStandsFor) {
    const TemporaryFolder folder;
    std::error_code error;
    EXPECT_EQ(LookAt(folder.Path(), error).type, fs::file_type::directory);
    EXPECT_FALSE(error);
    EXPECT_EQ(LookAt(folder / "none", error).type, fs::file_type::none);
    EXPECT_EQ(error, std::errc::no_such_file_or_directory);
}

} // namespace
