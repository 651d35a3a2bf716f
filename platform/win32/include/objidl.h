#pragma once

// Structured storage, for reading only.

#include <objbase.h>

#define STGM_READ 0x00000000U
#define STGM_SHARE_EXCLUSIVE 0x00000010U
#define STGM_SHARE_DENY_WRITE 0x00000020U

#define STREAM_SEEK_SET 0U
#define STREAM_SEEK_CUR 1U
#define STREAM_SEEK_END 2U

using SNB = LPOLESTR*;

struct IStream : IUnknown {
    virtual HRESULT STDMETHODCALLTYPE Read(void* buffer, ULONG size, ULONG* read) = 0;
    virtual HRESULT STDMETHODCALLTYPE Seek(LARGE_INTEGER distance, DWORD origin,
                                           ULARGE_INTEGER* newPosition) = 0;

protected:
    ~IStream() = default;
};

struct IStorage : IUnknown {
    virtual HRESULT STDMETHODCALLTYPE OpenStream(const OLECHAR* name, void* reserved1, DWORD mode,
                                                 DWORD reserved2, IStream** stream) = 0;

protected:
    ~IStorage() = default;
};

extern "C" {

HRESULT WINAPI StgOpenStorage(const WCHAR* fileName, IStorage* priority, DWORD mode, SNB exclude,
                              DWORD reserved, IStorage** storage);

extern const IID IID_IStream;
extern const IID IID_IStorage;

} // extern "C"
