#pragma GCC system_header // for include_next
#include_next <wchar.h>

// Of Microsoft's runtime: the wide file functions that it declares in this header.

#ifndef PLATFORM_WIN32_WCHAR_H
#    define PLATFORM_WIN32_WCHAR_H

#    ifdef __cplusplus

extern "C" {

struct __stat64 {
    long long st_size;
};

/// Fills `status` for the file at `path`; answers 0, or -1 with errno set.
int _wstat64(const wchar_t* path, struct __stat64* status);

/// Splits a path into drive, folder, name and extension (with its dot); both kinds of slash count.
/// Each part may be null, and holds at least _MAX_DRIVE, _MAX_DIR, _MAX_FNAME or _MAX_EXT
/// characters.
void _wsplitpath(const wchar_t* path, wchar_t* drive, wchar_t* dir, wchar_t* name,
                 wchar_t* extension);
}

#        define _MAX_DRIVE 3
#        define _MAX_DIR 256
#        define _MAX_FNAME 256
#        define _MAX_EXT 256

#    endif
#endif
