#include "host/program/machine/FontStandIns.h"

#include "host/program/machine/StandInKeys.h"

#include <wx/arrstr.h>

// After the strings, which it takes for granted.
#include <wx/msw/registry.h>

void ForgetFontStandIns() {
    wxRegKey key(wxRegKey::HKCU, LastFontsKey);
    if (key.Exists())
        key.DeleteSelf();
}

std::vector<FontStandIn> LastFontStandIns() {
    const wxRegKey key(wxRegKey::HKCU, LastFontsKey);
    wxString lines;
    if (key.Exists() && key.HasValue(FontsValue))
        key.QueryValue(FontsValue, lines);
    std::vector<FontStandIn> fonts;
    for (const wxString& line : wxSplit(lines, '\n', '\0')) {
        const wxArrayString parts = wxSplit(line, '\t', '\0');
        if (parts.size() == 3)
            fonts.push_back({parts[0], parts[1], parts[2] == "metric"});
    }
    return fonts;
}
