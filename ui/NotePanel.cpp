#include "ui/NotePanel.h"

#include "common/Themer.h"
#include "plugin/interface/ControlIds.h"
#include "ui/Controls.h"

#include <wx/panel.h>
#include <wx/sizer.h>
#include <wx/stattext.h>

namespace {

constexpr int WrapWidth = 360;
constexpr int LeastHeight = 30;

/// The Tab key passes it by.
class NotePanel : public wxPanel {
public:
    explicit NotePanel(wxWindow* parent)
        : wxPanel(parent, ControlId::NotePanel, wxDefaultPosition, wxDefaultSize, 0, "NotePanel") {
        m_container.DisableSelfFocus();
    }
};

} // namespace

wxPanel* CreateNotePanel(wxWindow* parent, const wxString& message) {
    const Theme& theme = Themer::GetThemeService()->GetTheme("Note");
    auto* panel = new NotePanel(parent);
    panel->SetBackgroundColour(theme.backgroundColour);

    wxStaticText* heading = NewLabel(panel, wxID_ANY, "Note:");
    heading->SetFont(theme.font);
    auto* text = new wxStaticText(panel, wxID_ANY, message, wxDefaultPosition, wxDefaultSize, 0);
    text->Wrap(WrapWidth);

    auto* row = new wxBoxSizer(wxHORIZONTAL);
    row->Add(heading, 0, wxEXPAND | wxALIGN_CENTER_VERTICAL | wxALL, 5);
    row->Add(text, 0, wxEXPAND | wxALIGN_CENTER_VERTICAL | wxALL, 5);
    row->Add(0, LeastHeight, 0, wxALIGN_CENTER | wxALL, 0);
    panel->SetSizer(row);
    row->SetSizeHints(panel);
    return panel;
}
