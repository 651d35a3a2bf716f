#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/machine/MissingParts.h"
#include "host/program/system/Toolkit.h"
#include "host/program/window/PanelChoices.h"

#include <wx/dialog.h>

class MessageBar;
class ScrolledArea;
class Settings;
class wxSizer;

/// The identifiers of the window's buttons.
namespace ButtonId {

enum : int { Save = wxID_HIGHEST + 1, Cancel, Restore, Understood };

} // namespace ButtonId

/// The window with the settings panel of each filter that has one. It ends with wxID_SAVE when the
/// settings are stored, else with wxID_CANCEL.
class SettingsDialogue : public wxDialog {
public:
    /// @param filters live as long as the dialogue
    /// @param settings what the panels show at first, in the language of the texts
    /// @param file where they are stored
    SettingsDialogue(const FilterSet& filters, const Settings& settings,
                     const std::filesystem::path& file);

    /// Whether any filter has a panel.
    bool HasPanel() const { return m_hasPanel; }

private:
    void ShowPanels(const Settings& settings);
    void SizePanels();
    void ExplainObstacle();
    wxString Explain(int id, const std::optional<Fault>& missing) const;
    wxSizer* NewButtons();
    void FitToFault();

    void OnSave(wxCommandEvent& event);
    void OnRestore(wxCommandEvent& event);
    void OnUnderstood(wxCommandEvent& event);
    void OnKey(wxKeyEvent& event);
    void OnSize(wxSizeEvent& event);

    const FilterSet& m_filters;
    const std::filesystem::path m_file;
    ScrolledArea* m_area;
    MessageBar* m_obstacle;              ///< says why something is greyed out
    MessageBar* m_fault;                 ///< says why the settings could not be stored
    int m_faultHeight = 0;               ///< by which the window has grown for it
    std::vector<PanelChoices> m_choices; ///< of each panel
    FocusWatch m_focusWatch;
    bool m_hasPanel = false;
};
