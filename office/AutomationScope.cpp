#include "office/AutomationScope.h"

#include "common/CatchAll.h"

#include <afxwin.h>
#include <objbase.h>

#include <cstdio>

bool InitializeMfcAndCom() {
    const bool isMfcInitialised = CatchAll(false, [] {
        return AfxWinInit(GetModuleHandleW(nullptr), nullptr, GetCommandLineW(), 0) != FALSE;
    });
    if (!isMfcInitialised) {
        // In narrow characters: the stream is the host's, and once it has been written to in wide
        // ones it takes no others.
        std::fputs("Fatal Error: MFC initialization failed\n", stdout);
        return false;
    }
    // Whether the thread was initialised already does not matter: each call is owed one
    // CoUninitialize. One that fails with RPC_E_CHANGED_MODE is owed none, and the one it gets all
    // the same is at the cost of its caller; no host calls from COM's multithreaded apartment.
    CoInitialize(nullptr);
    return true;
}

AutomationScope::AutomationScope() : m_comInitialised(InitializeMfcAndCom()) {}

AutomationScope::~AutomationScope() {
    if (m_comInitialised)
        CoUninitialize();
}
