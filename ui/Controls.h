#pragma once

#include <wx/string.h>

#include <initializer_list>

class wxPanel;
class wxSizer;
class wxStaticText;
class wxWindow;

// What the builders of the panel's boxes share.

/// A label. Its English text is looked up in the host's catalogue.
wxStaticText* NewLabel(wxWindow* parent, int id, const char* english);

/// A panel without a border, in the colour of frames, or in that of what they enclose.
wxPanel* NewBorderPanel(wxWindow* parent);
wxPanel* NewContentPanel(wxWindow* parent);

/// A frame of one pixel around `content`, which must be its child: gives the frame its sizer.
void PutFrameAround(wxPanel* frame, wxPanel* content);

/// Ends a builder: gives the parent the sizer when it shall have it, and fits it when asked to.
/// @return the sizer, for the caller to place where the parent was not given it
wxSizer* FinishLayout(wxWindow* parent, wxSizer* sizer, bool callFit, bool setSizer);

/// Enables or disables the controls of these identifiers below `panel`.
void EnableControls(wxWindow* panel, std::initializer_list<int> ids, bool enable);
