#pragma once

// The basic types of the Windows API. Sizes are those of 64-bit Windows (a LONG has 32 bits), but
// for WCHAR, which is the compiler's wchar_t and so has 4 bytes here.

#include <cstddef>
#include <cstdint>

#define WINAPI
#define STDMETHODCALLTYPE
#define EXTERN_C extern "C"

#define FALSE 0
#define TRUE 1
#define MAX_PATH 260

using BOOL = int;
using BYTE = std::uint8_t;
using WCHAR = wchar_t;
using SHORT = std::int16_t;
using USHORT = std::uint16_t;
using WORD = std::uint16_t;
using UINT = unsigned int;
using LONG = std::int32_t;
using ULONG = std::uint32_t;
using DWORD = std::uint32_t;
using LONGLONG = std::int64_t;
using ULONGLONG = std::uint64_t;
using INT_PTR = std::intptr_t;
using ULONG_PTR = std::uintptr_t;
using SIZE_T = std::size_t;

using PVOID = void*;
using LPVOID = void*;
using LPCVOID = const void*;
using LPBYTE = BYTE*;
using LPDWORD = DWORD*;
using LPCSTR = const char*;
using LPWSTR = wchar_t*;
using LPCWSTR = const wchar_t*;
using LPTSTR = LPWSTR;
using LPCTSTR = LPCWSTR;

using HANDLE = void*;
using LPHANDLE = HANDLE*;

// NOLINTBEGIN(bugprone-macro-parentheses): the arguments are names
#define DECLARE_HANDLE(name)                                                                       \
    struct name##__;                                                                               \
    using name = name##__*
// NOLINTEND(bugprone-macro-parentheses)

DECLARE_HANDLE(HINSTANCE);
DECLARE_HANDLE(HKEY);
using HMODULE = HINSTANCE;
using PHKEY = HKEY*;

using FARPROC = INT_PTR (*)();

/// A handle whose value Windows fixes.
template <typename Handle>
Handle FixedHandle(INT_PTR value) {
    return reinterpret_cast<Handle>(value); // NOLINT(performance-no-int-to-ptr)
}

#define INVALID_HANDLE_VALUE (FixedHandle<HANDLE>(-1))

union LARGE_INTEGER {
    LONGLONG QuadPart;
};
using PLARGE_INTEGER = LARGE_INTEGER*;

union ULARGE_INTEGER {
    ULONGLONG QuadPart;
};

struct SECURITY_ATTRIBUTES; // nothing in this system has any
using LPSECURITY_ATTRIBUTES = SECURITY_ATTRIBUTES*;
using PSECURITY_DESCRIPTOR = PVOID;

// Access rights.
#define GENERIC_READ 0x80000000U
#define GENERIC_WRITE 0x40000000U
