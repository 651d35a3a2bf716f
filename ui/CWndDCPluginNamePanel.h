#pragma once

#include <wx/panel.h>

/// The strip at the top of the settings panel: a name on a band in the theme's colours.
class CWndDCPluginNamePanel : public wxPanel {
public:
    CWndDCPluginNamePanel(wxWindow* parent, int id);

    /// Sets the name to paint. Does not repaint: it is set before the panel is shown.
    void SetPluginName(wxString name);

private:
    void OnPaint(wxPaintEvent& event);
    void OnSize(wxSizeEvent& event);

    wxString m_pluginName;

    wxDECLARE_EVENT_TABLE();
};
