#pragma once

#include <wx/string.h>

class wxSizer;
class wxWindow;

/// Builds the row that tells which files the filter takes.
/// @param parent becomes the parent of the controls
/// @param callFit with `setSizer`: fits `parent` to the row
/// @param setSizer gives `parent` the row as its sizer
/// @param text shown as it is, in every language
/// @return the row's sizer; the caller's to place unless `parent` has it
wxSizer* InputFileTypeFunc(wxWindow* parent, bool callFit, bool setSizer, const wxString& text);
