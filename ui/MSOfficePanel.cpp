#include "ui/MSOfficePanel.h"

#include "common/Themer.h"
#include "common/Translated.h"
#include "office/InstalledApplications.h"
#include "plugin/interface/ControlIds.h"
#include "ui/Controls.h"

#include <wx/choice.h>

namespace {

constexpr std::initializer_list<int> HandoutGroup = {
    ControlId::HandoutsHeading, ControlId::SlidesPerPageLabel, ControlId::SlidesPerPage,
    ControlId::NoImage,         ControlId::OrderLabel,         ControlId::OrderHorizontal,
    ControlId::OrderVertical};

} // namespace

// clang-format off
wxBEGIN_EVENT_TABLE(MSOfficePanel, OutputFileTypePanelMSO)
    EVT_RADIOBUTTON(ControlId::OrderHorizontal, MSOfficePanel::OnOrder)
    EVT_RADIOBUTTON(ControlId::OrderVertical, MSOfficePanel::OnOrder)
    EVT_CHECKBOX(ControlId::ScaleToFitPaper, MSOfficePanel::OnFlag)
    EVT_CHECKBOX(ControlId::PrintHiddenSlides, MSOfficePanel::OnFlag)
    EVT_CHECKBOX(ControlId::FrameSlides, MSOfficePanel::OnFlag)
    EVT_CHECKBOX(ControlId::PrintCommentsAndInkMarkup, MSOfficePanel::OnFlag)
    EVT_CHECKBOX(ControlId::HighQuality, MSOfficePanel::OnFlag)
    EVT_CHOICE(ControlId::Printer, MSOfficePanel::OnPrinter)
    EVT_CHOICE(ControlId::Print, MSOfficePanel::OnPrintOutputType)
    EVT_CHOICE(ControlId::Colour, MSOfficePanel::OnChoice)
    EVT_CHOICE(ControlId::SlidesPerPage, MSOfficePanel::OnChoice)
wxEND_EVENT_TABLE()
// clang-format on

MSOfficePanel::MSOfficePanel(wxWindow* parent, bool controlsEnabled)
    : OutputFileTypePanelMSO(parent, controlsEnabled), m_controlsEnabled(controlsEnabled) {
    SetBackgroundColour(Themer::GetThemeService()->GetTheme("Default").backgroundColour);
}

void MSOfficePanel::SetPrinters(const wxArrayString& printers) {
    m_printers = printers;
}

/// All that the panel keeps beside its base: one row for a setting.
PanelValues MSOfficePanel::Values() {
    namespace Settings = FilterSettings;
    return {
        {ControlId::Printer, Settings::Printer, &m_printer},
        {ControlId::OrderHorizontal, Settings::HandoutsHorizontal, &m_handoutsHorizontal},
        {ControlId::OrderVertical, Settings::HandoutsVertical, &m_handoutsVertical},
        {ControlId::Print, Settings::OutputType, &m_printOutputType},
        {ControlId::Colour, Settings::Colour, &m_color},
        {ControlId::SlidesPerPage, Settings::SlidesPerPage, &m_slidesPerPage},
        {ControlId::ScaleToFitPaper, Settings::ScaleToFitPage, &m_scaleToFitPage},
        {ControlId::FrameSlides, Settings::FrameSlides, &m_frameSlides},
        {ControlId::PrintHiddenSlides, Settings::PrintHiddenSlides, &m_printHiddenSlides},
        {ControlId::PrintCommentsAndInkMarkup, Settings::PrintCommentsAndInkMarkup,
         &m_printCommentsAndInkMarkup},
        {ControlId::HighQuality, Settings::HighQuality, &m_highQuality},
    };
}

bool MSOfficePanel::SetupControls() {
    OutputFileTypePanelMSO::SetupControls();
    dynamic_cast<wxChoice*>(FindWindow(ControlId::Printer))->Append(m_printers);
    Values().Bind(*this);
    return true;
}

bool MSOfficePanel::ReadSettings(SettingsMap& settings) {
    OutputFileTypePanelMSO::ReadSettings(settings);
    if (!m_printers.empty())
        m_printer = m_printers[0];
    Values().Read(settings);

    EnableControls(this, {ControlId::HighQuality}, IsPowerPoint12OrLater());
    if (m_controlsEnabled)
        EnableHandouts(IsHandouts());
    else
        for (int id = ControlId::PrinterLabel; id <= ControlId::PrintCommentsAndInkMarkup; ++id)
            EnableControls(this, {id}, false);
    TransferDataToWindow();
    return true;
}

bool MSOfficePanel::WriteSettings(SettingsMap& settings) {
    OutputFileTypePanelMSO::WriteSettings(settings);
    Values().Write(settings);
    return true;
}

bool MSOfficePanel::IsHandouts() const {
    return m_printOutputType.CmpNoCase(Translated(FilterSettings::Handouts)) == 0;
}

void MSOfficePanel::EnableHandouts(bool enable) {
    EnableControls(this, HandoutGroup, enable);
}

void MSOfficePanel::OnOrder(wxCommandEvent& event) {
    const bool isHorizontal = event.GetId() == ControlId::OrderHorizontal;
    m_handoutsHorizontal = isHorizontal == (event.GetInt() != 0);
    m_handoutsVertical = !m_handoutsHorizontal;
}

void MSOfficePanel::OnFlag(wxCommandEvent& event) {
    Values().MemberOf<bool>(event.GetId()) = event.GetInt() != 0;
}

void MSOfficePanel::OnChoice(wxCommandEvent& event) {
    const auto* const choice = dynamic_cast<const wxChoice*>(FindWindow(event.GetId()));
    Values().MemberOf<wxString>(event.GetId()) = choice->GetStringSelection();
}

void MSOfficePanel::OnPrinter(wxCommandEvent& event) {
    OnChoice(event);
    wxWindow* note = FindWindow(ControlId::NotePanel);
    if (!note)
        return;
    note->Show(m_printer.Contains("Adobe")); // its advice is about Adobe's printer
    Refresh();
}

void MSOfficePanel::OnPrintOutputType(wxCommandEvent& event) {
    OnChoice(event);
    EnableHandouts(IsHandouts());
}
