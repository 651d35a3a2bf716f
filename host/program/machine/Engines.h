#pragma once

#include <wx/string.h>

#include <optional>

/// What stands behind the Office applications, with its version.
/// @return empty where they stand for themselves, or there are none
wxString OfficeEngine();

/// Why that is started anew for each document.
/// @return empty when it is not; nothing where nobody has looked
std::optional<wxString> OfficeEngineKeepingObstacle();

/// What makes PDF files on this machine, with its version.
/// @return empty when nothing is known to
wxString PdfEngine();

/// What keeps a document from everything but itself while an engine works on it, whatever it holds.
struct EngineIsolation {
    wxString means;   ///< by their names; may be empty
    wxString missing; ///< and why, in English, without a full stop; empty when nothing is
};

/// @return nothing where Office itself opens the documents
std::optional<EngineIsolation> IsolationOfEngines();
