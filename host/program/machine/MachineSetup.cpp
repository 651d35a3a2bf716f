#include "host/program/machine/MachineSetup.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/base/ProgramFiles.h"
#include "host/program/machine/FilePrinter.h"
#include "host/program/machine/StandInKeys.h"
#include "machine/Distiller.h"
#include "machine/FiltersFolder.h"
#include "machine/OutputClocks.h"
#include "machine/RegistryText.h"

#include <objbase.h>
#include <windows.h>

namespace {

template <typename Value>
void Enter(wxRegKey::StdKey root, const char* keyName, const char* valueName, const Value& value) {
    wxRegKey key(root, keyName);
    if (!key.Create() || !key.SetValue(valueName, value))
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "Cannot enter into the registry: " << keyName << ", " << valueName;
}

using RegisterServer = HRESULT(STDMETHODCALLTYPE*)();

void Register(const std::filesystem::path& file) {
    const HMODULE module = LoadLibraryW(ToText(file).wc_str());
    const auto registerServer = reinterpret_cast<RegisterServer>(reinterpret_cast<void (*)()>(
        module ? GetProcAddress(module, "DllRegisterServer") : nullptr));
    const HRESULT result = registerServer ? registerServer() : E_FAIL;
    if (FAILED(result))
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "The stand-in could not be registered: " << Shown(file)
            << wxString::Format(", result 0x%08x", static_cast<unsigned>(result));
    if (module)
        FreeLibrary(module); // COM loads it again when an application is asked for
}

/// Tells the Distiller stand-in where the profiles lie, so that it finds what filters list.
void HandOverProfiles() {
    const std::optional<Distiller> distiller = FindDistiller();
    Enter(wxRegKey::HKCU, DistillerStandInKey, UserProfilesValue, UserProfilesFolder());
    Enter(wxRegKey::HKCU, DistillerStandInKey, JobOptionsFolderValue,
          distiller ? distiller->jobOptionsFolder.value_or(wxString()) : wxString());
}

/// Lets the stand-ins of a folder enter themselves, where the system has no Office and no Distiller
/// of its own. They enter what their engines are there for.
void RegisterStandIns(const std::filesystem::path& folder) {
    const std::vector<std::filesystem::path> modules = ModuleFiles(folder);
    for (const std::filesystem::path& file : modules)
        Register(file);
    if (!modules.empty())
        HandOverProfiles();
}

/// @param seconds without which the value of an earlier program goes
void EnterSeconds(const char* keyName, const char* valueName, std::optional<unsigned> seconds) {
    wxRegKey key(wxRegKey::HKCU, keyName);
    if (seconds)
        Enter(wxRegKey::HKCU, keyName, valueName, static_cast<long>(*seconds));
    else if (key.Exists() && key.HasValue(valueName))
        key.DeleteValue(valueName);
}

/// Sets the limits of Office's engine, of Distiller's and of the file that Office prints into.
void EnterLimits(const MachineSetup& setup) {
    for (const char* keyName : {StandInsKey, DistillerStandInKey}) {
        EnterSeconds(keyName, StallSecondsValue, setup.stallSeconds);
        EnterSeconds(keyName, TotalSecondsValue, setup.limitSeconds);
        Enter(wxRegKey::HKCU, keyName, MemoryValue, static_cast<long>(setup.memoryMegabytes));
    }
    EnterSeconds(HostKey, OutputStallSecondsValue, setup.stallSeconds);
    EnterSeconds(HostKey, OutputTotalSecondsValue, setup.limitSeconds);
}

} // namespace

void SetUpMachine(const MachineSetup& setup) {
    Enter(wxRegKey::HKLM, HostKey, InstallPathValue, ToText(ProgramFolder()));
    EnterLimits(setup);
    Enter(wxRegKey::HKCU, StandInsKey, ExamineValue, setup.examineEngine ? 1L : 0L);
    RegisterStandIns(setup.standInsFolder);
    AddFilePrinter(ProgramFolder() / "Printers" / "QuillonPS.ppd");
}

void KeepEngine(unsigned documents) {
    Enter(wxRegKey::HKCU, StandInsKey, DocumentsPerStartValue, static_cast<long>(documents));
}
