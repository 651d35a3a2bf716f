#include "ui/Controls.h"

#include "common/Themer.h"
#include "common/Translated.h"

#include <wx/panel.h>
#include <wx/sizer.h>
#include <wx/stattext.h>

namespace {

constexpr long BorderlessPanel = wxTAB_TRAVERSAL | wxBORDER_NONE;

const Theme& DefaultTheme() {
    return Themer::GetThemeService()->GetTheme("Default");
}

} // namespace

wxStaticText* NewLabel(wxWindow* parent, int id, const char* english) {
    return new wxStaticText(parent, id, Translated(english), wxDefaultPosition, wxDefaultSize, 0);
}

wxPanel* NewBorderPanel(wxWindow* parent) {
    auto* panel = new wxPanel(parent, wxID_ANY, wxDefaultPosition, wxDefaultSize, BorderlessPanel);
    panel->SetBackgroundColour(DefaultTheme().borderColour);
    return panel;
}

wxPanel* NewContentPanel(wxWindow* parent) {
    auto* panel = new wxPanel(parent, wxID_ANY, wxDefaultPosition, wxDefaultSize, BorderlessPanel);
    panel->SetBackgroundColour(DefaultTheme().backgroundColour);
    return panel;
}

void PutFrameAround(wxPanel* frame, wxPanel* content) {
    auto* sizer = new wxBoxSizer(wxVERTICAL);
    sizer->Add(content, 1, wxEXPAND | wxALL, 1);
    frame->SetSizer(sizer);
    sizer->SetSizeHints(frame);
}

wxSizer* FinishLayout(wxWindow* parent, wxSizer* sizer, bool callFit, bool setSizer) {
    if (setSizer) {
        parent->SetSizer(sizer);
        if (callFit)
            sizer->SetSizeHints(parent);
    }
    return sizer;
}

void EnableControls(wxWindow* panel, std::initializer_list<int> ids, bool enable) {
    for (const int id : ids)
        if (wxWindow* control = panel->FindWindow(id))
            control->Enable(enable);
}
