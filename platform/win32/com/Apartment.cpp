#include "platform/win32/com/Apartment.h"

#include "platform/win32/com/InProcessServers.h"

#include <atomic>

namespace {

thread_local unsigned t_initialisations = 0;
std::atomic<unsigned> g_threads = 0; // that have entered an apartment

} // namespace

namespace win32 {

bool IsComInitialized() {
    return t_initialisations > 0;
}

} // namespace win32

HRESULT WINAPI CoInitialize(LPVOID reserved) {
    if (reserved)
        return E_INVALIDARG;
    if (t_initialisations++ > 0)
        return S_FALSE;
    ++g_threads;
    return S_OK;
}

void WINAPI CoUninitialize() {
    if (t_initialisations == 0)
        return;
    // While the last objects go, COM is still there: they may have to release others.
    if (t_initialisations == 1 && --g_threads == 0)
        win32::UnloadIdleServers();
    --t_initialisations;
}
