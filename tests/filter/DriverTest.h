#pragma once

#include "office/OutputWait.h"
#include "plugin/interface/ResultCodes.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/RecordingProgress.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/UserDevMode.h"

#include <wx/string.h>

#include <gtest/gtest.h>

#include <functional>
#include <optional>

/// A line of the journal that a driver leaves with its application. Releases while the preferences
/// for Distiller's printer are the filter's own are marked as guarded.
struct DriverStep {
    std::string line; ///< <printer> stands for the printer, <output> for the path of the file
    int percent = 0;  ///< what the driver has reported before the call; none for a release
};

/// One of the four drivers, and what is its own in what all of them do.
struct Driver {
    std::string application; ///< as its objects and its ProgID have it: "Word"
    wxString input;          ///< a document Report.final
    std::function<ResultCode(const wxString& inputPath, const wxString& outputFolder,
                             wxString& psFileName, ProgressSink* progress, const wxString* printer)>
        print;

    std::vector<DriverStep> steps; ///< when all goes well
    std::vector<int> percents;
    wxString reportedName;  ///< what the reports are about
    bool isGuarded = false; ///< the preferences for Distiller's printer are ours meanwhile
    /// What follows a call that failed; of the releases those of the objects that there are.
    std::vector<std::string> afterFailure;

    ResultCode notInstalled = 0;
    ResultCode startFailed = 0;
    ResultCode fileNeverComes = Result::PrintFailed;
    std::vector<int> percentsWithoutPrinter;
};

/// One run of a driver, on a machine of its own: with an application that prints by writing a file,
/// and the user's preferences for Distiller's printer.
class DriverRun {
public:
    static constexpr char PrintedFile[] = "%!PS-Adobe-3.0\nshowpage\n";

    explicit DriverRun(const Driver& driver);

    ResultCode Print() {
        return m_driver.print(input, folder.Path().wstring(), psName, &progress, &printer);
    }

    std::string OutputPath() const { return (folder / "Report.final.ps").string(); }

    /// The journal after the driver's steps, with the printer and this run's file in them.
    std::vector<std::string> ExpectedJournal(const char* printerUsed = "Proofer") const;

    /// Whether the preferences for Distiller's printer are the filter's own now.
    bool IsGuarded() const;

    /// The user's preferences are what they were, and no object of the application is left.
    void ExpectNothingLeftBehind() const;

    TemporaryFolder folder;
    UserDevMode user;
    RecordingOffice office;
    RecordingProgress progress;

    wxString input;
    wxString printer = "Proofer";                     ///< the user's choice
    std::optional<std::string> printed = PrintedFile; ///< none: the application writes no file
    wxString psName;                                  ///< what the driver calls its output
    bool wasGuardedWhilePrinting = false;

private:
    const Driver m_driver;
};

/// What all drivers do; instantiated for each beside what it does alone. A file that is not there
/// when the print call returns is soon given up.
class DriverTest : public testing::TestWithParam<Driver> {
protected:
    void SetUp() override { GetOutputWaitLimits().withoutGrowth = std::chrono::milliseconds(50); }
    void TearDown() override { GetOutputWaitLimits() = {}; }
};

/// Names the driver for gtest.
void PrintTo(const Driver& driver, std::ostream* out);
