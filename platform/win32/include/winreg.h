#pragma once

// The registry: one per process, empty at start, in memory only. Values are typed bytes; texts
// are UTF-16LE in them, with their terminating zero, as on Windows.

#include <windef.h>
#include <winerror.h>

using REGSAM = DWORD;
using LSTATUS = LONG;

#define HKEY_CLASSES_ROOT (FixedHandle<HKEY>(0x80000000))
#define HKEY_CURRENT_USER (FixedHandle<HKEY>(0x80000001))
#define HKEY_LOCAL_MACHINE (FixedHandle<HKEY>(0x80000002))

#define KEY_QUERY_VALUE 0x0001U
#define KEY_SET_VALUE 0x0002U
#define KEY_READ 0x20019U
#define KEY_WRITE 0x20006U

#define REG_OPTION_NON_VOLATILE 0x00000000U

#define REG_NONE 0U
#define REG_SZ 1U
#define REG_EXPAND_SZ 2U
#define REG_BINARY 3U
#define REG_DWORD 4U

extern "C" {

LSTATUS WINAPI RegOpenKeyExW(HKEY key, LPCWSTR subKey, DWORD options, REGSAM access, PHKEY result);
LSTATUS WINAPI RegCreateKeyExW(HKEY key, LPCWSTR subKey, DWORD reserved, LPWSTR keyClass,
                               DWORD options, REGSAM access,
                               LPSECURITY_ATTRIBUTES securityAttributes, PHKEY result,
                               LPDWORD disposition);
LSTATUS WINAPI RegCloseKey(HKEY key);
LSTATUS WINAPI RegQueryValueExW(HKEY key, LPCWSTR valueName, LPDWORD reserved, LPDWORD type,
                                LPBYTE data, LPDWORD dataSize);
LSTATUS WINAPI RegSetValueExW(HKEY key, LPCWSTR valueName, DWORD reserved, DWORD type,
                              const BYTE* data, DWORD dataSize);
LSTATUS WINAPI RegDeleteValueW(HKEY key, LPCWSTR valueName);
LSTATUS WINAPI RegDeleteTreeW(HKEY key, LPCWSTR subKey);

} // extern "C"
