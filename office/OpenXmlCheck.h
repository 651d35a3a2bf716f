#pragma once

#include <wx/string.h>

// Whether the application can open an Office Open XML document: it is asked to.

/// @return whether the application opened the document; it is told to quit when it did
bool TryOpenInWord(wxString path);
bool TryOpenInExcel(wxString path);
bool TryOpenInPowerPoint(wxString path);

/// @return 0, -1002 for an empty path, or -1005 when the application cannot open the document
int CheckWordOpenXmlFile(const wxString& path);
int CheckExcelOpenXmlFile(const wxString& path);
int CheckPowerPointOpenXmlFile(const wxString& path);
