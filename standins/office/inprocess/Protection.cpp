#include "standins/office/inprocess/Protection.h"

#include <ole2.h>
#include <windows.h>

#include <array>
#include <cstdint>
#include <vector>

namespace standins {

namespace {

/// A stream of a compound file.
class Stream {
public:
    Stream(IStorage* storage, LPCOLESTR name) {
        if (FAILED(
                storage->OpenStream(name, nullptr, STGM_READ | STGM_SHARE_EXCLUSIVE, 0, &m_stream)))
            m_stream = nullptr;
    }
    ~Stream() {
        if (m_stream)
            m_stream->Release();
    }
    Stream(const Stream&) = delete;
    Stream& operator=(const Stream&) = delete;

    bool IsOpen() const { return m_stream != nullptr; }

    bool Read(void* buffer, ULONG size) {
        ULONG read = 0;
        return m_stream && SUCCEEDED(m_stream->Read(buffer, size, &read)) && read == size;
    }
    bool Skip(LONGLONG distance) {
        LARGE_INTEGER offset;
        offset.QuadPart = distance;
        return m_stream && SUCCEEDED(m_stream->Seek(offset, STREAM_SEEK_CUR, nullptr));
    }
    /// The next little-endian number.
    template <typename Number>
    bool Read(Number& number) {
        std::array<BYTE, sizeof(Number)> bytes{};
        if (!Read(bytes.data(), static_cast<ULONG>(bytes.size())))
            return false;
        number = 0;
        for (std::size_t i = bytes.size(); i > 0; --i)
            number = static_cast<Number>((number << 8U) | bytes[i - 1]);
        return true;
    }

private:
    IStream* m_stream = nullptr;
};

bool IsEncryptedPackage(IStorage* storage) {
    return Stream(storage, L"EncryptedPackage").IsOpen();
}

/// Word: a flag at the start of the document.
bool IsEncryptedWord(IStorage* storage) {
    constexpr LONGLONG FlagsOffset = 10;
    constexpr std::uint16_t Encrypted = 0x0100;
    Stream document(storage, L"WordDocument");
    std::uint16_t flags = 0;
    return document.Skip(FlagsOffset) && document.Read(flags) && (flags & Encrypted) != 0;
}

/// Excel: a record near the start of the workbook, in front of all that is encrypted.
bool IsEncryptedExcel(IStorage* storage, LPCOLESTR name) {
    constexpr std::uint16_t EndOfSubstream = 0x000A;
    constexpr std::uint16_t FilePass = 0x002F;
    constexpr int MostRecords = 1000;
    Stream workbook(storage, name);
    for (int i = 0; i < MostRecords; ++i) {
        std::uint16_t record = 0;
        std::uint16_t size = 0;
        if (!workbook.Read(record) || !workbook.Read(size) || record == EndOfSubstream)
            return false;
        if (record == FilePass)
            return true;
        if (!workbook.Skip(size))
            return false;
    }
    return false;
}

/// PowerPoint: a token that says which kind of document the current one is.
bool IsEncryptedPowerPoint(IStorage* storage) {
    constexpr LONGLONG TokenOffset = 12;
    constexpr std::uint32_t Encrypted = 0xF3D1C4DF;
    Stream user(storage, L"Current User");
    std::uint32_t token = 0;
    return user.Skip(TokenOffset) && user.Read(token) && token == Encrypted;
}

} // namespace

bool IsPasswordProtected(const std::wstring& path) {
    IStorage* storage = nullptr;
    if (FAILED(StgOpenStorage(path.c_str(), nullptr, STGM_READ | STGM_SHARE_DENY_WRITE, nullptr, 0,
                              &storage)))
        return false;
    const bool isProtected = IsEncryptedPackage(storage) || IsEncryptedWord(storage) ||
                             IsEncryptedExcel(storage, L"Workbook") ||
                             IsEncryptedExcel(storage, L"Book") || IsEncryptedPowerPoint(storage);
    storage->Release();
    return isProtected;
}

} // namespace standins
