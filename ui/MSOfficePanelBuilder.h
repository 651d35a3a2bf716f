#pragma once

#include <wx/string.h>

class MSOfficePanel;
class wxWindow;

/// Builds the settings panel under the host's window, which owns it. Fills its lists from the
/// machine's printers and job options; the caller then has it read the settings.
/// @param vendorName shown in the strip at the top
/// @param inputTypes the extensions, shown as they are
/// @param controlsEnabled whether the controls may be used at all
/// @param officeInstalled whether there is an Office application; decides what the note says
MSOfficePanel* BuildMSOfficePanel(wxWindow* parent, const wxString& vendorName,
                                  const wxString& inputTypes, bool controlsEnabled,
                                  bool officeInstalled);
