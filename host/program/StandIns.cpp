#include "host/program/StandIns.h"

#include "common/WQServices.h"
#include "host/program/ModuleFiles.h"
#include "host/program/PathText.h"

#include <objbase.h>
#include <windows.h>

namespace {

using RegisterServer = HRESULT(STDMETHODCALLTYPE*)();

void Register(const std::filesystem::path& file) {
    const HMODULE module = LoadLibraryW(ToText(file).value_or(wxString()).wc_str());
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

} // namespace

void RegisterStandIns(const std::filesystem::path& folder) {
    for (const std::filesystem::path& file : ModuleFiles(folder))
        Register(file);
}
