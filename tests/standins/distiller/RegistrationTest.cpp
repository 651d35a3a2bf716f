#include "tests/standins/distiller/BridgeTest.h"

#include <wx/msw/registry.h>

#include <gmock/gmock.h>

#include <cstdlib>

namespace fs = std::filesystem;

namespace {

class DistillerRegistrationTest : public BridgeTest {
protected:
    void TearDown() override {
        BridgeTest::TearDown();
        EXPECT_EQ(0, CallRegistration("DllRegisterServer"));
    }

    /// Registers anew with what a folder named "bin" holds.
    static void Register(const fs::path& bin) {
        setenv("PATH", bin.c_str(), 1);
        EXPECT_EQ(0, CallRegistration("DllRegisterServer"));
    }

    /// @return empty when there is none
    static std::string Text(const char* path, const char* name) {
        const wxRegKey key(wxRegKey::HKLM, path);
        wxString text;
        if (key.Exists() && key.HasValue(name))
            key.QueryValue(name, text);
        return text.utf8_string();
    }

    static std::string Folder() {
        return Text("SOFTWARE\\Adobe\\Acrobat Distiller\\9.0", "JobOptionsFolder");
    }
    static std::string Engine() { return Text("SOFTWARE\\Orvanta\\Distiller Stand-In", "Engine"); }
};

} // namespace

TEST_F(DistillerRegistrationTest, EntersTheEngineAndTheProfiles) {
    EXPECT_THAT(Engine(), testing::MatchesRegex("Ghostscript [0-9]+[.][0-9.]+"));
    EXPECT_EQ(fs::path(JOB_OPTIONS_FOLDER), fs::path(Folder()));
    EXPECT_TRUE(fs::exists(fs::path(Folder()) / "Smallest File.joboptions"));
    EXPECT_EQ(0, CallRegistration("DllUnregisterServer"));
    EXPECT_EQ("", Engine() + Folder());
}

TEST_F(DistillerRegistrationTest, EntersWhatIsInstalled) {
    Register(m_files / "bin"); // where nothing is
    EXPECT_EQ("", Engine() + Folder());

    fs::create_directory(m_files / "bin");
    const fs::path program = m_files.Write("bin/gs", "");
    Register(m_files / "bin");
    EXPECT_EQ("", Engine()); // it cannot be run
    fs::permissions(program, fs::perms::owner_all);
    Register(m_files / "bin");
    EXPECT_EQ("Ghostscript", Engine());
    fs::create_directories(m_files / "share/ghostscript/fonts");
    fs::create_directories(m_files / "share/ghostscript/11.2");
    Register(m_files / "bin");
    EXPECT_EQ("Ghostscript 11.2", Engine());
    fs::create_directories(m_files / "share/ghostscript/11.3");
    Register(m_files / "bin");
    EXPECT_EQ("Ghostscript", Engine()); // of one version or the other
}
