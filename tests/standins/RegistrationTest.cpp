#include "office/InstalledApplications.h"
#include "tests/standins/OfficeTest.h"
#include "tests/support/RegistryText.h"

#include <gmock/gmock.h>

#include <cstdlib>

namespace fs = std::filesystem;

namespace {

class RegistrationTest : public OfficeTest {
protected:
    /// Adds files to the program folder of a LibreOffice, and registers what that serves.
    void Install(const std::vector<std::string>& files) const {
        for (const std::string& file : files)
            fs::permissions(m_files.Write("program/" + file, ""), fs::perms::owner_all);
        RegisterWithPath(m_files / "bin");
    }

    /// The applications that the filter finds: "Word PowerPoint ".
    static std::string Installed() {
        return std::string(IsWordInstalled() ? "Word " : "") +
               (IsExcelInstalled() ? "Excel " : "") +
               (IsPowerPointInstalled() ? "PowerPoint " : "") +
               (IsPublisherInstalled() ? "Publisher " : "");
    }
};

} // namespace

TEST_F(RegistrationTest, EntersLibreOfficeWhereverItIsFound) {
    EXPECT_EQ("Word Excel PowerPoint Publisher ", Installed());
    EXPECT_TRUE(IsWord12OrLater() && IsExcel12OrLater() && IsPowerPoint12OrLater());
    EXPECT_THAT(Engine(), testing::MatchesRegex("LibreOffice [0-9]+[.][0-9.]+"));
    unsetenv("PATH"); // the usual folders remain
    Call("DllUnregisterServer");
    EXPECT_EQ("", Installed() + Engine());
    Call("DllRegisterServer");
    EXPECT_EQ("Word Excel PowerPoint Publisher ", Installed());
}

TEST_F(RegistrationTest, EntersWhatTheInstalledPartsServe) {
    fs::create_directory(m_files / "bin");
    fs::create_directory(m_files / "program");
    fs::create_symlink("../program/soffice", m_files / "bin/soffice");
    RegisterWithPath(m_files / "bin"); // where nothing is
    EXPECT_EQ("", Installed() + Engine());
    Install({"soffice"}); // a script of that name is no LibreOffice
    EXPECT_EQ("", Installed() + Engine());
    Install({"soffice.bin", "libsclo.so"});
    EXPECT_EQ("Excel ", Installed());
    Install({"libsdlo.so"});
    EXPECT_EQ("Excel PowerPoint ", Installed()); // Draw alone reads no publications
    EXPECT_EQ("LibreOffice", Engine());          // of no known version
}

TEST_F(RegistrationTest, EntriesOfOthersStayWhenOursGo) {
    Call("DllUnregisterServer");
    WriteRegistryText(HKEY_CLASSES_ROOT, L"Word.Application", L"", L"Another's Word");
    Call("DllUnregisterServer");
    EXPECT_EQ("Word ", Installed());
    RegDeleteTreeW(HKEY_CLASSES_ROOT, L"Word.Application");
}
