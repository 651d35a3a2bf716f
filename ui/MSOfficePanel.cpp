#include "ui/MSOfficePanel.h"

#include "common/Themer.h"
#include "common/Translated.h"
#include "office/InstalledApplications.h"
#include "plugin/interface/ControlIds.h"
#include "ui/Controls.h"
#include "ui/PanelSettings.h"

#include <wx/choice.h>
#include <wx/valgen.h>

namespace {

constexpr std::initializer_list<int> HandoutGroup = {
    ControlId::HandoutsHeading, ControlId::SlidesPerPageLabel, ControlId::SlidesPerPage,
    ControlId::NoImage,         ControlId::OrderLabel,         ControlId::OrderHorizontal,
    ControlId::OrderVertical};

} // namespace

// clang-format off
wxBEGIN_EVENT_TABLE(MSOfficePanel, OutputFileTypePanelMSO)
    EVT_RADIOBUTTON(ControlId::OrderHorizontal, MSOfficePanel::OnHorizontalOrder)
    EVT_RADIOBUTTON(ControlId::OrderVertical, MSOfficePanel::OnVerticalOrder)
    EVT_CHECKBOX(ControlId::ScaleToFitPaper, MSOfficePanel::OnScaleToFitPage)
    EVT_CHECKBOX(ControlId::PrintHiddenSlides, MSOfficePanel::OnPrintHiddenSlides)
    EVT_CHECKBOX(ControlId::FrameSlides, MSOfficePanel::OnFrameSlides)
    EVT_CHECKBOX(ControlId::PrintCommentsAndInkMarkup, MSOfficePanel::OnPrintCommentsAndInkMarkup)
    EVT_CHECKBOX(ControlId::HighQuality, MSOfficePanel::OnHighQuality)
    EVT_CHOICE(ControlId::Printer, MSOfficePanel::OnPrinter)
    EVT_CHOICE(ControlId::Print, MSOfficePanel::OnPrintOutputType)
    EVT_CHOICE(ControlId::Colour, MSOfficePanel::OnColor)
    EVT_CHOICE(ControlId::SlidesPerPage, MSOfficePanel::OnSlidesPerPage)
wxEND_EVENT_TABLE()
// clang-format on

MSOfficePanel::MSOfficePanel(wxWindow* parent, bool controlsEnabled)
    : OutputFileTypePanelMSO(parent, controlsEnabled), m_controlsEnabled(controlsEnabled) {
    SetBackgroundColour(Themer::GetThemeService()->GetTheme("Default").backgroundColour);
}

void MSOfficePanel::SetPrinters(const wxArrayString& printers) {
    m_printers = printers;
}

bool MSOfficePanel::SetupControls() {
    OutputFileTypePanelMSO::SetupControls();
    dynamic_cast<wxChoice*>(FindWindow(ControlId::Printer))->Append(m_printers);

    const auto bind = [this](int id, auto* member) {
        FindWindow(id)->SetValidator(wxGenericValidator(member));
    };
    bind(ControlId::Printer, &m_printer);
    bind(ControlId::OrderHorizontal, &m_handoutsHorizontal);
    bind(ControlId::OrderVertical, &m_handoutsVertical);
    bind(ControlId::Print, &m_printOutputType);
    bind(ControlId::Colour, &m_color);
    bind(ControlId::SlidesPerPage, &m_slidesPerPage);
    bind(ControlId::HighQuality, &m_highQuality);
    bind(ControlId::ScaleToFitPaper, &m_scaleToFitPage);
    bind(ControlId::PrintHiddenSlides, &m_printHiddenSlides);
    bind(ControlId::FrameSlides, &m_frameSlides);
    bind(ControlId::PrintCommentsAndInkMarkup, &m_printCommentsAndInkMarkup);
    return true;
}

