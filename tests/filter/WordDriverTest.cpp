#include "office/WordDriver.h"

#include "tests/filter/DriverTest.h"

namespace {

Driver Word() {
    Driver driver;
    driver.application = "Word";
    driver.input = "/in/Report.final.docx";
    driver.print = PrintWordDocument;
    driver.percents = {5, 10, 15, 20, 25, 30, 35, 40, 55, 85, 90, 95, 100};
    driver.steps = {
        {"Word.6 get", 15},
        {"Documents.14 method (&omitted, &omitted, &omitted, &omitted)", 20},
        {"Documents.15 method (&\"/in/Report.final.docx\", &omitted, &I2 1, &omitted, &omitted, "
         "&omitted, &omitted, &omitted, &omitted, &omitted, &omitted, &omitted)",
         25},
        {"~AddedDocument guarded"},
        {"Word.19 get", 30},
        {"Dialogs.0 method (I4 97)", 35},
        {"Dialog.4 put (true)", 40},
        {"Dialog.1 put (\"<printer>\")", 40},
        {"Dialog.32001 method", 40},
        {"Word.66 put (\"<printer>\")", 55},
        {"Document.444 method (&I2 0, &I2 0, &omitted, &\"<output>\", &omitted, &omitted, "
         "&omitted, "
         "&I2 1, &omitted, &omitted, &I2 1, &I2 0, &omitted, &I2 0, &I2 0, &I2 0, &I2 0, &I2 0)",
         55},
        {"Document.1105 method (&I2 0, &omitted, &omitted)", 85},
        {"~Dialog guarded"},
        {"~Dialogs guarded"},
        {"~Document guarded"},
        {"~Documents guarded"},
        {"Word.1105 method (&I2 0, &omitted, &omitted)", 90},
        {"~Word"},
    };
    driver.reportedName = driver.input;
    driver.isGuarded = true;
    driver.afterFailure = {"~Dialog",        "~Dialogs",   "~Document",
                           "~AddedDocument", "~Documents", "~Word"};
    driver.notInstalled = Result::WordNotInstalled;
    driver.startFailed = Result::WordStartFailed;
    driver.percentsWithoutPrinter = {5};
    return driver;
}

INSTANTIATE_TEST_SUITE_P(Word, DriverTest, testing::Values(Word()));

} // namespace
