#pragma once

#include <wx/string.h>

/// Makes a PDF file of a PostScript file with Distiller, through the bridge library that lies in
/// the folder of filters. Logs the begin and the end of Distiller's work.
/// @param psPath the PostScript file's full path
/// @param pdfPath the full path of the file to be made
/// @param profile the job options' file name as GetDistillerProfiles lists it; empty for
/// Distiller's own; not null
/// @return whether the bridge reported success; the PostScript file stays as it is
bool ConvertPS2PDF(wxString psPath, wxString pdfPath, const wchar_t* profile);
