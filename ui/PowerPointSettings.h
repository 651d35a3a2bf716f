#pragma once

class wxSizer;
class wxWindow;

/// Builds the printer row and the box of PowerPoint's print options.
/// @param parent becomes the parent of the row and the box
/// @param callFit with `setSizer`: fits `parent` to them
/// @param setSizer gives `parent` their sizer
/// @return their sizer; the caller's to place unless `parent` has it
wxSizer* PowerPointSettingsFunc(wxWindow* parent, bool callFit, bool setSizer);
