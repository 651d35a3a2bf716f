#pragma once

// Files, modules, the process's command line, waiting, the error of the last call.

#include <windef.h>
#include <winerror.h>

extern "C" {

// The error of the last call, one per thread.
DWORD WINAPI GetLastError();
void WINAPI SetLastError(DWORD error);

// Files.
HANDLE WINAPI CreateFileW(LPCWSTR fileName, DWORD desiredAccess, DWORD shareMode,
                          LPSECURITY_ATTRIBUTES securityAttributes, DWORD creationDisposition,
                          DWORD flagsAndAttributes, HANDLE templateFile);
BOOL WINAPI ReadFile(HANDLE file, LPVOID buffer, DWORD bytesToRead, LPDWORD bytesRead,
                     LPVOID overlapped);
BOOL WINAPI WriteFile(HANDLE file, LPCVOID buffer, DWORD bytesToWrite, LPDWORD bytesWritten,
                      LPVOID overlapped);
BOOL WINAPI SetFilePointerEx(HANDLE file, LARGE_INTEGER distance, PLARGE_INTEGER newPosition,
                             DWORD moveMethod);
BOOL WINAPI SetEndOfFile(HANDLE file);
BOOL WINAPI GetFileSizeEx(HANDLE file, PLARGE_INTEGER size);
BOOL WINAPI CloseHandle(HANDLE object);

// Modules. They are named by their paths; the ending does not matter to the loader.
HMODULE WINAPI GetModuleHandleW(LPCWSTR moduleName);
DWORD WINAPI GetModuleFileNameW(HMODULE module, LPWSTR fileName, DWORD size);
BOOL WINAPI GetModuleHandleExW(DWORD flags, LPCWSTR moduleNameOrAddress, HMODULE* module);
HMODULE WINAPI LoadLibraryW(LPCWSTR fileName);
FARPROC WINAPI GetProcAddress(HMODULE module, LPCSTR procName);
BOOL WINAPI FreeLibrary(HMODULE module);

// The process's heap. It gives null, and no error code, when there is no memory left.
HANDLE WINAPI GetProcessHeap();
LPVOID WINAPI HeapAlloc(HANDLE heap, DWORD flags, SIZE_T bytes);
BOOL WINAPI HeapFree(HANDLE heap, DWORD flags, LPVOID block);

// The process.
LPWSTR WINAPI GetCommandLineW();
void WINAPI Sleep(DWORD milliseconds);
void WINAPI OutputDebugStringW(LPCWSTR text);

} // extern "C"

#define FILE_SHARE_READ 0x00000001U

#define CREATE_NEW 1
#define OPEN_EXISTING 3

#define FILE_ATTRIBUTE_NORMAL 0x00000080U

#define FILE_BEGIN 0
#define FILE_CURRENT 1
#define FILE_END 2

#define GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT 0x00000002U
#define GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS 0x00000004U
