#include "host/program/system/InstalledFonts.h"

#include "host/program/system/Digest.h"

#include <wx/msw/registry.h>

#include <set>

std::string DigestOfFonts() {
    std::set<std::string> names; // whatever order they are found in
    wxRegKey fonts(wxRegKey::HKLM, R"(SOFTWARE\Microsoft\Windows NT\CurrentVersion\Fonts)");
    wxString name;
    long place = 0;
    for (bool isThere = fonts.Exists() && fonts.GetFirstValue(name, place); isThere;
         isThere = fonts.GetNextValue(name, place)) {
        wxString file;
        fonts.QueryValue(name, file);
        names.insert((name + '=' + file).utf8_string());
    }
    Digest digest;
    for (const std::string& each : names)
        digest.Add(each.c_str(), each.size() + 1);
    return digest.Text();
}
