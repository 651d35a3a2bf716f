#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/settings/SettingsFile.h"

#include <wx/dialog.h>
#include <wx/infobar.h>

class Settings;
class wxScrolledWindow;

/// The identifiers of the window's buttons.
namespace ButtonId {

enum : int { Save = wxID_HIGHEST + 1, Cancel, Understood };

} // namespace ButtonId

/// The window with the settings panel of each filter that has one. It ends with wxID_SAVE when the
/// settings are stored, else with wxID_CANCEL.
class SettingsDialogue : public wxDialog {
public:
    /// @param filters live as long as the dialogue
    /// @param settings what the panels show at first
    /// @param file where they are stored
    SettingsDialogue(const FilterSet& filters, const Settings& settings,
                     const std::filesystem::path& file);

    /// Whether any filter has a panel.
    bool HasPanel() const { return m_hasPanel; }

private:
    wxScrolledWindow* NewPanels(const Settings& settings);
    wxSizer* NewButtons();
    void OnSave(wxCommandEvent& event);
    void OnKey(wxKeyEvent& event);

    const FilterSet& m_filters;
    const std::filesystem::path m_file;
    wxInfoBar* m_fault = nullptr; ///< says why the settings could not be stored
    bool m_hasPanel = false;
};
