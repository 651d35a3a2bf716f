#include "host/program/system/InstallAdvice.h"

#include <wx/intl.h>

wxString InstallAdvice(const wxString& progId) {
    return wxString::Format(_("Install Microsoft %s"),
                            progId.empty() ? wxString("Office") : progId.BeforeFirst('.'));
}

wxString PdfInstallAdvice() {
    return _("Install Acrobat Distiller");
}
