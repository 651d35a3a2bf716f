#pragma once

#include "ui/PanelSettings.h"

#include <wx/arrstr.h>
#include <wx/panel.h>

/// The base of the settings panel: the values of the output file type box and their exchange with
/// the settings.
class OutputFileTypePanelMSO : public wxPanel {
public:
    /// @param controlsEnabled whether the controls may be used at all
    OutputFileTypePanelMSO(wxWindow* parent, bool controlsEnabled);

    /// Sets the profiles to offer; before SetupControls.
    void SetDistillerProfiles(const wxArrayString& profiles);

    // Each derived panel calls its base's version first. All answer true.

    /// Fills the choices and binds the controls to the members. Called once, after building.
    virtual bool SetupControls();
    /// Stores the panel's values in the settings.
    virtual bool WriteSettings(SettingsMap& settings);
    /// Takes the values from the settings, enables what they call for, and shows them. A setting
    /// that is missing is entered with an empty text.
    virtual bool ReadSettings(SettingsMap& settings);

private:
    PanelValues Values();
    void OnPSChosen(wxCommandEvent& event);
    void OnPDFChosen(wxCommandEvent& event);

    bool m_outputPS = true;
    bool m_outputPDF = false;
    bool m_controlsEnabled;
    wxArrayString m_distillerProfiles;
    wxString m_selectedProfile;

    wxDECLARE_EVENT_TABLE();
};
