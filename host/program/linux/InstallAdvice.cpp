#include "host/program/system/InstallAdvice.h"

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
    return packages.empty() ? wxString() : "Install LibreOffice with: apt-get install" + packages;
}

wxString PdfInstallAdvice() {
    return "Install Ghostscript with: apt-get install ghostscript";
}
