#include "host/program/system/FileIdentity.h"

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

TEST(FileIdentityTest, IsToldWithWhatTheNameStandsFor) {
    const TemporaryFolder folder;
    std::error_code error;
    EXPECT_EQ(LookAt(folder.Path(), error).type, fs::file_type::directory);
    EXPECT_FALSE(error);
    EXPECT_EQ(LookAt(folder / "none", error).type, fs::file_type::none);
    EXPECT_EQ(error, std::errc::no_such_file_or_directory);
}

} // namespace
