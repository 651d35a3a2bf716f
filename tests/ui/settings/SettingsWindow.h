#pragma once

#include "host/program/window/SettingsDialogue.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <wx/dcscreen.h>
#include <wx/uiaction.h>

#include <gtest/gtest.h>

#include <functional>
#include <optional>

/// Runs a function for each window below one.
void ForEachBelow(wxWindow* window, const std::function<void(wxWindow*)>& visit);

/// @return the control in the window that keys go to, or null
wxWindow* FocusedIn(wxWindow* window);

/// Has the screen show what is on it now, should it have been read before.
void ReadAnew(wxScreenDC& screen);

/// The settings window of a machine with Office, two printers and two Distiller profiles, with a
/// user in front of it.
class SettingsWindow : public testing::Test {
protected:
    SettingsWindow();
    ~SettingsWindow() override;

    /// Shows texts in a language that is installed with the program; "en" are the texts themselves.
    static void Speak(const wxString& language);

    /// Opens the window for m_file and lets the user work until it closes, or the user is done.
    /// @return how it ended; wxID_NONE when the user left it open
    int Open(const std::function<void()>& user);

    // What the user sees and does while the window is open.

    wxWindow* Find(int id) const;
    wxWindow* Focused() const { return FocusedIn(m_window); }
    wxRect Place(const wxWindow* window) const; ///< on the screen
    void Activate(int id);                      ///< a button or a check box, by the space bar
    void Press(int key);
    /// Picks an entry; the box itself is the toolkit's.
    void Choose(int id, const wxString& entry);

    /// Lets the toolkit work until the condition holds.
    /// @return whether it came to that
    static bool Until(const std::function<bool()>& condition);

    std::string Stored() const { return ReadBytes(m_file); }

    TemporaryFolder m_folder;
    std::filesystem::path m_file = m_folder / "job.xml";
    std::optional<RecordingOffice> m_office;
    std::optional<TestPrinter> m_printers[2];
    SettingsDialogue* m_window = nullptr;
};
