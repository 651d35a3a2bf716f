#include "host/program/settings/SettingsFile.h"

#include "host/program/settings/Settings.h"
#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using testing::HasSubstr;

namespace {

const char* const Head = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";

class SettingsFileTest : public testing::Test {
protected:
    std::string Store(const SettingsValues& values) const {
        EXPECT_FALSE(StoreSettings(m_file, values));
        return ReadBytes(m_file);
    }

    std::size_t FilesBeside() const {
        return static_cast<std::size_t>(
            std::distance(fs::directory_iterator(m_folder.Path()), fs::directory_iterator()));
    }

    TemporaryFolder m_folder;
    fs::path m_file = m_folder / "job.xml";
};

TEST_F(SettingsFileTest, ChangesTheValuesAndNothingElse) {
    struct Case {
        const char* before;
        const char* after;
    };
    const Case cases[] = {
        // Comments, other elements, attributes, layout and unknown settings.
        {"<job n=\"1\">\n  <!-- ours -->\n  <UI>\n    <COLOR>x</COLOR>\n    <OWN a=\"b\"/>\n  "
         "</UI>\n  <queue>5 &lt; 6</queue>\n</job>\n",
         "<job n=\"1\">\n  <!-- ours -->\n  <UI>\n    <COLOR>new</COLOR>\n    <OWN a=\"b\"/>\n    "
         "<EMPTY/>\n  </UI>\n  <queue>5 &lt; 6</queue>\n</job>\n"},
        // One element UI in the end.
        {"<job><UI><COLOR>a</COLOR></UI><UI><COLOR>b</COLOR></UI></job>",
         "<job><UI><COLOR>new</COLOR><EMPTY/></UI></job>\n"},
        {"<job><queue/></job>", "<job><UI><COLOR>new</COLOR><EMPTY/></UI><queue/></job>\n"},
        // One of each setting.
        {"<UI><COLOR>a</COLOR><COLOR>b</COLOR><EMPTY>x</EMPTY></UI>",
         "<UI><COLOR>new</COLOR><EMPTY/></UI>\n"},
    };
    for (const Case& each : cases) {
        m_folder.Write("job.xml", std::string(Head) + each.before);
        EXPECT_EQ(Store({{"COLOR", "new"}, {"EMPTY", ""}}), std::string(Head) + each.after);
        const std::string once = ReadBytes(m_file);
        EXPECT_EQ(Store({{"COLOR", "new"}, {"EMPTY", ""}}), once) << "again";
        EXPECT_EQ(FilesBeside(), 1U);
    }
}

TEST_F(SettingsFileTest, AnyTextComesBack) {
    const wxString text = wxString::FromUTF8("<&>\"' \xC3\xA4\xF0\x9F\x98\x80");
    Store({{"PRINTER", text}});
    const std::string once = ReadBytes(m_file);
    EXPECT_THAT(once, HasSubstr("&lt;&amp;&gt;"));
    EXPECT_EQ(Store({{"PRINTER", text}}), once);
}

TEST_F(SettingsFileTest, AFileThatCannotBeReplacedStaysWhole) {
    const std::string broken = "<UI><COLOR>";
    m_folder.Write("job.xml", broken);
    EXPECT_TRUE(StoreSettings(m_file, {{"COLOR", "new"}})) << "somebody may want to mend it";
    EXPECT_EQ(ReadBytes(m_file), broken);

    fs::create_directory(m_folder / "folder");
    for (const auto& [name, reason] :
         {std::pair("none/job.xml", "its folder does not exist"), {"folder", "it is a folder"}}) {
        const auto notStored = StoreSettings(m_folder / name, {{"COLOR", "new"}});
        EXPECT_TRUE(notStored && notStored->what.StartsWith(reason));
        Fault fault; // and one is told before the work begins
        EXPECT_FALSE(Settings::LoadForEditing(m_folder / name, fault));
        EXPECT_TRUE(fault.what.StartsWith(reason)) << fault.what;
    }
    EXPECT_EQ(FilesBeside(), 2U) << "no temporary file";
}

TEST_F(SettingsFileTest, ALinkAndThePermissionsStay) {
    const fs::path target = m_folder.Write("target.xml", "<UI/>");
    fs::permissions(target, fs::perms::owner_read | fs::perms::owner_write);
    std::error_code error;
    fs::create_symlink(target, m_file, error);
    if (error)
        GTEST_SKIP() << "no links here: " << error.message();
    Store({{"COLOR", "new"}});
    EXPECT_TRUE(fs::is_symlink(m_file));
    EXPECT_EQ(fs::status(target).permissions(), fs::perms::owner_read | fs::perms::owner_write);
    EXPECT_THAT(ReadBytes(target), HasSubstr("new"));
}

} // namespace
