#pragma once

#include "host/program/window/SettingsDialogue.h"
#include "tests/ui/UiTest.h"

#include <wx/dcscreen.h>
#include <wx/uiaction.h>

/// Runs a function for each window below one.
void ForEachBelow(wxWindow* window, const std::function<void(wxWindow*)>& visit);

/// @return the control in the window that keys go to, or null
wxWindow* FocusedIn(wxWindow* window);

/// Has the screen show what is on it now, should it have been read before.
void ReadAnew(wxScreenDC& screen);

/// The settings window of a machine with Office, two printers and two Distiller profiles, with a
/// user in front of it.
class SettingsWindow : public UiTest {
protected:
    SettingsWindow();
    ~SettingsWindow() override;

    /// Shows texts in a language that is installed with the program; "en" are the texts themselves.
    static void Speak(const wxString& language);

    /// Opens the window for m_file and lets the user work until it closes, or the user is done.
    /// @return how it ended; wxID_NONE when the user left it open
    int Open(const std::function<void()>& user);

    // What the user sees and does while the window is open.

    const wxWindow* Window() const override { return m_window; }
    wxWindow* Focused() const { return FocusedIn(m_window); }
    wxRect Place(const wxWindow* window) const; ///< on the screen
    void Activate(int id);                      ///< a button or a check box, by the space bar
    void Press(int key);

    std::string Stored() const { return ReadBytes(m_file); }

    std::filesystem::path m_file = m_folder / "job.xml";
    SettingsDialogue* m_window = nullptr;
};
