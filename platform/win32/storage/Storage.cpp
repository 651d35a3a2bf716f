#include "platform/com/ComObject.h"
#include "platform/win32/base/LogSink.h"
#include "platform/win32/storage/Document.h"
#include "platform/win32/text/Utf8.h"

#include <cwchar>

using win32::Document;
using win32::GsfInputPointer;

namespace {

constexpr std::size_t LongestName = 31;

class Stream final : public ComObject<IStream> {
public:
    Stream(std::shared_ptr<Document> document, GsfInputPointer input, std::wstring key)
        : ComObject(IID_IStream), m_document(std::move(document)), m_input(std::move(input)),
          m_key(std::move(key)) {}

    HRESULT STDMETHODCALLTYPE Read(void* buffer, ULONG size, ULONG* read) override {
        if (!buffer)
            return STG_E_INVALIDPOINTER;
        ULONG count = 0;
        const HRESULT result = m_document->Read(m_input.get(), m_position, buffer, size, count);
        m_position += count;
        if (read)
            *read = count;
        return result;
    }

    HRESULT STDMETHODCALLTYPE Seek(LARGE_INTEGER distance, DWORD origin,
                                   ULARGE_INTEGER* newPosition) override {
        std::uint64_t length = 0;
        const HRESULT known = m_document->GetLength(m_input.get(), length);
        if (FAILED(known))
            return known;
        std::uint64_t start = 0;
        if (origin == STREAM_SEEK_CUR)
            start = m_position;
        else if (origin == STREAM_SEEK_END)
            start = length;
        else if (origin != STREAM_SEEK_SET)
            return STG_E_INVALIDFUNCTION;
        const std::uint64_t position = start + static_cast<std::uint64_t>(distance.QuadPart);
        const bool isBeforeStart = distance.QuadPart < 0 && position > start;
        const bool isBeyondReach = distance.QuadPart > 0 && position < start;
        if (isBeforeStart || isBeyondReach)
            return STG_E_INVALIDFUNCTION;
        m_position = position;
        if (newPosition)
            newPosition->QuadPart = position;
        return S_OK;
    }

private:
    ~Stream() override { m_document->CloseStream(std::move(m_input), m_key); }

    std::shared_ptr<Document> m_document;
    GsfInputPointer m_input;
    std::wstring m_key;
    std::uint64_t m_position = 0;
};

class Storage final : public ComObject<IStorage> {
public:
    explicit Storage(std::shared_ptr<Document> document)
        : ComObject(IID_IStorage), m_document(std::move(document)) {}

    HRESULT STDMETHODCALLTYPE OpenStream(const OLECHAR* name, void* reserved1, DWORD mode,
                                         DWORD reserved2, IStream** stream) override {
        if (!stream)
            return STG_E_INVALIDPOINTER;
        *stream = nullptr;
        if (!name || std::wcslen(name) > LongestName)
            return STG_E_INVALIDNAME;
        if (reserved1 || reserved2 != 0)
            return STG_E_INVALIDPARAMETER;
        if (mode != (STGM_READ | STGM_SHARE_EXCLUSIVE))
            return STG_E_INVALIDFLAG;
        GsfInputPointer input;
        std::wstring key;
        const HRESULT opened = m_document->OpenStream(name, input, key);
        if (SUCCEEDED(opened))
            *stream = new Stream(m_document, std::move(input), std::move(key));
        return opened;
    }

private:
    ~Storage() override { m_document->Revert(); }

    std::shared_ptr<Document> m_document;
};

HRESULT ToStorageError(DWORD error) {
    switch (error) {
    case ERROR_FILE_NOT_FOUND:
        return STG_E_FILENOTFOUND;
    case ERROR_PATH_NOT_FOUND:
        return STG_E_PATHNOTFOUND;
    case ERROR_TOO_MANY_OPEN_FILES:
        return STG_E_TOOMANYOPENFILES;
    case ERROR_ACCESS_DENIED:
        return STG_E_ACCESSDENIED;
    case ERROR_SHARING_VIOLATION:
        return STG_E_SHAREVIOLATION;
    case ERROR_INVALID_NAME:
    case ERROR_FILENAME_EXCED_RANGE:
        return STG_E_INVALIDNAME;
    default:
        return HRESULT_FROM_WIN32(error);
    }
}

} // namespace

HRESULT WINAPI StgOpenStorage(const WCHAR* fileName, IStorage* priority, DWORD mode, SNB exclude,
                              DWORD reserved, IStorage** storage) {
    if (!storage)
        return STG_E_INVALIDPOINTER;
    *storage = nullptr;
    if (!fileName)
        return STG_E_INVALIDNAME;
    if (reserved != 0)
        return STG_E_INVALIDPARAMETER;
    if (priority || exclude) {
        win32::Log("StgOpenStorage: priority storages and exclusions are not supported");
        return STG_E_INVALIDPARAMETER;
    }
    if (mode != (STGM_READ | STGM_SHARE_DENY_WRITE)) {
        win32::Log("StgOpenStorage: storages are opened for reading, beside others that read");
        return STG_E_INVALIDFLAG;
    }
    std::shared_ptr<win32::OpenFile> file;
    const win32::OpenRequest request{GENERIC_READ, FILE_SHARE_READ, OPEN_EXISTING};
    const DWORD error = win32::OpenFile::Open(fileName, request, file);
    if (error != ERROR_SUCCESS)
        return ToStorageError(error);
    auto document = std::make_shared<Document>(std::move(file), win32::ToReadableUtf8(fileName));
    const HRESULT loaded = document->Load();
    if (SUCCEEDED(loaded))
        *storage = new Storage(std::move(document));
    return loaded;
}
