#include "ui/SeparatorLine.h"

#include "common/Themer.h"

#include <algorithm>

namespace {

constexpr int Height = 1;
constexpr int Margin = 5; ///< to both sides

} // namespace

SeparatorLine::SeparatorLine(wxWindow* parent, int id)
    : wxPanel(parent, id, wxDefaultPosition, wxSize(wxDefaultCoord, Height),
              wxTAB_TRAVERSAL | wxBORDER_NONE) {
    SetBackgroundColour(Themer::GetThemeService()->GetTheme("Default").borderColour);
    m_container.DisableSelfFocus();
}

void SeparatorLine::DoSetSize(int x, int y, int width, int height, int flags) {
    const int left = x + Margin;
    const int room = GetParent()->GetClientSize().x - left - Margin;
    wxPanel::DoSetSize(left, y + (height - Height) / 2, std::max(width, room), Height, flags);
}
