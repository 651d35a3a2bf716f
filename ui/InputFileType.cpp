#include "ui/InputFileType.h"

#include "plugin/interface/ControlIds.h"
#include "ui/Controls.h"

#include <wx/sizer.h>
#include <wx/stattext.h>

wxSizer* InputFileTypeFunc(wxWindow* parent, bool callFit, bool setSizer, const wxString& text) {
    auto* row = new wxBoxSizer(wxHORIZONTAL);
    row->Add(NewLabel(parent, ControlId::InputTypesLabel, "Input file type:"), 0,
             wxALIGN_CENTER | wxRIGHT, 15);
    row->Add(
        new wxStaticText(parent, ControlId::InputTypes, text, wxDefaultPosition, wxDefaultSize, 0),
        0, wxALIGN_CENTER | wxLEFT | wxRIGHT, 5);

    auto* top = new wxBoxSizer(wxVERTICAL);
    top->Add(row, 0, wxEXPAND | wxALIGN_CENTER_VERTICAL | wxALL, 5);
    return FinishLayout(parent, top, callFit, setSizer);
}
