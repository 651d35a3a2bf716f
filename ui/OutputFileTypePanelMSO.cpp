#include "ui/OutputFileTypePanelMSO.h"

#include "common/Themer.h"
#include "plugin/interface/ControlIds.h"
#include "ui/Controls.h"

#include <wx/choice.h>
#include <wx/radiobut.h>
#include <wx/valgen.h>

namespace {

constexpr std::initializer_list<int> ProfileGroup = {ControlId::DistillerProfile,
                                                     ControlId::DistillerProfileLabel};
constexpr std::initializer_list<int> PDFGroup = {ControlId::OutputPDF, ControlId::DistillerProfile,
                                                 ControlId::DistillerProfileLabel};
constexpr std::initializer_list<int> OutputGroup = {ControlId::OutputPDF, ControlId::OutputPS,
                                                    ControlId::DistillerProfile,
                                                    ControlId::DistillerProfileLabel};

} // namespace

// clang-format off
wxBEGIN_EVENT_TABLE(OutputFileTypePanelMSO, wxPanel)
    EVT_RADIOBUTTON(ControlId::OutputPS, OutputFileTypePanelMSO::OnPSChosen)
    EVT_RADIOBUTTON(ControlId::OutputPDF, OutputFileTypePanelMSO::OnPDFChosen)
wxEND_EVENT_TABLE()
// clang-format on

OutputFileTypePanelMSO::OutputFileTypePanelMSO(wxWindow* parent, bool controlsEnabled)
    : wxPanel(parent, wxID_ANY, wxDefaultPosition, wxDefaultSize, wxTAB_TRAVERSAL | wxBORDER_NONE),
      m_controlsEnabled(controlsEnabled) {
    // The values go to controls in panels within this one, whatever the host's window says of
    // recursion; the panels take the style over from here when they are made.
    SetExtraStyle(GetExtraStyle() | wxWS_EX_VALIDATE_RECURSIVELY);
    SetBackgroundColour(Themer::GetThemeService()->GetTheme("Default").backgroundColour);
}

void OutputFileTypePanelMSO::SetDistillerProfiles(const wxArrayString& profiles) {
    m_distillerProfiles = profiles;
}

/// The values that are read and written like others; the profile is not.
PanelValues OutputFileTypePanelMSO::Values() {
    return {
        {ControlId::OutputPS, FilterSettings::OutputPS, &m_outputPS},
        {ControlId::OutputPDF, FilterSettings::OutputPDF, &m_outputPDF},
    };
}

bool OutputFileTypePanelMSO::SetupControls() {
    Values().Bind(*this);
    auto* profile = dynamic_cast<wxChoice*>(FindWindow(ControlId::DistillerProfile));
    profile->Append(m_distillerProfiles);
    profile->SetValidator(wxGenericValidator(&m_selectedProfile));
    return true;
}

bool OutputFileTypePanelMSO::ReadSettings(SettingsMap& settings) {
    Values().Read(settings);
    const wxString& stored = settings[FilterSettings::DistillerProfile.key];
    if (!stored.empty())
        m_selectedProfile = stored;
    else if (!m_distillerProfiles.empty())
        m_selectedProfile = m_distillerProfiles[0];
    else
        EnableControls(this, PDFGroup, false);

    if (m_controlsEnabled)
        EnableControls(this, ProfileGroup, m_outputPDF);
    else
        EnableControls(this, OutputGroup, false);
    TransferDataToWindow();
    return true;
}

bool OutputFileTypePanelMSO::WriteSettings(SettingsMap& settings) {
    Values().Write(settings);
    if (!m_outputPDF)
        return true;
    const auto* profile = dynamic_cast<const wxChoice*>(FindWindow(ControlId::DistillerProfile));
    // The entries are the profiles, in their order. Without a selection the profile stored before
    // is one that is not installed now; it stays.
    const int selected = profile->GetCurrentSelection();
    if (selected >= 0 && static_cast<std::size_t>(selected) < m_distillerProfiles.size())
        settings[FilterSettings::DistillerProfile.key] = m_distillerProfiles[selected];
    return true;
}

void OutputFileTypePanelMSO::OnPSChosen(wxCommandEvent& event) {
    m_outputPS = event.GetInt() != 0;
    m_outputPDF = !m_outputPS;
    EnableControls(this, ProfileGroup, false);
}

void OutputFileTypePanelMSO::OnPDFChosen(wxCommandEvent& event) {
    m_outputPDF = event.GetInt() != 0;
    m_outputPS = !m_outputPDF;
    EnableControls(this, ProfileGroup, true);
}
