#pragma once

#include "ui/OutputFileTypePanelMSO.h"

/// The filter's settings panel. Its members are its state: ReadSettings sets them, the handlers
/// change them, WriteSettings stores them; nothing is read back from the controls.
class MSOfficePanel : public OutputFileTypePanelMSO {
public:
    MSOfficePanel(wxWindow* parent, bool controlsEnabled);

    /// Sets the printers to offer; before SetupControls.
    void SetPrinters(const wxArrayString& printers);

    bool SetupControls() override;
    bool WriteSettings(SettingsMap& settings) override;
    bool ReadSettings(SettingsMap& settings) override;

private:
    bool IsHandouts() const;
    void EnableHandouts(bool enable);
    PanelValues Values();

    void OnOrder(wxCommandEvent& event);
    void OnFlag(wxCommandEvent& event);
    void OnChoice(wxCommandEvent& event);
    void OnPrinter(wxCommandEvent& event);
    void OnPrintOutputType(wxCommandEvent& event);

    bool m_handoutsHorizontal = false;
    bool m_handoutsVertical = false;
    bool m_highQuality = false;
    bool m_scaleToFitPage = false;
    bool m_printHiddenSlides = false;
    bool m_frameSlides = false;
    bool m_printCommentsAndInkMarkup = false;
    bool m_controlsEnabled;
    wxString m_printer;
    wxString m_printOutputType;
    wxString m_color;
    wxString m_slidesPerPage;
    wxArrayString m_printers;

    wxDECLARE_EVENT_TABLE();
};
