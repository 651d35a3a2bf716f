#include "standins/office/inprocess/Registration.h"

#include "standins/inprocess/HostRecord.h"
#include "standins/inprocess/Paths.h"
#include "standins/inprocess/RegistryKey.h"
#include "standins/office/inprocess/Applications.h"
#include "standins/office/inprocess/KeptEngine.h"
#include "standins/office/inprocess/LibreOffice.h"
#include "standins/office/inprocess/Settings.h"
#include "standins/shared/Text.h"

namespace standins {

namespace {

std::wstring ClassId(const Application& application) {
    constexpr int Length = 39; // braces and the terminating zero included
    wchar_t text[Length];
    StringFromGUID2(application.clsid, text, Length);
    return text;
}

std::wstring VersionedProgId(const Application& application) {
    return std::wstring(application.progId) + L"." + OfficeVersion;
}

bool SetDefault(const std::wstring& key, const std::wstring& text) {
    return RegistryKey::Create(HKEY_CLASSES_ROOT, key).SetText(nullptr, text);
}

bool Register(const Application& application) {
    const std::wstring progId = application.progId;
    const std::wstring versioned = VersionedProgId(application);
    const std::wstring clsid = ClassId(application);
    const std::wstring server = L"CLSID\\" + clsid + L"\\InprocServer32";
    return SetDefault(progId, application.title) && SetDefault(progId + L"\\CLSID", clsid) &&
           SetDefault(progId + L"\\CurVer", versioned) &&
           SetDefault(versioned, application.title) && SetDefault(versioned + L"\\CLSID", clsid) &&
           SetDefault(L"CLSID\\" + clsid, application.title) &&
           SetDefault(L"CLSID\\" + clsid + L"\\ProgID", versioned) &&
           SetDefault(server, ModulePath()) &&
           RegistryKey::Create(HKEY_CLASSES_ROOT, server).SetText(L"ThreadingModel", L"Apartment");
}

void RemoveIfOurs(const std::wstring& progId, const std::wstring& clsid) {
    const auto entered = RegistryKey::Open(HKEY_CLASSES_ROOT, progId + L"\\CLSID").Text(nullptr);
    if (entered == clsid)
        RegDeleteTreeW(HKEY_CLASSES_ROOT, progId.c_str());
}

void Unregister(const Application& application) {
    const std::wstring clsid = ClassId(application);
    RemoveIfOurs(application.progId, clsid);
    RemoveIfOurs(VersionedProgId(application), clsid);
    RegDeleteTreeW(HKEY_CLASSES_ROOT, (L"CLSID\\" + clsid).c_str());
}

bool EnterFacts(const LibreOffice& libreOffice) {
    const RegistryKey key = RegistryKey::Create(HKEY_LOCAL_MACHINE, SettingsKey);
    return key.SetText(EngineValue, FromUtf8(libreOffice.name)) &&
           key.SetText(EnginePathValue, FromUtf8(libreOffice.program)) &&
           (!ReadExamine() ||
            key.SetText(KeepingObstacleValue, WhyEngineCannotBeKept(libreOffice.program)));
}

void RemoveFacts() {
    if (!RegistryKey::Open(HKEY_LOCAL_MACHINE, SettingsKey).IsOpen())
        return;
    const RegistryKey key = RegistryKey::Create(HKEY_LOCAL_MACHINE, SettingsKey);
    key.Delete(EngineValue);
    key.Delete(EnginePathValue);
    key.Delete(KeepingObstacleValue);
}

} // namespace

HRESULT RegisterApplications() {
    UnregisterApplications();
    EnterIsolation();
    const std::optional<LibreOffice> libreOffice = FindLibreOffice();
    if (!libreOffice)
        return S_OK;
    bool isEntered = EnterFacts(*libreOffice);
    for (const Application& application : Applications()) {
        if (libreOffice->HasAll(application.libraries))
            isEntered = Register(application) && isEntered;
    }
    return isEntered ? S_OK : SELFREG_E_CLASS;
}

HRESULT UnregisterApplications() {
    EndKeptEngine();
    for (const Application& application : Applications())
        Unregister(application);
    RemoveFacts();
    return S_OK;
}

} // namespace standins
