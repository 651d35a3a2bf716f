#pragma once

#include <wx/string.h>

/// What a user of this system installs to have an Office application's documents converted.
/// @param progId the application's, for instance "Word.Application"; empty for all of them
/// @return a sentence; empty when nothing that could be installed serves the application
wxString InstallAdvice(const wxString& progId);

/// What a user of this system installs to have PDF files made.
wxString PdfInstallAdvice();
