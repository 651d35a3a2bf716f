#include "ui/PowerPointSettings.h"

#include "common/Translated.h"
#include "plugin/interface/ControlIds.h"
#include "plugin/settings/FilterSettings.h"
#include "ui/Controls.h"
#include "ui/SeparatorLine.h"

#include <wx/checkbox.h>
#include <wx/choice.h>
#include <wx/panel.h>
#include <wx/radiobut.h>
#include <wx/sizer.h>
#include <wx/stattext.h>

namespace {

constexpr int PrinterWidth = 212;
constexpr int OptionWidth = 140;
constexpr int CountWidth = 50;
constexpr int SpacerSize = 20;

// The flags of a cell, by what they do.
constexpr int Centred = wxALIGN_CENTER;
constexpr int Middle = wxALIGN_CENTER_VERTICAL;
constexpr int Sides = wxLEFT | wxRIGHT;

/// One row of the box: cells are added from left to right, line by line.
class CellRow {
public:
    CellRow(wxWindow* parent, int columns)
        : m_parent(parent), m_sizer(new wxFlexGridSizer(columns, 0, 0)) {}

    void Label(int id, const char* english, int flags, int border) {
        m_sizer->Add(NewLabel(m_parent, id, english), 0, flags, border);
    }
    void Space(int flags) { m_sizer->Add(SpacerSize, SpacerSize, 0, flags, 5); }
    void Line() { m_sizer->Add(new SeparatorLine(m_parent, ControlId::Separator), 0, wxEXPAND, 0); }
    void Choice(int id, int width, const Setting& setting, int flags) {
        wxArrayString shown;
        for (const SettingChoice& choice : setting.choices)
            shown.Add(Translated(choice.text));
        m_sizer->Add(
            new wxChoice(m_parent, id, wxDefaultPosition, wxSize(width, wxDefaultCoord), shown), 0,
            flags, 5);
    }
    void RadioButton(int id, const char* english, long style, int flags) {
        m_sizer->Add(new wxRadioButton(m_parent, id, Translated(english), wxDefaultPosition,
                                       wxDefaultSize, style),
                     0, flags, 5);
    }
    void CheckBox(int id, const char* english, const Setting& setting, int flags, int border) {
        auto* box = new wxCheckBox(m_parent, id, Translated(english));
        box->SetValue(*setting.panelStandard == '1');
        m_sizer->Add(box, 0, flags, border);
    }

    wxSizer* Sizer() const { return m_sizer; }

private:
    wxWindow* m_parent;
    wxFlexGridSizer* m_sizer;
};

wxSizer* NewPrinterRow(wxWindow* parent) {
    auto* row = new wxBoxSizer(wxHORIZONTAL);
    row->Add(NewLabel(parent, ControlId::PrinterLabel, "Printer name:"), 0, Centred | wxALL, 5);
    row->Add(new wxChoice(parent, ControlId::Printer, wxDefaultPosition,
                          wxSize(PrinterWidth, wxDefaultCoord)),
             0, Centred | wxLEFT, 70);
    return row;
}

wxSizer* NewOutputRow(wxWindow* content) {
    CellRow row(content, 3);
    row.Label(ControlId::PrintLabel, "Print:", Middle | wxRIGHT, 75);
    row.Space(Centred | wxALL);
    row.Choice(ControlId::Print, OptionWidth, FilterSettings::OutputType, Centred | wxALL);
    row.Label(ControlId::ColourLabel, "Color/grayscale:", Middle | wxRIGHT, 5);
    row.Space(Centred | wxALL);
    row.Choice(ControlId::Colour, OptionWidth, FilterSettings::Colour, Centred | wxALL);
    return row.Sizer();
}

wxSizer* NewHeadingRow(wxWindow* content, int id, const char* english) {
    CellRow row(content, 2);
    row.Label(id, english, Centred, 5);
    row.Line();
    return row.Sizer();
}

wxSizer* NewHandoutsRow(wxWindow* content) {
    CellRow row(content, 4);
    row.Label(ControlId::SlidesPerPageLabel, "Slides per page:", Middle | wxRIGHT, 25);
    row.Space(Centred | wxALL);
    row.Choice(ControlId::SlidesPerPage, CountWidth, FilterSettings::SlidesPerPage, Middle | Sides);
    row.Label(ControlId::NoImage, "No image", Centred | wxLEFT, 15);
    EnableControls(content, {ControlId::NoImage}, false);

    row.Label(ControlId::OrderLabel, "Order:", Middle | wxRIGHT, 70);
    row.Space(Centred | Sides | wxTOP);
    row.RadioButton(ControlId::OrderHorizontal, "Horizontal", wxRB_GROUP, Middle | Sides);
    row.Space(Centred | Sides | wxTOP);

    row.Space(Middle | Sides);
    row.Space(Centred | Sides);
    row.RadioButton(ControlId::OrderVertical, "Vertical", 0, Middle | Sides);
    row.Space(Centred | Sides);
    return row.Sizer();
}

wxSizer* NewAdvancedRow(wxWindow* content) {
    CellRow row(content, 3);
    row.CheckBox(ControlId::ScaleToFitPaper, "Scale to fit paper", FilterSettings::ScaleToFitPage,
                 Middle | wxRIGHT, 115);
    row.Space(Centred | Sides);
    row.CheckBox(ControlId::PrintHiddenSlides, "Print hidden slides",
                 FilterSettings::PrintHiddenSlides, Centred | wxALL, 5);

    row.CheckBox(ControlId::FrameSlides, "Frame slides", FilterSettings::FrameSlides,
                 Middle | wxRIGHT, 5);
    row.Space(Centred | Sides);
    row.CheckBox(ControlId::HighQuality, "High quality", FilterSettings::HighQuality,
                 Middle | wxALL, 5);

    row.CheckBox(ControlId::PrintCommentsAndInkMarkup, "Print comments and ink markup",
                 FilterSettings::PrintCommentsAndInkMarkup, Middle, 5);
    row.Space(Centred | Sides);
    row.Space(Middle | Sides);
    return row.Sizer();
}

void FillContent(wxPanel* content) {
    auto* rows = new wxBoxSizer(wxVERTICAL);
    for (wxSizer* row :
         {NewOutputRow(content), NewHeadingRow(content, ControlId::HandoutsHeading, "Handouts"),
          NewHandoutsRow(content),
          NewHeadingRow(content, ControlId::AdvancedHeading, "Advanced print options"),
          NewAdvancedRow(content)})
        rows->Add(row, 0, wxEXPAND | wxALIGN_CENTER_VERTICAL | wxALL, 5);
    content->SetSizer(rows);
    rows->SetSizeHints(content);
}

} // namespace

wxSizer* PowerPointSettingsFunc(wxWindow* parent, bool callFit, bool setSizer) {
    auto* top = new wxBoxSizer(wxVERTICAL);
    top->Add(NewPrinterRow(parent), 0, wxEXPAND | wxALIGN_CENTER_VERTICAL | wxALL, 5);
    top->Add(NewLabel(parent, wxID_ANY, "PowerPoint settings"), 0, wxLEFT, 10);

    wxPanel* frame = NewBorderPanel(parent);
    wxPanel* content = NewContentPanel(frame);
    FillContent(content);
    PutFrameAround(frame, content);
    top->Add(frame, 0, wxEXPAND | wxALIGN_CENTER_VERTICAL | wxLEFT | wxRIGHT | wxBOTTOM, 5);
    return FinishLayout(parent, top, callFit, setSizer);
}
