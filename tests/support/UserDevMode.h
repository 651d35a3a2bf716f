#pragma once

#include <windows.h>

#include <vector>

/// The user's preferences for the printer "Acrobat Distiller", as the registry has them; absent at
/// the beginning of a test and removed at its end.
class UserDevMode {
public:
    UserDevMode();
    ~UserDevMode();
    UserDevMode(const UserDevMode&) = delete;
    UserDevMode& operator=(const UserDevMode&) = delete;

    void Set(DWORD type, const std::vector<BYTE>& bytes);
    bool Exists() const;
    DWORD Type() const;
    std::vector<BYTE> Bytes() const;
};
