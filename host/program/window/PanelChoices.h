#pragma once

#include "host/program/settings/SettingsFile.h"

#include <vector>

class Settings;
class wxChoice;
class wxWindow;

/// What the choices of printers and Distiller profiles in a filter's panel lack: it offers what the
/// machine has, while settings may name what that no longer has, or no profile.
class PanelChoices {
public:
    /// Adds entries to the choices and selects them where the settings say so. The panel is then to
    /// be laid out.
    PanelChoices(wxWindow& panel, const Settings& settings);

    /// Puts what the added entries stand for in place of what the filter has made of them.
    void Correct(SettingsValues& values) const;

private:
    struct Entry {
        const char* key;
        wxChoice* choice;
        int index;
        wxString value;
    };

    void CompletePrinters(const wxString& chosen);
    void CompleteProfiles(const wxString& chosen);
    void Add(const char* key, wxChoice* choice, const wxString& text, const wxString& value);

    wxWindow& m_panel;
    std::vector<Entry> m_entries;
};
