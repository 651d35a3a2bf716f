#include "pstools/PrinterDiscovery.h"

#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <gtest/gtest.h>

namespace {

constexpr wchar_t DistillerDriver[] = L"AdobePS Acrobat Distiller";

class PrinterDiscoveryTest : public testing::Test {
protected:
    std::wstring DriverFile(const char* name) const { return m_folder.Write(name, "x").wstring(); }

    /// The printers found, but for those that the machine had before.
    static wxArrayString Found() {
        wxArrayString printers;
        ListPostScriptPrinters(printers);
        wxArrayString ours;
        for (const wxString& printer : printers)
            if (printer.StartsWith("Test "))
                ours.Add(printer);
        return ours;
    }

private:
    TemporaryFolder m_folder;
};

TEST_F(PrinterDiscoveryTest, KnowsTheDistillerPrinterByItsDriversExactName) {
    wxString name = "as it was";
    EXPECT_FALSE(FindDistillerPrinter(name));
    EXPECT_EQ("as it was", name);

    const std::wstring ppd = DriverFile("a.ppd");
    const TestPrinter longer(L"Test longer", std::wstring(DistillerDriver) + L" 2", ppd);
    const TestPrinter shorter(L"Test shorter", L"Acrobat Distiller", ppd);
    EXPECT_FALSE(FindDistillerPrinter(name));
    EXPECT_EQ("as it was", name);

    const TestPrinter first(L"Test Adobe PDF", DistillerDriver, ppd);
    const TestPrinter second(L"Test other PDF", DistillerDriver, ppd);
    EXPECT_TRUE(FindDistillerPrinter(name));
    EXPECT_TRUE(name == "Test Adobe PDF" || name == "Test other PDF") << name;
}

TEST_F(PrinterDiscoveryTest, ListsThePrintersOfDriversWithAPpd) {
    EXPECT_TRUE(Found().empty());
    const TestPrinter small(L"Test small", L"Driver 1", DriverFile("a.ppd"));
    const TestPrinter capitals(L"Test capitals", L"Driver 2", DriverFile("b.PPD"));
    const TestPrinter backup(L"Test backup", L"Driver 3", DriverFile("c.ppd.bak"));
    const TestPrinter other(L"Test other", L"Driver 4", DriverFile("d.gpd"));
    const TestPrinter none(L"Test none", L"Driver 5", DriverFile("ppd"));

    wxArrayString found = Found();
    found.Sort();
    EXPECT_EQ("Test capitals,Test small", wxJoin(found, ','));
}

TEST_F(PrinterDiscoveryTest, AppendsToTheList) {
    const TestPrinter printer(L"Test one", L"Driver 1", DriverFile("a.ppd"));
    wxArrayString printers;
    printers.Add("before");
    ListPostScriptPrinters(printers);
    EXPECT_EQ("before", printers[0]);
    EXPECT_NE(wxNOT_FOUND, printers.Index("Test one"));
}

} // namespace
