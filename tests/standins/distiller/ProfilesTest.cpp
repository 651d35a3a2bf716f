#include "tests/standins/distiller/BridgeTest.h"
#include "tests/standins/distiller/PdfFile.h"
#include "tests/support/RegistryText.h"

#include <wx/string.h>

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using testing::HasSubstr;

namespace {

constexpr const wchar_t* UserProfilesKey = L"SOFTWARE\\Adobe\\PDF Settings";

class ProfilesTest : public BridgeTest {
protected:
    /// Makes a folder of the user's own profiles.
    void AddUserFolder() {
        fs::create_directories(m_files / "Mine/nested/deep");
        WriteRegistryText(HKEY_CURRENT_USER, UserProfilesKey, L"", (m_files / "Mine").wstring());
    }

    PdfFile ConvertPicture(const std::string& profile) {
        const fs::path postScript = m_files.Write("picture.ps", PictureProgram);
        const fs::path pdf = m_files / "picture.pdf";
        EXPECT_EQ(0, Convert(postScript, pdf, profile)) << profile;
        return ReadPdf(pdf);
    }
};

std::string Version(const char* version) {
    return std::string("<< /CompatibilityLevel ") + version + " >> setdistillerparams\n";
}

} // namespace

TEST_F(ProfilesTest, EachOfOursIsApplied) {
    struct {
        const char* profile;
        const char* version;
        int pixelsPerInch;
        bool isFontEmbedded;
    } const profiles[] = {
        {"", "1.7", 600, false}, // Ghostscript's own defaults
        {"Press Quality.joboptions", "1.4", 300, true},
        {"Print.joboptions", "1.5", 200, true},
        {"Smallest File.joboptions", "1.6", 100, false},
    };
    for (const auto& [profile, version, pixelsPerInch, isFontEmbedded] : profiles) {
        const PdfFile pdf = ConvertPicture(profile);
        EXPECT_EQ(1, pdf.pages) << profile;
        EXPECT_EQ(version, pdf.version) << profile;
        EXPECT_EQ(pixelsPerInch, pdf.pictureWidth) << profile; // the picture has one inch
        EXPECT_THAT(pdf.embeddedFonts,
                    testing::ElementsAre(testing::Pair("Helvetica", isFontEmbedded)))
            << profile;
    }
}

TEST_F(ProfilesTest, TheUsersOwnComeFirstWhereverTheyLie) {
    AddUserFolder();
    m_files.Write("Mine/nested/deep/Mine \xC3\xA4.joboptions", Version("1.3"));
    m_files.Write("Mine/nested/Print.joboptions", Version("1.2"));
    m_files.Write("Mine/.hidden.joboptions", Version("1.6"));
    fs::create_directory_symlink(m_files / "Mine", m_files / "Mine/nested/round");
    EXPECT_EQ("1.3", ConvertPicture("Mine \xC3\xA4.joboptions").version);
    EXPECT_EQ("1.2", ConvertPicture("Print.joboptions").version);
    EXPECT_EQ("1.6", ConvertPicture(".hidden.joboptions").version);
    EXPECT_EQ("1.4", ConvertPicture("Press Quality.joboptions").version);
}

TEST_F(ProfilesTest, OneThatCannotBeAppliedIsAFailureWithAReason) {
    AddUserFolder();
    m_files.Write("Mine/empty.joboptions", "");
    m_files.Write("Mine/broken.joboptions", "<< /CompatibilityLevel 1.4 >> setdistilerparams");
    m_files.Write("Mine/range.joboptions", "<< /ColorImageResolution (many) >> setdistillerparams");
    m_files.Write("Mine/quitting.joboptions", "quit");
    m_files.Write("Mine/endless.joboptions", EndlessProgram);
    m_files.Write("Mine/cut.joboptions", "<< /CompatibilityLevel (");
    const std::pair<const char*, const char*> profiles[] = {
        {"Nope.joboptions", "there is no profile \"Nope.joboptions\" in "},
        {"Print", "there is no profile \"Print\" in "},
        {"../JobOptions/Print.joboptions", "there is no profile"},
        {"nested", "there is no profile"}, // a folder
        {"empty.joboptions", "cannot be used: it is empty"},
        {"broken.joboptions", "found an error in the profile: undefined in setdistilerparams"},
        {"range.joboptions", "found an error in the profile: "},
        {"quitting.joboptions", "the profile ends Ghostscript's work"},
        {"cut.joboptions", "found an error in the profile: syntaxerror in "},
        {"endless.joboptions", "took longer than 1 seconds"},
    };
    SetLimit(L"TotalSeconds", 1);
    for (const auto& [profile, reason] : profiles)
        EXPECT_THAT(Failure(PictureProgram, profile), HasSubstr(reason)) << profile;
}
