#pragma once

#include <wx/string.h>

/// What stands behind the Office applications, with its version.
/// @return empty where they stand for themselves, or there are none
wxString OfficeEngine();

/// What makes PDF files on this machine, with its version.
/// @return empty when nothing is known to
wxString PdfEngine();
