#include "pstools/DistillerDiscovery.h"

#include "tests/support/RegistryText.h"
#include "tests/support/TemporaryFolder.h"

#include <wx/filename.h>

#include <gtest/gtest.h>

namespace {

constexpr wchar_t Adobe[] = L"SOFTWARE\\Adobe";

class DistillerDiscoveryTest : public testing::Test {
protected:
    void SetUp() override { TearDown(); }
    void TearDown() override {
        for (const HKEY root : {HKEY_LOCAL_MACHINE, HKEY_CURRENT_USER})
            RegDeleteTreeW(root, Adobe);
    }

    static void EnterDistiller(const wchar_t* version, const wchar_t* name,
                               const std::wstring& text) {
        WriteRegistryText(HKEY_LOCAL_MACHINE,
                          std::wstring(Adobe) + L"\\Acrobat Distiller\\" + version, name, text);
    }
    static void EnterForUser(const wchar_t* key, const std::wstring& text) {
        WriteRegistryText(HKEY_CURRENT_USER, std::wstring(Adobe) + key, L"", text);
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

TEST_F(DistillerDiscoveryTest, AsksTheNewestDistillerOnly) {
    EXPECT_EQ("as it was", JobOptionsFolder());
    EnterDistiller(L"5.0", L"InstallPath", L"five");
    const wxString five = wxString("five") + wxFILE_SEP_PATH + "Settings" + wxFILE_SEP_PATH;
    EXPECT_EQ(five, JobOptionsFolder());
    EnterForUser(L"\\Acrobat Distiller\\AdobePDFSettings", L"user's");
    EXPECT_EQ("user's", JobOptionsFolder());
    for (const wchar_t* version : {L"6.0", L"7.0", L"8.0", L"9.0"}) {
        EnterDistiller(version, L"Other", L"value");
        EXPECT_EQ(five, JobOptionsFolder()) << version; // entered without a folder
        EnterDistiller(version, L"JobOptionsFolder", version);
        EXPECT_EQ(version, JobOptionsFolder());
    }
}

TEST_F(DistillerDiscoveryTest, TakesAPathAsItStandsAndNoneLongerThanWindowsAllows) {
    WriteRegistryText(HKEY_LOCAL_MACHINE, std::wstring(Adobe) + L"\\Acrobat Distiller\\9.0",
                      L"JobOptionsFolder", L"%PATH%", REG_EXPAND_SZ);
    EXPECT_EQ("%PATH%", JobOptionsFolder());
    EnterDistiller(L"9.0", L"JobOptionsFolder", std::wstring(259, L'p'));
    EXPECT_EQ(wxString(259, 'p'), JobOptionsFolder());
    EnterDistiller(L"9.0", L"JobOptionsFolder", std::wstring(260, L'p'));
    EXPECT_EQ("as it was", JobOptionsFolder());
}

TEST_F(DistillerDiscoveryTest, ListsTheUsersProfilesAndThenDistillersInOrder) {
    EXPECT_EQ("", Profiles());
    const TemporaryFolder folders;
    std::filesystem::create_directories(folders / "own/deeper");
    std::filesystem::create_directories(folders / "shipped/B below");
    for (const char* file :
         {"own/deeper/Mine.joboptions", "shipped/Standard.joboptions", "shipped/press.joboptions",
          "shipped/.hidden", "shipped/B below/Zebra.joboptions"})
        folders.Write(file, "x");
    EnterForUser(L"\\PDF Settings", (folders / "own").wstring());
    EnterDistiller(L"9.0", L"JobOptionsFolder", (folders / "shipped").wstring());
    EXPECT_EQ("Mine.joboptions .hidden Zebra.joboptions Standard.joboptions press.joboptions",
              Profiles());
    EnterForUser(L"\\PDF Settings", L"");
    EnterDistiller(L"9.0", L"JobOptionsFolder", (folders / "gone").wstring());
    EXPECT_EQ("", Profiles());
}

} // namespace
