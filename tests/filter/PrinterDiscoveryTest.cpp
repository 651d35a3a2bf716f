#include "pstools/PrinterDiscovery.h"

#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <gtest/gtest.h>

#include <set>

namespace {

constexpr wchar_t DistillerDriver[] = L"AdobePS Acrobat Distiller";

class PrinterDiscoveryTest : public testing::Test {
protected:
    std::wstring DriverFile(const char* name) const { return m_folder.Write(name, "x").wstring(); }

private:
    TemporaryFolder m_folder;
};

TEST_F(PrinterDiscoveryTest, KnowsTheDistillerPrinterByItsDriversExactName) {
    const std::wstring ppd = DriverFile("a.ppd");
    const TestPrinter longer(L"Test longer", std::wstring(DistillerDriver) + L" 2", ppd);
    const TestPrinter shorter(L"Test shorter", L"Acrobat Distiller", ppd);
    wxString name = "as it was";
    EXPECT_FALSE(FindDistillerPrinter(name));
    EXPECT_EQ("as it was", name);

    const TestPrinter first(L"Test Adobe PDF", DistillerDriver, ppd);
    const TestPrinter second(L"Test other PDF", DistillerDriver, ppd);
    EXPECT_TRUE(FindDistillerPrinter(name));
    EXPECT_TRUE(name == "Test Adobe PDF" || name == "Test other PDF") << name;
}

TEST_F(PrinterDiscoveryTest, AppendsThePrintersOfDriversWithAPpd) {
    const TestPrinter small(L"Test small", L"Driver 1", DriverFile("a.ppd"));
    const TestPrinter capitals(L"Test capitals", L"Driver 2", DriverFile("b.PPD"));
    const TestPrinter backup(L"Test backup", L"Driver 3", DriverFile("c.ppd.bak"));
    const TestPrinter other(L"Test other", L"Driver 4", DriverFile("d.gpd"));
    const TestPrinter none(L"Test none", L"Driver 5", DriverFile("ppd"));
    wxArrayString printers;
    printers.Add("Test before");
    ListPostScriptPrinters(printers);
    std::set<wxString> ours; // without those that the machine has
    for (const wxString& printer : printers)
        if (printer.StartsWith("Test "))
            ours.insert(printer);
    EXPECT_EQ((std::set<wxString>{"Test before", "Test capitals", "Test small"}), ours);
}

} // namespace
