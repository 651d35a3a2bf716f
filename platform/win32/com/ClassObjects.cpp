#include "platform/win32/com/ClassObjects.h"

#include "platform/win32/com/Apartment.h"
#include "platform/win32/log/LogSink.h"

#include <algorithm>
#include <list>
#include <mutex>

namespace {

struct Registration {
    DWORD cookie;
    CLSID clsid;
    IUnknown* object; // with a reference of ours
    DWORD context;
    bool singleUse;
    std::thread::id apartment;
};

std::mutex g_mutex;
std::list<Registration> g_registrations;
DWORD g_lastCookie = 0;

/// Takes the registrations that `isMeant` names off the list. Their references are let go outside
/// the lock: a class object may well call COM when it goes.
template <typename Predicate>
std::size_t Revoke(Predicate isMeant) {
    std::list<Registration> revoked;
    {
        const std::lock_guard lock(g_mutex);
        for (auto next = g_registrations.begin(); next != g_registrations.end();) {
            const auto current = next++;
            if (isMeant(*current))
                revoked.splice(revoked.end(), g_registrations, current);
        }
    }
    for (const Registration& registration : revoked)
        registration.object->Release();
    return revoked.size();
}

} // namespace

namespace win32 {

bool FindRegisteredClassObject(REFCLSID clsid, DWORD context, IUnknown** object) {
    const std::lock_guard lock(g_mutex);
    const auto found = std::find_if(
        g_registrations.begin(), g_registrations.end(), [&](const Registration& registration) {
            return registration.clsid == clsid && (registration.context & context) != 0;
        });
    if (found == g_registrations.end())
        return false;
    *object = found->object;
    if (found->singleUse)
        g_registrations.erase(found); // its reference is the caller's now
    else
        found->object->AddRef();
    return true;
}

void RevokeClassObjectsOf(std::thread::id apartment) {
    Revoke([=](const Registration& registration) { return registration.apartment == apartment; });
}

} // namespace win32

HRESULT WINAPI CoRegisterClassObject(REFCLSID clsid, LPUNKNOWN object, DWORD context, DWORD flags,
                                     LPDWORD cookie) {
    if (!object || !cookie)
        return E_INVALIDARG;
    if (!win32::IsComInitialized())
        return CO_E_NOTINITIALIZED;
    if ((flags != REGCLS_SINGLEUSE && flags != REGCLS_MULTIPLEUSE) ||
        (context & ~(CLSCTX_INPROC_SERVER | CLSCTX_LOCAL_SERVER)) != 0 || context == 0) {
        win32::Log("CoRegisterClassObject: such flags or contexts are not supported");
        return E_INVALIDARG;
    }
    if (flags == REGCLS_SINGLEUSE && context == CLSCTX_INPROC_SERVER)
        return E_INVALIDARG; // its own process can always come back
    // A server for many uses serves its own process as well.
    if (flags == REGCLS_MULTIPLEUSE)
        context |= CLSCTX_INPROC_SERVER;
    object->AddRef();
    const std::lock_guard lock(g_mutex);
    *cookie = ++g_lastCookie;
    g_registrations.push_back(
        {*cookie, clsid, object, context, flags == REGCLS_SINGLEUSE, win32::CurrentApartment()});
    return S_OK;
}

HRESULT WINAPI CoRevokeClassObject(DWORD cookie) {
    if (!win32::IsComInitialized())
        return CO_E_NOTINITIALIZED;
    const std::size_t revoked =
        Revoke([=](const Registration& registration) { return registration.cookie == cookie; });
    return revoked > 0 ? S_OK : E_INVALIDARG;
}
