#include "host/program/system/InstallAdvice.h"

#include <wx/intl.h>

namespace {

struct Package {
    const char* progId;
    const char* name;
};

constexpr Package Packages[] = {
    {"Word.Application", "libreoffice-writer-nogui"},
    {"Excel.Application", "libreoffice-calc-nogui"},
    {"PowerPoint.Application", "libreoffice-impress-nogui"},
    {"Publisher.Application", "libreoffice-draw-nogui"},
};

} // namespace

wxString InstallAdvice(const wxString& progId) {
    wxString packages;
    for (const Package& package : Packages)
        if (progId.empty() || progId == package.progId)
            packages << ' ' << package.name;
    return packages.empty()
               ? packages
               : wxString::Format(_("Install LibreOffice with: apt-get install%s"), packages);
}

wxString PdfInstallAdvice() {
    return _("Install Ghostscript with: apt-get install ghostscript");
}
