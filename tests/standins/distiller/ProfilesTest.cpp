#include "tests/standins/Viewers.h"
#include "tests/standins/distiller/BridgeTest.h"
#include "tests/support/RegistryText.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

/// The folder "Mine" is that of the user's own profiles.
class ProfilesTest : public BridgeTest {
protected:
    void SetUp() override {
        fs::create_directories(m_files / "Mine/nested/deep");
        HandOver(L"UserProfiles", m_files / "Mine");
        HandOver(L"JobOptionsFolder", JOB_OPTIONS_FOLDER);
        BridgeTest::SetUp();
    }

    /// What the host does with a folder of profiles.
    static void HandOver(const wchar_t* name, const fs::path& folder) {
        WriteRegistryText(HKEY_CURRENT_USER, L"SOFTWARE\\Orvanta\\Distiller Stand-In", name,
                          folder.wstring());
    }

    /// @return the PDF file
    fs::path ConvertPicture(const std::string& profile) {
        fs::path pdf = m_files / "picture.pdf";
        EXPECT_EQ(0, Convert(m_files.Write("picture.ps", PictureProgram), pdf, profile)) << profile;
        return pdf;
    }
};

} // namespace

TEST_F(ProfilesTest, EachOfOursIsApplied) {
    struct {
        const char* profile;
        const char* version;
        const char* width; ///< of the picture, which has one inch, in pixels
        bool isFontEmbedded;
    } const profiles[] = {
        {"", "1.7", "600", false}, // Ghostscript's own defaults
        {"Press Quality.joboptions", "1.4", "300", true},
        {"Print.joboptions", "1.5", "200", true},
        {"Smallest File.joboptions", "1.6", "100", false},
    };
    for (const auto& [profile, version, width, isFontEmbedded] : profiles) {
        const fs::path pdf = ConvertPicture(profile);
        EXPECT_THAT(ReadBytes(pdf), StartsWith(std::string("%PDF-") + version)) << profile;
        EXPECT_THAT(ReadBytes(pdf), HasSubstr(std::string("/Width ") + width)) << profile;
        EXPECT_THAT(PdfFonts(pdf), testing::ElementsAre(testing::Pair("Helvetica", isFontEmbedded)))
            << profile;
    }
}

TEST_F(ProfilesTest, TheUsersOwnComeFirstWhereverTheyLie) {
    const std::pair<std::string, std::string> versions[] = {
        {"Mine/nested/deep/Mine ä.joboptions", "1.3"},
        {"Mine/nested/Print.joboptions", "1.2"},
        {"Mine/.hidden.joboptions", "1.6"},
    };
    for (const auto& [path, version] : versions)
        m_files.Write(path, "<< /CompatibilityLevel " + version + " >> setdistillerparams\n");
    fs::create_directory_symlink(m_files / "Mine", m_files / "Mine/nested/round");
    for (const auto& [path, version] : versions)
        EXPECT_THAT(ReadBytes(ConvertPicture(fs::path(path).filename())),
                    StartsWith("%PDF-" + version));
    EXPECT_THAT(ReadBytes(ConvertPicture("Press Quality.joboptions")), StartsWith("%PDF-1.4"));
}

TEST_F(ProfilesTest, OneThatCannotBeAppliedIsAFailureWithAReason) {
    SetLimit("TotalSeconds", 5);
    for (const char* profile :
         {"Nope.joboptions", "Print", "../JobOptions/Print.joboptions", "nested"})
        EXPECT_THAT(Failure(PictureProgram, profile),
                    HasSubstr("there is no profile \"" + std::string(profile) + "\" in "));
    const std::pair<const char*, const char*> profiles[] = {
        {"", "cannot be used: it is empty"},
        {"<< /CompatibilityLevel 1.4 >> setdistilerparams",
         "found an error in the profile: undefined in setdistilerparams"},
        {"<< /ColorImageResolution (many) >> setdistillerparams",
         "found an error in the profile: "},
        {"<< /CompatibilityLevel (", "found an error in the profile: syntaxerror in "},
        {"quit", "the profile ends Ghostscript's work"},
        {EndlessProgram, "took longer than 5 seconds"},
    };
    for (const auto& [profile, reason] : profiles) {
        m_files.Write("Mine/mine.joboptions", profile);
        EXPECT_THAT(Failure(PictureProgram, "mine.joboptions"), HasSubstr(reason)) << profile;
    }
}
