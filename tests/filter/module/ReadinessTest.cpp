#include "tests/filter/module/FilterModule.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/RegistryText.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <gtest/gtest.h>

namespace {

constexpr char CurrentServer[] = "<s><ServerVersion>16</ServerVersion></s>";

class ReadinessTest : public testing::Test {
protected:
    TemporaryFolder m_folder;
    std::wstring m_ppd = m_folder.Write("a.ppd", "x").wstring();
};

TEST_F(ReadinessTest, NeedsOfficeAndAPrinter) {
    const PluginUnderTest plugin;
    EXPECT_EQ(0, plugin->Initialize("no XML"));
    EXPECT_FALSE(plugin->IsReady());
    {
        const RecordingOffice office({L"Excel.Application"});
        EXPECT_FALSE(plugin->IsReady());

        const TestPrinter printer(L"Printer", L"Test driver", m_ppd);
        EXPECT_FALSE(plugin->IsReady()); // printers are looked for by Initialize
        EXPECT_EQ(0, plugin->Initialize(CurrentServer));
        EXPECT_TRUE(plugin->IsReady());
    }
    EXPECT_FALSE(plugin->IsReady()); // Office is looked for at each call
    plugin->Initialize(CurrentServer);
    WriteRegistryText(HKEY_CURRENT_USER, L"SOFTWARE\\Microsoft\\Office\\9.0\\Publisher", L"Any",
                      L"value");
    const TestPrinter printer(L"Printer", L"Test driver", m_ppd);
    EXPECT_FALSE(plugin->IsReady());
    plugin->Initialize(CurrentServer);
    EXPECT_TRUE(plugin->IsReady());
    RegDeleteTreeW(HKEY_CURRENT_USER, L"SOFTWARE\\Microsoft\\Office");
    EXPECT_FALSE(plugin->IsReady());
}

TEST_F(ReadinessTest, CountsADistillerPrinterWhateverItsDataFile) {
    const RecordingOffice office({L"Word.Application"});
    const TestPrinter distiller(L"Distiller", L"AdobePS Acrobat Distiller",
                                m_folder.Write("a.bin", "x").wstring());
    const PluginUnderTest plugin;
    plugin->Initialize(wxString());
    EXPECT_TRUE(plugin->IsReady());
}

} // namespace
