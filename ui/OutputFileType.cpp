#include "ui/OutputFileType.h"

#include "common/Translated.h"
#include "plugin/interface/ControlIds.h"
#include "ui/Controls.h"

#include <wx/choice.h>
#include <wx/panel.h>
#include <wx/radiobut.h>
#include <wx/sizer.h>
#include <wx/stattext.h>

namespace {

constexpr int ProfileWidth = 250;

wxRadioButton* NewRadioButton(wxWindow* parent, int id, const char* english, long style) {
    return new wxRadioButton(parent, id, Translated(english), wxDefaultPosition, wxDefaultSize,
                             style);
}

wxSizer* NewProfileRow(wxWindow* content) {
    auto* row = new wxBoxSizer(wxHORIZONTAL);
    row->Add(NewLabel(content, ControlId::DistillerProfileLabel, "Distiller profile:"), 0,
             wxALIGN_CENTER | wxALL, 5);
    row->Add(new wxChoice(content, ControlId::DistillerProfile, wxDefaultPosition,
                          wxSize(ProfileWidth, wxDefaultCoord)),
             0, wxEXPAND | wxALL, 5);
    return row;
}

void FillContent(wxPanel* content) {
    auto* rows = new wxBoxSizer(wxVERTICAL);
    rows->Add(NewRadioButton(content, ControlId::OutputPS, "PS", wxRB_GROUP), 0,
              wxALIGN_CENTER_VERTICAL | wxALL, 5);
    rows->Add(NewRadioButton(content, ControlId::OutputPDF, "PDF", 0), 0,
              wxALIGN_CENTER_VERTICAL | wxALL, 5);
    rows->Add(NewProfileRow(content), 0,
              wxEXPAND | wxALIGN_CENTER_VERTICAL | wxRIGHT | wxTOP | wxBOTTOM, 5);
    content->SetSizer(rows);
    rows->SetSizeHints(content);
}

} // namespace

wxSizer* OutputFileTypeFunc(wxWindow* parent, bool callFit, bool setSizer) {
    auto* top = new wxBoxSizer(wxVERTICAL);
    top->Add(NewLabel(parent, wxID_ANY, "Output file type"), 0, wxLEFT, 10);

    wxPanel* frame = NewBorderPanel(parent);
    wxPanel* content = NewContentPanel(frame);
    FillContent(content);
    PutFrameAround(frame, content);
    top->Add(frame, 1, wxEXPAND | wxALL, 5);
    return FinishLayout(parent, top, callFit, setSizer);
}
