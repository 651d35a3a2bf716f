#pragma once

#include <wx/string.h>

#include <vector>

/// The Distiller profiles that PDF files can be made with, by the names that filters know them
/// under: first the user's own, then the installed ones.
std::vector<wxString> ListDistillerProfiles();

/// What makes PDF files on this machine, with its version.
/// @return empty when nothing does
wxString DistillerEngine();
