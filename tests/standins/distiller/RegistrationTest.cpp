#include "tests/standins/distiller/BridgeTest.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;

namespace {

class DistillerRegistrationTest : public BridgeTest {
protected:
    static std::string Folder() {
        return MachineText("SOFTWARE\\Adobe\\Acrobat Distiller\\9.0", "JobOptionsFolder");
    }
};

} // namespace

TEST_F(DistillerRegistrationTest, EntersTheEngineAndTheProfiles) {
    EXPECT_THAT(Engine(), testing::MatchesRegex("Ghostscript [0-9]+[.][0-9.]+"));
    EXPECT_EQ(fs::path(JOB_OPTIONS_FOLDER), fs::path(Folder()));
    EXPECT_TRUE(fs::exists(fs::path(Folder()) / "Smallest File.joboptions"));
    Call("DllUnregisterServer");
    EXPECT_EQ("", Engine() + Folder());
    EXPECT_THAT(Failure(WordsProgram("")), testing::HasSubstr("no Ghostscript was found"));
}

TEST_F(DistillerRegistrationTest, EntersWhatIsInstalled) {
    RegisterWithPath(m_files / "bin"); // where nothing is
    EXPECT_EQ("", Engine() + Folder());

    fs::create_directory(m_files / "bin");
    const fs::path program = m_files.Write("bin/gs", "");
    RegisterWithPath(m_files / "bin");
    EXPECT_EQ("", Engine()); // it cannot be run
    fs::permissions(program, fs::perms::owner_all);
    RegisterWithPath(m_files / "bin");
    EXPECT_EQ("Ghostscript", Engine());
    fs::create_directories(m_files / "share/ghostscript/fonts");
    fs::create_directories(m_files / "share/ghostscript/11.2");
    RegisterWithPath(m_files / "bin");
    EXPECT_EQ("Ghostscript 11.2", Engine());
    fs::create_directories(m_files / "share/ghostscript/11.3");
    RegisterWithPath(m_files / "bin");
    EXPECT_EQ("Ghostscript", Engine()); // of one version or the other
}
