#include "platform/win32/com/ClassObjects.h"

#include "platform/win32/base/LogSink.h"
#include "platform/win32/com/Apartment.h"

#include <algorithm>
#include <map>
#include <mutex>

namespace {

struct Registration {
    CLSID clsid;
    IUnknown* object; // with a reference of ours
};

std::mutex g_mutex;
std::map<DWORD, Registration> g_registrations; // by cookie
DWORD g_lastCookie = 0;

} // namespace

namespace win32 {

bool FindRegisteredClassObject(REFCLSID clsid, IUnknown** object) {
    const std::lock_guard lock(g_mutex);
    const auto found = std::find_if(g_registrations.begin(), g_registrations.end(),
                                    [&](const auto& entry) { return entry.second.clsid == clsid; });
    if (found == g_registrations.end())
        return false;
    *object = found->second.object;
    (*object)->AddRef();
    return true;
}

} // namespace win32

HRESULT WINAPI CoRegisterClassObject(REFCLSID clsid, LPUNKNOWN object, DWORD context, DWORD flags,
                                     LPDWORD cookie) {
    if (!object || !cookie)
        return E_INVALIDARG;
    if (!win32::IsComInitialized())
        return CO_E_NOTINITIALIZED;
    if (flags != REGCLS_MULTIPLEUSE || context != CLSCTX_INPROC_SERVER) {
        win32::Log("CoRegisterClassObject: such flags or contexts are not supported");
        return E_INVALIDARG;
    }
    object->AddRef();
    const std::lock_guard lock(g_mutex);
    *cookie = ++g_lastCookie;
    g_registrations[*cookie] = {clsid, object};
    return S_OK;
}

HRESULT WINAPI CoRevokeClassObject(DWORD cookie) {
    if (!win32::IsComInitialized())
        return CO_E_NOTINITIALIZED;
    std::unique_lock lock(g_mutex);
    const auto entry = g_registrations.extract(cookie);
    lock.unlock(); // a class object may well call COM when it goes
    if (!entry)
        return E_INVALIDARG;
    entry.mapped().object->Release();
    return S_OK;
}
