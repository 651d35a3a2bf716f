#pragma once

#include "plugin/ResultCodes.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/RecordingProgress.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/UserDevMode.h"

#include <wx/string.h>

#include <gtest/gtest.h>

/// What the tests of the four drivers share: a recording application that prints by writing a
/// file, an output folder, and the user's preferences for the Distiller printer.
class DriverFixture : public testing::Test {
protected:
    static constexpr char PrintedFile[] = "%!PS-Adobe-3.0\nshowpage\n";

    /// @param object the object whose member prints
    /// @param printOut that member
    DriverFixture(const wchar_t* progId, const char* object, DISPID printOut);

    /// Where the driver's file for the document Report.final goes.
    std::string OutputPath() const { return (m_folder / "Report.final.ps").string(); }

    /// The user's preferences are what they were, and no object of the application is left.
    void ExpectNothingLeftBehind();

    /// Whether the preferences were the filter's own while the application printed.
    bool WasGuardedWhilePrinting() const;

    /// How often the journal holds a call.
    /// @param call object and DISPID, for instance "Word.1105"
    long CountOf(const std::string& call) const;

    const std::vector<BYTE> m_userRecord;
    TemporaryFolder m_folder;
    UserDevMode m_user;
    RecordingOffice m_office;
    RecordingProgress m_progress;
    wxString m_printer = "Proofer";
    wxString m_psName;
    std::string m_printed = PrintedFile;

private:
    std::vector<BYTE> m_recordWhilePrinting;
};

/// One automation call that fails, and how far the driver had reported by then.
struct FailingCall {
    const char* object;
    DISPID member;
    int lastPercent;
};

/// Names the case for gtest: "Documents15".
std::string NameOf(const testing::TestParamInfo<FailingCall>& test);