bool MSOfficePanel::ReadSettings(SettingsMap& settings) {
    OutputFileTypePanelMSO::ReadSettings(settings);
    m_printer = ReadText(settings, "PRINTER", m_printers.empty() ? m_printer : m_printers[0]);
    m_handoutsHorizontal = ReadFlag(settings, "HANDOUTSHORIZONTAL", true);
    m_handoutsVertical = ReadFlag(settings, "HANDOUTSVERTICAL", false);
    m_printOutputType = ReadText(settings, "PRINTOUTPUTTYPE", Translated("Slides"));
    m_color = ReadText(settings, "COLOR", Translated("Color"));
    m_slidesPerPage = ReadText(settings, "SLIDESPERPAGE", "6");
    m_scaleToFitPage = ReadFlag(settings, "SCALETOFITPAGE", false);
    m_frameSlides = ReadFlag(settings, "FRAMESLIDES", false);
    m_printHiddenSlides = ReadFlag(settings, "PRINTHIDDENSLIDES", true);
    m_printCommentsAndInkMarkup = ReadFlag(settings, "PRINTCOMMENTSANDINKMARKUP", true);
    m_highQuality = ReadFlag(settings, "HIGHQUALITY", false);

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
    settings["PRINTER"] = m_printer;
    settings["PRINTOUTPUTTYPE"] = m_printOutputType;
    settings["COLOR"] = m_color;
    settings["SLIDESPERPAGE"] = m_slidesPerPage;
    WriteFlag(settings, "HANDOUTSHORIZONTAL", m_handoutsHorizontal);
    WriteFlag(settings, "HANDOUTSVERTICAL", m_handoutsVertical);
    WriteFlag(settings, "SCALETOFITPAGE", m_scaleToFitPage);
    WriteFlag(settings, "FRAMESLIDES", m_frameSlides);
    WriteFlag(settings, "PRINTHIDDENSLIDES", m_printHiddenSlides);
    WriteFlag(settings, "PRINTCOMMENTSANDINKMARKUP", m_printCommentsAndInkMarkup);
    WriteFlag(settings, "HIGHQUALITY", m_highQuality);
    return true;
}

bool MSOfficePanel::IsHandouts() const {
    return m_printOutputType.CmpNoCase(Translated("Handouts")) == 0;
}

void MSOfficePanel::EnableHandouts(bool enable) {
    EnableControls(this, HandoutGroup, enable);
}

wxString MSOfficePanel::Selected(int choice) const {
    return dynamic_cast<wxChoice*>(FindWindow(choice))->GetStringSelection();
}

void MSOfficePanel::OnHorizontalOrder(wxCommandEvent& event) {
    m_handoutsHorizontal = event.GetInt() != 0;
    m_handoutsVertical = !m_handoutsHorizontal;
}

void MSOfficePanel::OnVerticalOrder(wxCommandEvent& event) {
    m_handoutsVertical = event.GetInt() != 0;
    m_handoutsHorizontal = !m_handoutsVertical;
}

void MSOfficePanel::OnScaleToFitPage(wxCommandEvent& event) {
    m_scaleToFitPage = event.GetInt() != 0;
}

void MSOfficePanel::OnPrintHiddenSlides(wxCommandEvent& event) {
    m_printHiddenSlides = event.GetInt() != 0;
}

void MSOfficePanel::OnFrameSlides(wxCommandEvent& event) {
    m_frameSlides = event.GetInt() != 0;
}

void MSOfficePanel::OnPrintCommentsAndInkMarkup(wxCommandEvent& event) {
    m_printCommentsAndInkMarkup = event.GetInt() != 0;
}

void MSOfficePanel::OnHighQuality(wxCommandEvent& event) {
    m_highQuality = event.GetInt() != 0;
}

void MSOfficePanel::OnPrinter(wxCommandEvent& /*event*/) {
    m_printer = Selected(ControlId::Printer);
    wxWindow* note = FindWindow(ControlId::NotePanel);
    if (!note)
        return;
    note->Show(m_printer.Contains("Adobe")); // its advice is about Adobe's printer
    Refresh();
}

void MSOfficePanel::OnPrintOutputType(wxCommandEvent& /*event*/) {
    m_printOutputType = Selected(ControlId::Print);
    EnableHandouts(IsHandouts());
}

void MSOfficePanel::OnColor(wxCommandEvent& /*event*/) {
    m_color = Selected(ControlId::Colour);
}

void MSOfficePanel::OnSlidesPerPage(wxCommandEvent& /*event*/) {
    m_slidesPerPage = Selected(ControlId::SlidesPerPage);
}
