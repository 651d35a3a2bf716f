#pragma once

class wxSizer;
class wxWindow;

/// Builds the box in which PostScript or PDF is chosen, and Distiller's profile.
/// @param parent becomes the parent of the box
/// @param callFit with `setSizer`: fits `parent` to the box
/// @param setSizer gives `parent` the box as its sizer
/// @return the box's sizer; the caller's to place unless `parent` has it
wxSizer* OutputFileTypeFunc(wxWindow* parent, bool callFit, bool setSizer);
