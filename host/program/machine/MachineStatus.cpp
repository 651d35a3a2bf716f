#include "host/program/machine/MachineStatus.h"

#include "host/program/machine/Distiller.h"
#include "host/program/machine/Registry.h"
#include "host/program/system/InstallAdvice.h"

#include <algorithm>

namespace {

OfficeApplication LookFor(const wxString& name) {
    OfficeApplication application;
    application.name = name;
    application.progId = name + ".Application";
    application.installed = wxRegKey(wxRegKey::HKCR, application.progId).Exists();
    const wxString current =
        RegisteredText(wxRegKey::HKCR, application.progId + "\\CurVer", wxEmptyString);
    application.version = current.AfterLast('.'); // Word.Application.16
    if (!application.installed)
        application.advice = InstallAdvice(application.progId);
    return application;
}

bool HasOffice(const MachineStatus& status) {
    return std::any_of(status.applications.begin(), status.applications.end(),
                       [](const OfficeApplication& application) { return application.installed; });
}

std::vector<MissingPart> FindMissing(const MachineStatus& status) {
    std::vector<MissingPart> missing;
    if (!HasOffice(status))
        missing.push_back({"No Office application is installed", InstallAdvice({})});
    if (!PreferredPrinter(status.printers))
        missing.push_back({"There is no PostScript printer",
                           "Install the program anew, which brings one, or add one to the system"});
    if (status.pdfEngine.empty())
        missing.push_back({"There is nothing to make PDF files with", PdfInstallAdvice()});
    return missing;
}

} // namespace

MachineStatus LookAtMachine() {
    MachineStatus status;
    for (const char* name : {"Word", "Excel", "PowerPoint", "Publisher"})
        status.applications.push_back(LookFor(name));
    status.engine = RegisteredText(wxRegKey::HKLM, StandInsKey, EngineValue);
    status.printers = ListPrinters();
    status.pdfEngine = DistillerEngine();
    status.profiles = ListDistillerProfiles();
    status.missing = FindMissing(status);
    // With a server as new as the one that the host speaks of, a missing printer disables nothing.
    if (!HasOffice(status))
        status.panelObstacle = "no Office application is installed. " + InstallAdvice({});
    return status;
}
