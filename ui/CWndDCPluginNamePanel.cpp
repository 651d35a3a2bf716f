#include "ui/CWndDCPluginNamePanel.h"

#include "common/Themer.h"

#include <wx/dcclient.h>

namespace {

constexpr int StripHeight = 22;
constexpr int NameLeft = 8;
constexpr int NameTop = 4;

const Theme& HeaderTheme() {
    return Themer::GetThemeService()->GetTheme("HeaderView");
}

} // namespace

// clang-format off
wxBEGIN_EVENT_TABLE(CWndDCPluginNamePanel, wxPanel)
    EVT_PAINT(CWndDCPluginNamePanel::OnPaint)
    EVT_SIZE(CWndDCPluginNamePanel::OnSize)
wxEND_EVENT_TABLE()
// clang-format on

CWndDCPluginNamePanel::CWndDCPluginNamePanel(wxWindow* parent, int id)
    : wxPanel(parent, id, wxDefaultPosition, wxSize(wxDefaultCoord, StripHeight),
              wxTAB_TRAVERSAL | wxBORDER_NONE) {
    SetBackgroundColour(HeaderTheme().backgroundColour);
    m_container.DisableSelfFocus(); // the Tab key passes it by
}

void CWndDCPluginNamePanel::SetPluginName(wxString name) {
    m_pluginName.swap(name);
}

void CWndDCPluginNamePanel::OnPaint(wxPaintEvent& /*event*/) {
    wxPaintDC dc(this);
    const wxRect area = GetClientRect();
    dc.SetPen(*wxTRANSPARENT_PEN);
    dc.SetBrush(wxBrush(GetBackgroundColour(), wxBRUSHSTYLE_SOLID));
    dc.SetFont(HeaderTheme().font);
    dc.SetTextForeground(HeaderTheme().textColour);
    dc.DrawRectangle(area);
    dc.DrawText(m_pluginName, NameLeft, NameTop);
}

void CWndDCPluginNamePanel::OnSize(wxSizeEvent& event) {
    event.Skip();
}
