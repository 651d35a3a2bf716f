#include "office/ExcelDriver.h"

#include "tests/filter/DriverFixture.h"
#include "tests/support/TestPrinter.h"

#include <gmock/gmock.h>

namespace {

using testing::Each;
using testing::ElementsAre;

class ExcelDriverTest : public DriverFixture {
protected:
    ExcelDriverTest() : DriverFixture(L"Excel.Application", "Workbook", 1772) {}

    ResultCode Print(const wxString& input = "/in/Report.final.xlsx") {
        return PrintExcelWorkbook(input, m_folder.Path().wstring(), m_psName, &m_progress,
                                  &m_printer);
    }
};

TEST_F(ExcelDriverTest, PrintsByExactlyTheseCalls) {
    AFX_MODULE_STATE* const before = AfxGetModuleState();
    AFX_MODULE_STATE* whileOpening = nullptr;
    m_office.On("Workbooks", 682, [&](const auto&) { whileOpening = AfxGetModuleState(); });

    EXPECT_EQ(Result::Success, Print());
    EXPECT_THAT(
        m_office.Journal(),
        ElementsAre("Excel.572 get",
                    "Workbooks.682 method (\"/in/Report.final.xlsx\", omitted, I2 1, omitted, "
                    "omitted, omitted, omitted, omitted, omitted, omitted, omitted, omitted, "
                    "omitted)",
                    "Workbook.1772 method (omitted, omitted, I2 1, I2 0, \"Proofer\", I2 1, I2 0, "
                    "\"" +
                        OutputPath() + "\")",
                    "Workbook.277 method (I2 0, omitted, omitted)", "~Workbook", "~Workbooks",
                    "Excel.302 method", "~Excel"));
    EXPECT_EQ("Report.final.ps", m_psName);
    EXPECT_EQ(PrintedFile, ReadBytes(OutputPath()));
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10, 15, 20, 30, 85, 90, 95, 100));
    EXPECT_THAT(m_progress.texts, Each(wxString("Report.final")));
    EXPECT_FALSE(WasGuardedWhilePrinting()); // the preferences are no business of Excel's
    EXPECT_NE(before, whileOpening);
    EXPECT_EQ(before, AfxGetModuleState());
    ExpectNothingLeftBehind();
}

TEST_F(ExcelDriverTest, PrefersTheDistillerPrinterAndCutsTheFile) {
    const TestPrinter distiller(L"Adobe PDF", L"AdobePS Acrobat Distiller",
                                m_folder.Write("a.ppd", "x").wstring());
    m_printer.clear();
    m_printed = "@PJL\r\n" + m_printed;
    EXPECT_EQ(Result::Success, Print("/in/Report.final.XLS"));
    EXPECT_THAT(m_office.Journal()[2], testing::HasSubstr("\"Adobe PDF\""));
    EXPECT_EQ(PrintedFile, ReadBytes(OutputPath()));
}

TEST_F(ExcelDriverTest, ReturnsEarlyWithoutStartingExcel) {
    EXPECT_EQ(Result::InputFileNotFound, Print(wxString()));
    EXPECT_TRUE(m_psName.empty());
    m_printer.clear();
    EXPECT_EQ(Result::DistillerNotInstalled, Print());
    EXPECT_EQ("Report.final.ps", m_psName);
    RegDeleteTreeW(HKEY_CLASSES_ROOT, L"Excel.Application");
    EXPECT_EQ(Result::ExcelNotInstalled, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 5));
    EXPECT_THAT(m_office.Journal(), ElementsAre());
}

TEST_F(ExcelDriverTest, ReportsAnExcelThatDoesNotStart) {
    m_office.RefuseToStart();
    EXPECT_EQ(Result::ExcelStartFailed, Print());
    EXPECT_THAT(m_progress.percents, ElementsAre(5, 10));
}

TEST_F(ExcelDriverTest, ReportsAFileThatIsGoneOrHasNoHeader) {
    m_printed = "no PostScript";
    EXPECT_EQ(Result::NoPSHeader, Print());
    m_office.On("Excel", 302, [this](const auto&) { std::filesystem::remove(OutputPath()); });
    EXPECT_EQ(Result::OutputFileNotFound, Print());
}

class ExcelDriverFailureTest : public ExcelDriverTest,
                               public testing::WithParamInterface<FailingCall> {};

TEST_P(ExcelDriverFailureTest, TellsExcelToQuit) {
    const auto [object, member, lastPercent] = GetParam();
    m_office.On(object, member, [](const auto&) { throw RecordingOffice::Raise{L"no"}; });
    EXPECT_EQ(Result::PrintFailed, Print());
    EXPECT_EQ(lastPercent, m_progress.percents.back());
    const bool isQuit = std::string(object) == "Excel" && member == 302;
    EXPECT_EQ(isQuit ? 2 : 1, CountOf("Excel.302"));
    EXPECT_EQ("~Excel", m_office.Journal().back());
    ExpectNothingLeftBehind();
}

INSTANTIATE_TEST_SUITE_P(EachCall, ExcelDriverFailureTest,
                         testing::Values(FailingCall{"Excel", 572, 15},
                                         FailingCall{"Workbooks", 682, 20},
                                         FailingCall{"Workbook", 1772, 30},
                                         FailingCall{"Workbook", 277, 85},
                                         FailingCall{"Excel", 302, 90}),
                         NameOf);

} // namespace
