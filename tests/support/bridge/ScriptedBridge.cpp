// A bridge library for tests: it answers what the test has entered in the registry, and enters
// there what it was given.

#include "pstools/DistillerBridge.h"
#include "tests/support/bridge/BridgeScript.h"

#include <objbase.h>

#include <filesystem>
#include <fstream>
#include <stdexcept>

#ifdef _WIN32
#    define EXPORT extern "C" __declspec(dllexport)
#else
#    define EXPORT extern "C"
#endif

namespace {

DWORD Read(HKEY key, const wchar_t* name) {
    DWORD value = 0;
    DWORD size = sizeof value;
    RegQueryValueExW(key, name, nullptr, nullptr, reinterpret_cast<BYTE*>(&value), &size);
    return value;
}

void Write(HKEY key, const wchar_t* name, DWORD value) {
    RegSetValueExW(key, name, 0, REG_DWORD, reinterpret_cast<const BYTE*>(&value), sizeof value);
}

void Write(HKEY key, const wchar_t* name, const char16_t* text) {
    if (!text)
        return;
    DWORD units = 0;
    while (text[units] != 0)
        ++units;
    RegSetValueExW(key, name, 0, REG_SZ, reinterpret_cast<const BYTE*>(text), (units + 1) * 2);
}

/// Something that a test knows again as made of the PostScript file.
void MakePdf(const DistillerRequest& request) {
    const std::ifstream source(std::filesystem::path(request.psPath), std::ios::binary);
    std::ofstream(std::filesystem::path(request.pdfPath), std::ios::binary)
        << "%PDF-1.4\n%" << source.rdbuf();
}

bool IsComInitialised() {
    const CLSID unknown{0x11111111, 0x2222, 0x3333, {4, 4, 4, 4, 4, 4, 4, 4}};
    void* object = nullptr;
    return CoCreateInstance(unknown, nullptr, CLSCTX_INPROC_SERVER, IID_IUnknown, &object) !=
           CO_E_NOTINITIALIZED;
}

} // namespace

EXPORT std::int32_t DIST_convertFile(const DistillerRequest* request) {
    HKEY key = nullptr;
    RegCreateKeyExW(HKEY_CURRENT_USER, BridgeScriptKey, 0, nullptr, REG_OPTION_NON_VOLATILE,
                    KEY_READ | KEY_WRITE, nullptr, &key, nullptr);
    Write(key, L"Calls", Read(key, L"Calls") + 1);
    Write(key, L"PSPath", request->psPath);
    Write(key, L"PDFPath", request->pdfPath);
    Write(key, L"Profile", request->profile);
    Write(key, L"HasReserved", request->reserved1 != 0 || request->reserved2 != 0 ? 1 : 0);
    Write(key, L"HasCom", IsComInitialised() ? 1 : 0);
    if (Read(key, MakesPdfValue))
        MakePdf(*request);
    const DWORD throws = Read(key, L"Throws");
    const auto result = static_cast<std::int32_t>(Read(key, L"Result"));
    RegCloseKey(key);
    if (throws)
        throw std::runtime_error("the bridge broke down");
    return result;
}
