#pragma once

#include <wx/string.h>

// Whether a file of a legacy format is what its extension says: a compound file with the stream
// that its application keeps its document in.
//
// Each answers 0, -1002 for an empty path, or -1005 for anything else than such a document.

int CheckWordCompoundFile(const wxString& path);
int CheckExcelCompoundFile(const wxString& path);
int CheckPowerPointCompoundFile(const wxString& path);
int CheckPublisherFile(const wxString& path);
