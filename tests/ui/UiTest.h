#pragma once

#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <wx/choice.h>
#include <wx/window.h>

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

/// A machine that the test describes, and controls of a window on it as their user sees them.
class UiTest : public testing::Test {
protected:
    struct Machine {
        std::vector<std::wstring> applications = {L"Word.Application", L"PowerPoint.Application"};
        int officeVersion = 16;
        std::vector<std::wstring> printers = {L"Adobe PDF", L"Proofer"};
        std::vector<const char*> profiles = {"Press.joboptions", "Print.joboptions"};
    };

    UiTest();
    ~UiTest() override;

    /// Makes the machine as described, in place of an earlier one.
    void Install(const Machine& machine);

    /// What the controls are in.
    virtual const wxWindow* Window() const = 0;

    wxWindow* Find(int id) const;
    wxChoice* Choice(int id) const { return dynamic_cast<wxChoice*>(Find(id)); }
    bool IsTicked(int id) const; ///< of a check box or a radio button
    std::string Selection(int id) const;

    /// Picks an entry; the box itself is the toolkit's.
    void Choose(int id, const wxString& entry);
    /// Sends the command event that follows a user's choice.
    void Tell(wxEventType type, int id, int value);

    /// Lets the toolkit work until the condition holds.
    /// @return whether it came to that
    static bool Until(const std::function<bool()>& condition);

    TemporaryFolder m_folder;
    std::optional<RecordingOffice> m_office;
    std::vector<std::unique_ptr<TestPrinter>> m_printers;
};
