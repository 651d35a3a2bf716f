// Files of which only this system knows.

#include "host/program/system/FileIdentity.h"
#include "tests/host/ScreenRun.h"

#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

using namespace std::string_literals;

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

TEST_F(SpecialFilesTest, AreLookedAtThemselves) {
    ASSERT_EQ(mkfifo((m_folder / "pipe").c_str(), 0600), 0);
    fs::create_symlink("pipe", m_folder / "link");
    std::error_code error;
    EXPECT_EQ(LookAt(m_folder / "pipe", error).type, fs::file_type::fifo);
    EXPECT_EQ(LookAt(m_folder / "link", error).type, fs::file_type::symlink);
    EXPECT_EQ(LookAt("/dev/null", error).type, fs::file_type::character);
}

TEST_F(SpecialFilesTest, ThatAreNamedOutOfTheOrdinaryAreShownOnOneLine) {
    ExpectShown("\"quotes\".doc", "\"quotes\".doc");
    ExpectShown("two\nlines\t.doc", "two\\nlines\\t.doc");
    ExpectShown("\x1b[31mred.doc", "\\x1b[31mred.doc");
    ExpectShown(std::string(250, 'l') + ".doc", std::string(250, 'l') + ".doc");
    ExpectRefused(m_folder / std::string(300, 'n').append(".doc"), -1002, "too long");
}

TEST_F(SpecialFilesTest, ThatAreNotNamedByTextAreRefusedAndNotLost) {
    for (const char* name : {"br\xFC"
                             "cke.doc",
                             "half\xED\xA0\x80.doc", "over\xC0\xAF.doc"}) {
        const fs::path path = m_folder.Write(name, "script");
        ExpectRefused(path, -1005, "not valid UTF-8");
        std::string hex;
        for (const char byte : path.string())
            hex += "0123456789abcdef"s[static_cast<unsigned char>(byte) >> 4U],
                hex += "0123456789abcdef"s[static_cast<unsigned char>(byte) & 15U];
        EXPECT_EQ(Screen(path, 1)["inputBytes"], hex);
    }
    const RunResult run = RunQuillon({"screen", (m_folder / "br\xFC"
                                                            "cke.doc")
                                                    .string()});
    EXPECT_THAT(run.out, HasSubstr("/br\\xfccke.doc: refused"));
    const RunResult into = RunQuillon({"convert", m_folder.Write("a.doc", "script").string(),
                                       "--out", (m_folder / "\xE4").string()});
    EXPECT_EQ(into.exitCode, 3);
    EXPECT_THAT(into.err, HasSubstr("UTF-8"));
    EXPECT_FALSE(fs::exists(m_folder / "\xE4"));
}

} // namespace
