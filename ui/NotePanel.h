#pragma once

#include <wx/string.h>

class wxPanel;
class wxWindow;

/// Builds the note at the foot of the settings panel.
/// @param message shown as it is; the caller has translated it
/// @return the panel, laid out and shown
wxPanel* CreateNotePanel(wxWindow* parent, const wxString& message);
