#include "host/program/MachineSetup.h"

#include "common/WQServices.h"
#include "host/program/FilePrinter.h"
#include "host/program/PathText.h"
#include "host/program/ProgramFolder.h"
#include "host/program/RegistryNames.h"
#include "host/program/StandIns.h"

#include <wx/msw/registry.h>

namespace {

template <typename Value>
void Enter(wxRegKey::StdKey root, const char* keyName, const char* valueName, const Value& value) {
    wxRegKey key(root, keyName);
    if (!key.Create() || !key.SetValue(valueName, value))
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "Cannot enter into the registry: " << keyName << ", " << valueName;
}

} // namespace

void SetUpMachine(const MachineSetup& setup) {
    Enter(wxRegKey::HKLM, HostKey, InstallPathValue, ToText(ProgramFolder()).value_or(wxString()));
    if (setup.stallSeconds)
        Enter(wxRegKey::HKCU, StandInsKey, StallSecondsValue, long{*setup.stallSeconds});
    if (setup.limitSeconds)
        Enter(wxRegKey::HKCU, StandInsKey, TotalSecondsValue, long{*setup.limitSeconds});
    RegisterStandIns(setup.standInsFolder);
    AddFilePrinter(ProgramFolder() / "Printers" / "QuillonPS.ppd");
}
