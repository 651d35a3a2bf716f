#pragma once

#include <afxwin.h>

/// Puts the filter's own preferences for the printer "Acrobat Distiller" in the place of the
/// user's, and the user's back when it is destroyed, whatever happened in between. The value is one
/// per Windows user and has that name whichever printer is printed on.
class DistillerDevModeGuard {
public:
    DistillerDevModeGuard();
    ~DistillerDevModeGuard();
    DistillerDevModeGuard(const DistillerDevModeGuard&) = delete;
    DistillerDevModeGuard& operator=(const DistillerDevModeGuard&) = delete;

private:
    void Save(HKEY key);

    bool m_armed = false;
    bool m_hadValue = false;
    DWORD m_savedType = REG_NONE;
    CByteArray m_saved;
};
