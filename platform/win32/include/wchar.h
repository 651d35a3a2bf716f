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

/// Takes the extension of a path, with its dot; both kinds of slash count.
/// @param drive must be null, like `dir` and `name`
/// @param extension receives at most _MAX_EXT characters; empty when it is longer
void _wsplitpath(const wchar_t* path, wchar_t* drive, wchar_t* dir, wchar_t* name,
                 wchar_t* extension);
}

#        define _MAX_EXT 256

#    endif
#endif
