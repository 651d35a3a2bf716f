#pragma once

#include <wx/arrstr.h>
#include <wx/string.h>

/// Finds the host's folder of filters, in which the bridge library lies.
/// @param folder receives the path, without a separator at its end; stays as it was when the host
/// has not entered where it is installed
void GetFiltersFolder(wxString& folder);

/// Finds the folder in which Acrobat Distiller keeps its job options.
/// @param folder receives the path; stays as it was when there is no Distiller
void GetJobOptionsFolder(wxString& folder);

/// Lists the job options that Distiller can be told to use: the user's own in the order of the
/// folder, then Distiller's in alphabetical order.
/// @param profiles file names with extension, without folder, are appended; one that is in both
/// places occurs twice
void GetDistillerProfiles(wxArrayString& profiles);
