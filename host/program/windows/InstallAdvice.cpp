#include "host/program/system/InstallAdvice.h"

wxString InstallAdvice(const wxString& progId) {
    return progId.empty() ? wxString("Install Microsoft Office")
                          : "Install Microsoft " + progId.BeforeFirst('.');
}

wxString PdfInstallAdvice() {
    return "Install Acrobat Distiller";
}
