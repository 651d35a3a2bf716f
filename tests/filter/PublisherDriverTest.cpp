#include "office/PublisherDriver.h"

#include "tests/filter/DriverTest.h"
#include "tests/support/RegistryText.h"

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;

Driver Publisher() {
    Driver driver;
    driver.application = "Publisher";
    driver.input = "/in/Report.final.pub";
    driver.print = PrintPublisherDocument;
    driver.percents = {5, 10, 15, 20, 30, 35, 85, 90, 95, 100};
    driver.steps = {
        {"Publisher.38 method (\"/in/Report.final.pub\", true, false, I4 3)", 20},
        {"Publication.1 put (\"<printer>\")", 30},
        {"Publication.54 method (I4 -1, I4 -1, \"<output>\", I4 1, false)", 35},
        {"Publication.48 method", 85},
        {"~Publication guarded"},
        {"Publisher.39 method", 90},
        {"~Publisher guarded"},
    };
    driver.reportedName = "Report.final";
    driver.isGuarded = true;
    driver.afterFailure = {"Publisher.39 method", "~Publication guarded", "~Publisher guarded"};
    driver.notInstalled = Result::PublisherNotInstalled;
    driver.startFailed = Result::PublisherStartFailed;
    driver.fileNeverComes = Result::OutputFileNotFound; // it is not waited for
    driver.percentsWithoutPrinter = {5, 10};
    return driver;
}

INSTANTIATE_TEST_SUITE_P(Publisher, DriverTest, testing::Values(Publisher()));

TEST(PublisherDriver, SendsAPublisherAwayThatIsTooOld) {
    constexpr wchar_t OldPublisher[] = L"SOFTWARE\\Microsoft\\Office\\9.0\\Publisher";
    WriteRegistryText(HKEY_CURRENT_USER, OldPublisher, L"Any", L"value");
    DriverRun run(Publisher());
    RegDeleteTreeW(HKEY_CLASSES_ROOT, L"Publisher.Application");
    EXPECT_EQ(Result::PublisherTooOld, run.Print());
    EXPECT_THAT(run.progress.percents, ElementsAre(5, 10, 15));
    EXPECT_THAT(run.office.Journal(), ElementsAre());
    RegDeleteTreeW(HKEY_CURRENT_USER, OldPublisher);
}

} // namespace
