#include "tests/ui/settings/SettingsWindow.h"

wxWindow* FocusedIn(wxWindow* window) {
    wxWindow* const focused = wxWindow::FindFocus();
    return focused && window->IsDescendant(focused) ? focused : nullptr;
}

void ReadAnew(wxScreenDC& /*screen*/) {} // which keeps nothing
