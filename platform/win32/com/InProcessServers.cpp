#include "platform/win32/com/InProcessServers.h"

#include "platform/win32/base/LogSink.h"
#include "platform/win32/com/ClassRegistry.h"
#include "platform/win32/text/Utf8.h"

#include <windows.h>

#include <map>
#include <memory>
#include <mutex>

namespace {

struct Server {
    HMODULE module;
    decltype(&DllGetClassObject) getClassObject;
    decltype(&DllCanUnloadNow) canUnloadNow; // null when not exported
};

std::mutex g_mutex;
std::map<std::wstring, std::shared_ptr<const Server>> g_servers; // by path

template <typename Function>
Function Export(HMODULE module, const char* name) {
    return reinterpret_cast<Function>(reinterpret_cast<void*>(GetProcAddress(module, name)));
}

/// Loads the server at `path`, or finds it loaded. Whoever holds the answer keeps it from being
/// unloaded.
HRESULT FindServer(const std::wstring& path, std::shared_ptr<const Server>& server) {
    const std::lock_guard lock(g_mutex);
    if (const auto found = g_servers.find(path); found != g_servers.end()) {
        server = found->second;
        return S_OK;
    }
    const HMODULE module = LoadLibraryW(path.c_str());
    if (!module)
        return CO_E_DLLNOTFOUND;
    const auto getClassObject = Export<decltype(&DllGetClassObject)>(module, "DllGetClassObject");
    if (!getClassObject) {
        FreeLibrary(module);
        return CO_E_ERRORINDLL;
    }
    const auto canUnloadNow = Export<decltype(&DllCanUnloadNow)>(module, "DllCanUnloadNow");
    server = std::make_shared<const Server>(Server{module, getClassObject, canUnloadNow});
    g_servers.emplace(path, server);
    return S_OK;
}

} // namespace

namespace win32 {

HRESULT GetInProcessClassObject(REFCLSID clsid, REFIID iid, void** object) {
    wchar_t id[39];
    StringFromGUID2(clsid, id, 39);
    const std::optional<std::wstring> path =
        ReadClassesText(L"CLSID\\" + std::wstring(id) + L"\\InprocServer32");
    if (!path || path->empty())
        return REGDB_E_CLASSNOTREG;
    std::shared_ptr<const Server> server;
    const HRESULT found = FindServer(*path, server);
    if (FAILED(found)) {
        Log("COM: cannot use the in-process server " + ToReadableUtf8(*path));
        return found;
    }
    return server->getClassObject(clsid, iid, object);
}

void UnloadIdleServers() {
    const std::lock_guard lock(g_mutex);
    for (auto next = g_servers.begin(); next != g_servers.end();) {
        const auto current = next++;
        const Server& server = *current->second;
        const bool inUse = current->second.use_count() > 1; // by a thread that came just now
        if (inUse || !server.canUnloadNow || server.canUnloadNow() != S_OK)
            continue;
        FreeLibrary(server.module);
        g_servers.erase(current);
    }
}

} // namespace win32
