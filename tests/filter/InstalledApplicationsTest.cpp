#include "office/InstalledApplications.h"

#include "machine/InstalledOffice.h"
#include "tests/support/RegistryText.h"

#include <wx/log.h>

#include <gtest/gtest.h>

namespace {

using Query = std::pair<std::wstring, bool (*)()>;

const Query InstallationQueries[] = {
    {L"Word.Application", IsWordInstalled},
    {L"Excel.Application", IsExcelInstalled},
    {L"PowerPoint.Application", IsPowerPointInstalled},
    {L"Publisher.Application", IsPublisherInstalled},
};
const Query VersionQueries[] = {
    {L"Word.Application", IsWord12OrLater},
    {L"Excel.Application", IsExcel12OrLater},
    {L"PowerPoint.Application", IsPowerPoint12OrLater},
};

class InstalledApplicationsTest : public testing::Test {
protected:
    void SetUp() override { Clear(); }
    void TearDown() override { Clear(); }

    static void Clear() {
        for (const auto& [progId, isInstalled] : InstallationQueries)
            RegDeleteTreeW(HKEY_CLASSES_ROOT, progId.c_str());
        for (const HKEY root : {HKEY_LOCAL_MACHINE, HKEY_CURRENT_USER})
            RegDeleteTreeW(root, L"SOFTWARE\\Microsoft\\Office");
    }

    static void Register(const std::wstring& progId) {
        WriteRegistryText(HKEY_CLASSES_ROOT, progId, L"", L"An application");
    }
    /// A key without a default value.
    static void RegisterNameless(const std::wstring& progId) {
        WriteRegistryText(HKEY_CLASSES_ROOT, progId, L"Other", L"value");
    }
};

TEST_F(InstalledApplicationsTest, KnowsAnApplicationByTheNameOfItsProgId) {
    for (const auto& [registered, isRegisteredInstalled] : InstallationQueries) {
        RegisterNameless(registered);
        EXPECT_FALSE(isRegisteredInstalled());
        EXPECT_FALSE(IsOfficeInstalled());
        Register(registered);
        EXPECT_TRUE(IsOfficeInstalled());
        for (const auto& [progId, isInstalled] : InstallationQueries)
            EXPECT_EQ(progId == registered, isInstalled());
        Clear();
    }
}

TEST_F(InstalledApplicationsTest, TellsThePublisherThatAutomationCanDrive) {
    const std::wstring office = L"SOFTWARE\\Microsoft\\Office\\";
    for (const HKEY root : {HKEY_LOCAL_MACHINE, HKEY_CURRENT_USER}) {
        for (const wchar_t* version : {L"8.0", L"9.0"}) {
            WriteRegistryText(root, office + version + L"\\Publisher", L"Any", L"value");
            EXPECT_EQ(1, GetPublisherInstallLevel());
            EXPECT_TRUE(IsPublisherInstalled());
            RegisterNameless(L"Publisher.Application"); // hides the old keys
            EXPECT_EQ(0, GetPublisherInstallLevel());
            Register(L"Publisher.Application");
            EXPECT_EQ(2, GetPublisherInstallLevel());
            Clear();
        }
    }
    WriteRegistryText(HKEY_LOCAL_MACHINE, office + L"10.0\\Publisher", L"Any", L"value");
    EXPECT_EQ(0, GetPublisherInstallLevel());
}

TEST_F(InstalledApplicationsTest, ReadsTheVersionAtTheEndOfCurVer) {
    const std::pair<const wchar_t*, bool> cases[] = {
        {L"App.Application.12", true},
        {L"App.Application.11", false},
        {L"App.Application.12.", true},
        {L"App.Application.16beta", true},
        {L"App.Application.12.1", false},
        {L"App.Application.+12", false},
        {L"App.Application.-3", false},
        {L"App.Application", false},
        {L"16", true},
        {L"", false},
    };
    class FailingLog : public wxLog { // wxWidgets would show a window
        void DoLogRecord(wxLogLevel, const wxString& record, const wxLogRecordInfo&) override {
            ADD_FAILURE() << record;
        }
    } log;
    wxLog* const target = wxLog::SetActiveTarget(&log);
    for (const auto& [application, is12OrLater] : VersionQueries) {
        Register(application);
        EXPECT_FALSE(is12OrLater()); // no CurVer
        RegisterNameless(application + L"\\CurVer");
        EXPECT_FALSE(is12OrLater());
        for (const auto& [currentVersion, expected] : cases) {
            WriteRegistryText(HKEY_CLASSES_ROOT, application + L"\\CurVer", L"", currentVersion);
            EXPECT_EQ(expected, is12OrLater()) << currentVersion;
        }
    }
    wxLog::SetActiveTarget(target);
}

} // namespace
