#include "office/ExcelDriver.h"

#include "tests/filter/DriverTest.h"

namespace {

Driver Excel() {
    Driver driver;
    driver.application = "Excel";
    driver.input = "/in/Report.final.XLSX";
    driver.print = PrintExcelWorkbook;
    driver.percents = {5, 10, 15, 20, 30, 85, 90, 95, 100};
    driver.steps = {
        {"Excel.572 get", 15},
        {"Workbooks.682 method (\"/in/Report.final.XLSX\", omitted, I2 1, omitted, omitted, "
         "omitted, omitted, omitted, omitted, omitted, omitted, omitted, omitted)",
         20},
        {"Workbook.1772 method (omitted, omitted, I2 1, I2 0, \"<printer>\", I2 1, I2 0, "
         "\"<output>\")",
         30},
        {"Workbook.277 method (I2 0, omitted, omitted)", 85},
        {"~Workbook"},
        {"~Workbooks"},
        {"Excel.302 method", 90},
        {"~Excel"},
    };
    driver.reportedName = "Report.final";
    driver.afterFailure = {"Excel.302 method", "~Workbook", "~Workbooks", "~Excel"};
    driver.notInstalled = Result::ExcelNotInstalled;
    driver.startFailed = Result::ExcelStartFailed;
    driver.percentsWithoutPrinter = {5};
    return driver;
}

INSTANTIATE_TEST_SUITE_P(Excel, DriverTest, testing::Values(Excel()));

TEST(ExcelDriver, RunsInTheModulesOwnState) {
    AFX_MODULE_STATE* const before = AfxGetModuleState();
    AFX_MODULE_STATE* whileOpening = nullptr;
    DriverRun run(Excel());
    run.office.On("Workbooks", 682, [&](const auto&) { whileOpening = AfxGetModuleState(); });
    EXPECT_EQ(Result::Success, run.Print());
    EXPECT_NE(before, whileOpening);
    EXPECT_EQ(before, AfxGetModuleState());
}

} // namespace
