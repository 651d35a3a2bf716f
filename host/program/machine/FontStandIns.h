#pragma once

#include <wx/string.h>

#include <vector>

/// A font that a document asks for and that is not there, and the one that was set in its place.
struct FontStandIn {
    wxString asked;
    wxString used;
    bool hasSameMetrics = false; ///< so that lines break where they would
};

/// Forgets what was told so far. To be called before a filter is asked to open anything.
void ForgetFontStandIns();

/// What the stand-ins for the Office applications have told since then; Office itself tells none.
std::vector<FontStandIn> LastFontStandIns();
