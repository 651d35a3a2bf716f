#include "pstools/DistillerDiscovery.h"

#include "tests/support/RegistryText.h"
#include "tests/support/TemporaryFolder.h"

#include <wx/filename.h>

#include <gtest/gtest.h>

namespace {

constexpr wchar_t Adobe[] = L"SOFTWARE\\Adobe";
constexpr wchar_t Orvanta[] = L"SOFTWARE\\Orvanta";

class DistillerDiscoveryTest : public testing::Test {
protected:
    void SetUp() override { TearDown(); }
    void TearDown() override {
        for (const HKEY root : {HKEY_LOCAL_MACHINE, HKEY_CURRENT_USER}) {
            RegDeleteTreeW(root, Adobe);
            RegDeleteTreeW(root, Orvanta);
        }
    }

    static void EnterDistiller(const wchar_t* version, const wchar_t* name,
                               const std::wstring& text) {
        WriteRegistryText(HKEY_LOCAL_MACHINE,
                          std::wstring(Adobe) + L"\\Acrobat Distiller\\" + version, name, text);
    }

    static wxString JobOptionsFolder() {
        wxString folder = "as it was";
        GetJobOptionsFolder(folder);
        return folder;
    }

    static wxString Profiles() {
        wxArrayString profiles;
        GetDistillerProfiles(profiles);
        return wxJoin(profiles, ' ');
    }
};

TEST_F(DistillerDiscoveryTest, FindsTheFolderOfFiltersByTheInstallation) {
    wxString folder = "as it was";
    GetFiltersFolder(folder);
    EXPECT_EQ("as it was", folder);

    WriteRegistryText(HKEY_LOCAL_MACHINE, L"SOFTWARE\\Orvanta\\Marlo Quillon", L"InstallPath",
                      L"/opt/quillon");
    GetFiltersFolder(folder);
    EXPECT_EQ(wxString("/opt/quillon") + wxFILE_SEP_PATH + "Filters", folder);
}

TEST_F(DistillerDiscoveryTest, AsksTheNewestDistillerOnly) {
    EXPECT_EQ("as it was", JobOptionsFolder());

    EnterDistiller(L"5.0", L"InstallPath", L"five");
    const wxString five = wxString("five") + wxFILE_SEP_PATH + "Settings" + wxFILE_SEP_PATH;
    EXPECT_EQ(five, JobOptionsFolder());

    WriteRegistryText(HKEY_CURRENT_USER,
                      std::wstring(Adobe) + L"\\Acrobat Distiller\\AdobePDFSettings", L"",
                      L"user's");
    EXPECT_EQ("user's", JobOptionsFolder());

    for (const wchar_t* version : {L"6.0", L"7.0", L"8.0", L"9.0"}) {
        EnterDistiller(version, L"Other", L"value");
        EXPECT_EQ(five, JobOptionsFolder()) << version; // entered without a folder
        EnterDistiller(version, L"JobOptionsFolder", version);
        EXPECT_EQ(version, JobOptionsFolder());
    }
}

TEST_F(DistillerDiscoveryTest, TakesNoPathLongerThanWindowsAllows) {
    EnterDistiller(L"9.0", L"JobOptionsFolder", std::wstring(259, L'p'));
    EXPECT_EQ(wxString(259, 'p'), JobOptionsFolder());
    EnterDistiller(L"9.0", L"JobOptionsFolder", std::wstring(260, L'p'));
    EXPECT_EQ("as it was", JobOptionsFolder());
}

TEST_F(DistillerDiscoveryTest, ListsTheUsersProfilesAndThenDistillersInOrder) {
    EXPECT_EQ("", Profiles());
    const TemporaryFolder folders;
    const auto own = folders / "own";
    const auto shipped = folders / "shipped";
    std::filesystem::create_directories(own / "deeper");
    std::filesystem::create_directories(shipped / "B below");
    WriteRegistryText(HKEY_CURRENT_USER, std::wstring(Adobe) + L"\\PDF Settings", L"",
                      own.wstring());
    EnterDistiller(L"9.0", L"JobOptionsFolder", shipped.wstring());
    EXPECT_EQ("", Profiles());

    folders.Write("own/deeper/Mine.joboptions", "x");
    for (const char* name : {"Standard.joboptions", "press.joboptions", ".hidden", "Press.txt"})
        folders.Write(std::filesystem::path("shipped") / name, "x");
    folders.Write("shipped/B below/Zebra.joboptions", "x");
    EXPECT_EQ("Mine.joboptions .hidden Zebra.joboptions Press.txt Standard.joboptions "
              "press.joboptions",
              Profiles());

    folders.Write("own/Standard.joboptions", "x"); // in both places, and so twice
    EXPECT_EQ(2U, Profiles().Freq('S'));

    EnterDistiller(L"9.0", L"JobOptionsFolder", (folders / "gone").wstring());
    WriteRegistryText(HKEY_CURRENT_USER, std::wstring(Adobe) + L"\\PDF Settings", L"", L"");
    EXPECT_EQ("", Profiles());
}

} // namespace
