#pragma once

#include <wx/string.h>

/// The XML text in which the host describes the print server that it submits to, as filters expect
/// it at their initialisation.
wxString ServerInformation();
