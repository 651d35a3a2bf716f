#include "office/InstalledApplications.h"

#include "tests/support/RegistryText.h"

#include <gtest/gtest.h>

namespace {

class InstalledApplicationsTest : public testing::Test {
protected:
    void SetUp() override { Clear(); }
    void TearDown() override { Clear(); }

    static void Clear() {
        for (const wchar_t* progId : {L"Word.Application", L"Excel.Application",
                                      L"PowerPoint.Application", L"Publisher.Application"})
            RegDeleteTreeW(HKEY_CLASSES_ROOT, progId);
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
    const struct {
        const wchar_t* progId;
        bool (*isInstalled)();
    } applications[] = {
        {L"Word.Application", IsWordInstalled},
        {L"Excel.Application", IsExcelInstalled},
        {L"PowerPoint.Application", IsPowerPointInstalled},
        {L"Publisher.Application", IsPublisherInstalled},
    };
    for (const auto& one : applications) {
        EXPECT_FALSE(one.isInstalled());
        EXPECT_FALSE(IsOfficeInstalled());
        RegisterNameless(one.progId);
        EXPECT_FALSE(one.isInstalled());
        Register(one.progId);
        for (const auto& other : applications)
            EXPECT_EQ(&one == &other, other.isInstalled());
        EXPECT_TRUE(IsOfficeInstalled());
        Clear();
    }
}

TEST_F(InstalledApplicationsTest, TellsThePublisherThatAutomationCanDrive) {
    EXPECT_EQ(0, GetPublisherInstallLevel());
    for (const HKEY root : {HKEY_LOCAL_MACHINE, HKEY_CURRENT_USER}) {
        for (const wchar_t* version : {L"8.0", L"9.0"}) {
            WriteRegistryText(
                root, std::wstring(L"SOFTWARE\\Microsoft\\Office\\") + version + L"\\Publisher",
                L"Any", L"value");
            EXPECT_EQ(1, GetPublisherInstallLevel());
            EXPECT_TRUE(IsPublisherInstalled());

            RegisterNameless(L"Publisher.Application"); // hides the old keys
            EXPECT_EQ(0, GetPublisherInstallLevel());
            Register(L"Publisher.Application");
            EXPECT_EQ(2, GetPublisherInstallLevel());
            Clear();
        }
    }
    WriteRegistryText(HKEY_LOCAL_MACHINE, L"SOFTWARE\\Microsoft\\Office\\10.0\\Publisher", L"Any",
                      L"value");
    EXPECT_EQ(0, GetPublisherInstallLevel());
}

TEST_F(InstalledApplicationsTest, FindsTheApplicationOfAnExtension) {
    const struct {
        const wchar_t* progId;
        std::vector<const char*> extensions;
    } applications[] = {
        {L"Word.Application", {"doc", "docx", "DOCX", "Doc"}},
        {L"Excel.Application", {"xls", "xlsx"}},
        {L"PowerPoint.Application", {"ppt", "pptx", "pps", "ppsx", "PpSx"}},
        {L"Publisher.Application", {"pub"}},
    };
    for (const auto& installed : applications) {
        Register(installed.progId);
        for (const auto& asked : applications)
            for (const char* extension : asked.extensions)
                EXPECT_EQ(&installed == &asked, IsApplicationInstalledForExtension(extension))
                    << extension;
        Clear();
    }
    Register(L"Word.Application");
    for (const char* extension : {"", "rtf", ".doc", "docm"})
        EXPECT_FALSE(IsApplicationInstalledForExtension(extension)) << extension;
}

TEST_F(InstalledApplicationsTest, ReadsTheVersionAtTheEndOfCurVer) {
    const struct {
        const wchar_t* currentVersion;
        bool is12OrLater;
    } cases[] = {
        {L"App.Application.12", true},
        {L"App.Application.16", true},
        {L"App.Application.11", false},
        {L"App.Application", false},
        {L"App.Application.", false},
        {L"App.Application.12.", true},
        {L"App.Application..12", true},
        {L"App.Application.12.1", false},
        {L"App.Application.-3", false},
        {L"App.Application.+12", false},
        {L"App.Application. 12", false},
        {L"App.Application.012", true},
        {L"App.Application.16beta", true},
        {L"16", true},
        {L"", false},
    };
    const struct {
        const wchar_t* progId;
        bool (*is12OrLater)();
    } applications[] = {
        {L"Word.Application", IsWord12OrLater},
        {L"Excel.Application", IsExcel12OrLater},
        {L"PowerPoint.Application", IsPowerPoint12OrLater},
    };
    for (const auto& application : applications) {
        Register(application.progId);
        EXPECT_FALSE(application.is12OrLater()); // no CurVer
        for (const auto& one : cases) {
            WriteRegistryText(HKEY_CLASSES_ROOT, std::wstring(application.progId) + L"\\CurVer",
                              L"", one.currentVersion);
            EXPECT_EQ(one.is12OrLater, application.is12OrLater()) << one.currentVersion;
        }
        Clear();
    }
}

} // namespace
