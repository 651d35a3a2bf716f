#include "tests/filter/DriverTest.h"

#include "tests/filter/JournalCalls.h"
#include "tests/support/TestPrinter.h"

#include <gmock/gmock.h>

#include <stdexcept>

using testing::ElementsAreArray;

void PrintTo(const Driver& driver, std::ostream* out) {
    *out << driver.application;
}

TEST_P(DriverTest, PrintsByExactlyTheseCalls) {
    DriverRun run(GetParam());
    EXPECT_EQ(Result::Success, run.Print());
    EXPECT_THAT(run.office.Journal(), ElementsAreArray(run.ExpectedJournal()));
    EXPECT_EQ(GetParam().percents, run.progress.percents);
    EXPECT_THAT(run.progress.texts, testing::Each(GetParam().reportedName));
    EXPECT_EQ("Report.final.ps", run.psName);
    EXPECT_EQ(DriverRun::PrintedFile, ReadBytes(run.OutputPath()));
    EXPECT_EQ(GetParam().isGuarded, run.wasGuardedWhilePrinting);
    run.ExpectNothingLeftBehind();
}

TEST_P(DriverTest, PrefersDistillersPrinterAndCutsTheFileToItsHeader) {
    DriverRun run(GetParam());
    const TestPrinter distiller(L"Adobe PDF", L"AdobePS Acrobat Distiller",
                                run.folder.Write("a.ppd", "x").wstring());
    run.printed = std::string("\x1b%-12345X@PJL\r\n") + DriverRun::PrintedFile;
    run.folder.Write("Report.final.ps", std::string(5000, 'o')); // of an earlier run
    EXPECT_EQ(Result::Success, run.Print());
    EXPECT_THAT(run.office.Journal(), ElementsAreArray(run.ExpectedJournal("Adobe PDF")));
    EXPECT_EQ(DriverRun::PrintedFile, ReadBytes(run.OutputPath()));
}

TEST_P(DriverTest, SaysWhatIsMissing) {
    const std::vector<int>& percents = GetParam().percents;
    const auto started = std::find(percents.begin(), percents.end(), GetParam().steps[0].percent);
    const std::wstring progId = wxString(GetParam().application + ".Application").ToStdWstring();
    const struct {
        std::function<void(DriverRun&)> takeAway;
        ResultCode result;
        std::vector<int> percents;
    } cases[] = {
        {[](auto& run) { run.input.clear(); }, Result::InputFileNotFound, {}},
        {[&](auto&) { RegDeleteTreeW(HKEY_CLASSES_ROOT, progId.c_str()); },
         GetParam().notInstalled,
         {5}},
        {[](auto& run) { run.printer.clear(); }, Result::DistillerNotInstalled,
         GetParam().percentsWithoutPrinter},
        {[](auto& run) { run.office.OnStart(DenyAccess); },
         GetParam().startFailed,
         {percents.begin(), started}},
        {[](auto& run) { run.office.OnStart([] { throw std::runtime_error("no"); }); },
         Result::PrintFailed,
         {percents.begin(), started}},
    };
    for (const auto& each : cases) {
        DriverRun run(GetParam());
        each.takeAway(run);
        EXPECT_EQ(each.result, run.Print());
        EXPECT_EQ(each.percents, run.progress.percents) << each.result;
        EXPECT_EQ(run.input.empty() ? "" : "Report.final.ps", run.psName) << each.result;
        EXPECT_TRUE(run.office.Journal().empty()) << each.result;
        run.ExpectNothingLeftBehind();
    }
}

TEST_P(DriverTest, EndsWithAnyCallThatFails) {
    for (std::size_t step = 0; step < GetParam().steps.size(); ++step) {
        if (IsRelease(GetParam().steps[step].line))
            continue;
        for (const auto fail : {Raise, DenyAccess}) {
            DriverRun run(GetParam());
            std::vector<std::string> expected = run.ExpectedJournal();
            expected.resize(step + 1);
            FailAt(run.office, expected.back(), fail);
            EXPECT_EQ(Result::PrintFailed, run.Print());
            const std::vector<std::string>& journal = run.office.Journal();
            ASSERT_GT(journal.size(), step);
            const auto next = journal.begin() + static_cast<std::ptrdiff_t>(step) + 1;
            for (const std::string& line : GetParam().afterFailure)
                if (!IsRelease(line) || std::find(next, journal.end(), line) != journal.end())
                    expected.push_back(line);
            EXPECT_THAT(journal, ElementsAreArray(expected));
            EXPECT_EQ(GetParam().steps[step].percent, run.progress.percents.back()) << step;
            run.ExpectNothingLeftBehind();
        }
    }
}

TEST_P(DriverTest, ReportsAFileThatNeverComesOrHasNoHeader) {
    DriverRun headless(GetParam());
    headless.printed = "no PostScript";
    EXPECT_EQ(Result::NoPSHeader, headless.Print());
    EXPECT_EQ(headless.printed, ReadBytes(headless.OutputPath()));
    EXPECT_EQ(100, headless.progress.percents.back());
    headless.ExpectNothingLeftBehind();

    DriverRun fileless(GetParam());
    fileless.printed.reset();
    EXPECT_EQ(GetParam().fileNeverComes, fileless.Print());
    fileless.ExpectNothingLeftBehind();
}
