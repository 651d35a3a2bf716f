#include "office/AutomationScope.h"

#include <afxwin.h>
#include <objbase.h>

#include <cstdio>

bool InitializeMfcAndCom() {
    if (!AfxWinInit(GetModuleHandleW(nullptr), nullptr, GetCommandLineW(), 0)) {
        std::fputs("Fatal Error: MFC initialization failed\n", stdout);
        return false;
    }
    // The answer does not matter: the thread may be initialised already, and each call is owed
    // one CoUninitialize all the same.
    CoInitialize(nullptr);
    return true;
}

AutomationScope::AutomationScope() : m_comInitialised(InitializeMfcAndCom()) {}

AutomationScope::~AutomationScope() {
    if (m_comInitialised)
        CoUninitialize();
}
