#include "platform/win32/com/Apartment.h"

#include "platform/win32/com/ClassObjects.h"
#include "platform/win32/com/InProcessServers.h"
#include "platform/win32/log/LogSink.h"

#include <mutex>

namespace {

struct ThreadState {
    unsigned initialisations = 0;
    DWORD model = COINIT_APARTMENTTHREADED;
};

thread_local ThreadState t_thread;

std::mutex g_mutex;
unsigned g_threads = 0;              // that have entered an apartment
unsigned g_multithreadedThreads = 0; // of those, in the multithreaded one

bool IsMultithreadedApartmentThere() {
    const std::lock_guard lock(g_mutex);
    return g_multithreadedThreads > 0;
}

} // namespace

namespace win32 {

bool IsComInitialized() {
    return t_thread.initialisations > 0 || IsMultithreadedApartmentThere();
}

std::thread::id CurrentApartment() {
    const bool own = t_thread.initialisations > 0 && t_thread.model == COINIT_APARTMENTTHREADED;
    return own ? std::this_thread::get_id() : std::thread::id();
}

} // namespace win32

HRESULT WINAPI CoInitialize(LPVOID reserved) {
    return CoInitializeEx(reserved, COINIT_APARTMENTTHREADED);
}

HRESULT WINAPI CoInitializeEx(LPVOID reserved, DWORD model) {
    if (reserved)
        return E_INVALIDARG;
    if (model != COINIT_APARTMENTTHREADED && model != COINIT_MULTITHREADED) {
        win32::Log("CoInitializeEx: only the threading model can be chosen");
        return E_INVALIDARG;
    }
    if (t_thread.initialisations > 0) {
        if (t_thread.model != model)
            return RPC_E_CHANGED_MODE;
        ++t_thread.initialisations;
        return S_FALSE;
    }
    const std::lock_guard lock(g_mutex);
    t_thread = {1, model};
    ++g_threads;
    if (model == COINIT_MULTITHREADED)
        ++g_multithreadedThreads;
    return S_OK;
}

void WINAPI CoUninitialize() {
    if (t_thread.initialisations == 0)
        return;
    if (t_thread.initialisations > 1) {
        --t_thread.initialisations;
        return;
    }
    // While the last objects go, COM is still there: they may have to release others.
    bool lastOfApartment = true;
    if (t_thread.model == COINIT_MULTITHREADED) {
        const std::lock_guard lock(g_mutex);
        lastOfApartment = g_multithreadedThreads == 1;
    }
    if (lastOfApartment)
        win32::RevokeClassObjectsOf(win32::CurrentApartment());

    bool lastOfProcess = false;
    {
        const std::lock_guard lock(g_mutex);
        if (t_thread.model == COINIT_MULTITHREADED)
            --g_multithreadedThreads;
        lastOfProcess = --g_threads == 0;
    }
    if (lastOfProcess)
        win32::UnloadIdleServers();
    t_thread.initialisations = 0;
}
