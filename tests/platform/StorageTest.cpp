#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/Wine.h"

#include <ole2.h>
#include <windows.h>

#include <gtest/gtest.h>

#include <string>

namespace {

constexpr DWORD Shared = STGM_READ | STGM_SHARE_DENY_WRITE;
constexpr DWORD Alone = STGM_READ | STGM_SHARE_EXCLUSIVE;

template <typename Interface>
class Pointer {
public:
    Pointer() = default;
    Pointer(const Pointer&) = delete;
    Pointer& operator=(const Pointer&) = delete;
    ~Pointer() { Reset(); }
    void Reset() {
        if (m_object)
            m_object->Release();
        m_object = nullptr;
    }
    Interface** operator&() { return &m_object; } // NOLINT(google-runtime-operator)
    Interface* operator->() const { return m_object; }
    explicit operator bool() const { return m_object != nullptr; }

private:
    Interface* m_object = nullptr;
};

class Storages : public testing::Test {
protected:
    static HRESULT Open(const std::filesystem::path& path, Pointer<IStorage>& storage,
                        DWORD mode = Shared) {
        return StgOpenStorage(path.wstring().c_str(), nullptr, mode, nullptr, 0, &storage);
    }

    static HRESULT OpenError(const std::filesystem::path& path, DWORD mode = Shared) {
        Pointer<IStorage> storage;
        const HRESULT result = Open(path, storage, mode);
        EXPECT_EQ(SUCCEEDED(result), static_cast<bool>(storage));
        return result;
    }

    static HRESULT StreamError(const Pointer<IStorage>& storage, const wchar_t* name,
                               DWORD mode = Alone) {
        Pointer<IStream> stream;
        return storage->OpenStream(name, nullptr, mode, 0, &stream);
    }

    static std::string ReadAll(const Pointer<IStorage>& storage, const wchar_t* name) {
        Pointer<IStream> stream;
        EXPECT_EQ(S_OK, storage->OpenStream(name, nullptr, Alone, 0, &stream)) << name;
        std::string bytes(200000, '\0');
        ULONG count = 0;
        EXPECT_EQ(S_OK, stream->Read(bytes.data(), static_cast<ULONG>(bytes.size()), &count));
        bytes.resize(count);
        return bytes;
    }

    /// Opens a file made to do harm, and reads what it can. The codes do not matter, the end does.
    static void Withstand(const std::filesystem::path& path) {
        Pointer<IStorage> storage;
        if (FAILED(Open(path, storage)))
            return;
        for (const wchar_t* name : {L"WordDocument", L"Short", L"None"}) {
            Pointer<IStream> stream;
            if (FAILED(storage->OpenStream(name, nullptr, Alone, 0, &stream)))
                continue;
            std::string bytes(100000, '\0');
            ULONG count = 0;
            stream->Read(bytes.data(), static_cast<ULONG>(bytes.size()), &count);
            EXPECT_LE(count, bytes.size());
        }
    }

    static CompoundFile Document() {
        CompoundFile file;
        file.AddStream(u"WordDocument", std::string(5000, 'w') + "end");
        file.AddStream(u"Short", "few bytes");
        file.AddStream(u"Empty", "");
        file.AddStream(u"ObjectPool/_1/Contents", "inside");
        return file;
    }

    TemporaryFolder m_folder;
};

TEST_F(Storages, HoldStreams) {
    Pointer<IStorage> storage;
    ASSERT_EQ(S_OK, Open(m_folder.Write("a.doc", Document().Bytes()), storage));
    EXPECT_EQ(std::string(5000, 'w') + "end", ReadAll(storage, L"WordDocument"));
    EXPECT_EQ("few bytes", ReadAll(storage, L"Short"));
    EXPECT_EQ("few bytes", ReadAll(storage, L"sHORT"));
    EXPECT_EQ("", ReadAll(storage, L"Empty"));
    EXPECT_EQ(STG_E_FILENOTFOUND, StreamError(storage, L"ObjectPool")); // that is a storage
    EXPECT_EQ(STG_E_FILENOTFOUND, StreamError(storage, L"Contents"));   // that is deeper down
    EXPECT_EQ(STG_E_FILENOTFOUND, StreamError(storage, L"WordDocument2"));
}

TEST_F(Storages, AreReadToTheEndOfALargeFile) {
    CompoundFile file;
    std::string bytes(9 << 20, '\0'); // more than the header's share of the allocation table tells
    for (std::size_t i = 0; i < bytes.size(); ++i)
        bytes[i] = static_cast<char>(i * 31 >> 7);
    file.AddStream(u"Large", bytes);
    Pointer<IStorage> storage;
    ASSERT_EQ(S_OK, Open(m_folder.Write("large.doc", file.Bytes()), storage));
    Pointer<IStream> stream;
    ASSERT_EQ(S_OK, storage->OpenStream(L"Large", nullptr, Alone, 0, &stream));
    std::string read(bytes.size(), '\0');
    ULONG count = 0;
    ASSERT_EQ(S_OK, stream->Read(read.data(), static_cast<ULONG>(read.size()), &count));
    EXPECT_TRUE(count == bytes.size() && read == bytes);
}

TEST_F(Storages, StreamsAreReadFromTheirPosition) {
    Pointer<IStorage> storage;
    ASSERT_EQ(S_OK, Open(m_folder.Write("a.doc", Document().Bytes()), storage));
    Pointer<IStream> stream;
    ASSERT_EQ(S_OK, storage->OpenStream(L"WordDocument", nullptr, Alone, 0, &stream));
    LARGE_INTEGER distance{};
    ULARGE_INTEGER position{};
    distance.QuadPart = -4;
    ASSERT_EQ(S_OK, stream->Seek(distance, STREAM_SEEK_END, &position));
    EXPECT_EQ(4999U, position.QuadPart);
    char bytes[16] = {};
    ULONG count = 0;
    EXPECT_EQ(S_OK, stream->Read(bytes, 2, &count));
    EXPECT_EQ("we", std::string(bytes, count));
    EXPECT_EQ(S_OK, stream->Read(bytes, 16, &count));
    EXPECT_EQ("nd", std::string(bytes, count));
    stream->Read(bytes, 16, &count);
    EXPECT_EQ(0U, count);
    distance.QuadPart = -1;
    if (!RunsOnWine()) { // which goes there
        EXPECT_EQ(STG_E_INVALIDFUNCTION, stream->Seek(distance, STREAM_SEEK_SET, nullptr));
    }
    distance.QuadPart = 100000; // beyond the end there is nothing to read
    EXPECT_EQ(S_OK, stream->Seek(distance, STREAM_SEEK_CUR, &position));
    EXPECT_EQ(105003U, position.QuadPart);
    stream->Read(bytes, 16, &count);
    EXPECT_EQ(0U, count);
}

TEST_F(Storages, StreamsAreOpenedAloneAndForReading) {
    Pointer<IStorage> storage;
    ASSERT_EQ(S_OK, Open(m_folder.Write("a.doc", Document().Bytes()), storage));
    EXPECT_EQ(STG_E_INVALIDFLAG, StreamError(storage, L"Short", STGM_READ));
    EXPECT_EQ(STG_E_INVALIDFLAG, StreamError(storage, L"Short", Shared));
    EXPECT_EQ(RunsOnWine() ? STG_E_INVALIDFLAG : STG_E_ACCESSDENIED,
              StreamError(storage, L"Short", STGM_READWRITE | STGM_SHARE_EXCLUSIVE));
    EXPECT_EQ(RunsOnWine() ? E_INVALIDARG : STG_E_INVALIDNAME, StreamError(storage, nullptr));
    Pointer<IStream> first;
    ASSERT_EQ(S_OK, storage->OpenStream(L"Short", nullptr, Alone, 0, &first));
    EXPECT_EQ(STG_E_ACCESSDENIED, StreamError(storage, L"SHORT"));
    first.Reset();
    EXPECT_EQ(S_OK, StreamError(storage, L"SHORT"));
}

TEST_F(Storages, AStreamIsNothingWithoutItsStorage) {
    Pointer<IStorage> storage;
    ASSERT_EQ(S_OK, Open(m_folder.Write("a.doc", Document().Bytes()), storage));
    Pointer<IStream> stream;
    ASSERT_EQ(S_OK, storage->OpenStream(L"WordDocument", nullptr, Alone, 0, &stream));
    storage.Reset();
    char byte = 0;
    ULONG count = 0;
    EXPECT_EQ(STG_E_REVERTED, stream->Read(&byte, 1, &count));
}

TEST_F(Storages, TakePartInTheSharingOfFiles) {
    const auto path = m_folder.Write("a.doc", Document().Bytes());
    const auto openFile = [&](DWORD access, DWORD share) {
        return CreateFileW(path.wstring().c_str(), access, share, nullptr, OPEN_EXISTING,
                           FILE_ATTRIBUTE_NORMAL, nullptr);
    };
    {
        Pointer<IStorage> storage;
        ASSERT_EQ(S_OK, Open(path, storage));
        EXPECT_EQ(S_OK, OpenError(path));
        EXPECT_EQ(RunsOnWine() ? STG_E_LOCKVIOLATION : STG_E_SHAREVIOLATION,
                  OpenError(path, Alone));
        EXPECT_EQ(INVALID_HANDLE_VALUE, openFile(GENERIC_WRITE, FILE_SHARE_READ));
        EXPECT_EQ(DWORD{ERROR_SHARING_VIOLATION}, GetLastError());
    }
    HANDLE writer = openFile(GENERIC_WRITE, FILE_SHARE_READ | FILE_SHARE_WRITE);
    ASSERT_NE(INVALID_HANDLE_VALUE, writer);
    EXPECT_EQ(STG_E_SHAREVIOLATION, OpenError(path));
    CloseHandle(writer);
    EXPECT_EQ(S_OK, OpenError(path, Alone));
}

TEST_F(Storages, FailuresHaveTheirCodes) {
    EXPECT_EQ(STG_E_FILENOTFOUND, OpenError(m_folder / "none.doc"));
    EXPECT_EQ(STG_E_PATHNOTFOUND, OpenError(m_folder / "none" / "a.doc"));
    EXPECT_EQ(STG_E_ACCESSDENIED, OpenError(m_folder.Path()));
    for (const std::string& bytes :
         {std::string(), std::string("PK\3\4"), std::string(5000, '\x5A')})
        EXPECT_EQ(STG_E_FILEALREADYEXISTS, OpenError(m_folder.Write("other.doc", bytes)));
    const auto path = m_folder.Write("a.doc", Document().Bytes());
    EXPECT_EQ(STG_E_INVALIDFLAG, OpenError(path, STGM_READ)); // others might write
    Pointer<IStorage> storage;
    EXPECT_EQ(STG_E_INVALIDNAME, StgOpenStorage(nullptr, nullptr, Shared, nullptr, 0, &storage));
    EXPECT_EQ(STG_E_INVALIDPARAMETER,
              StgOpenStorage(path.wstring().c_str(), nullptr, Shared, nullptr, 1, &storage));
}

TEST_F(Storages, WithstandFilesMadeToDoHarm) {
    if (RunsOnWine())
        GTEST_SKIP() << "Wine follows a circle for ever";
    CompoundFile cyclicDirectory = Document();
    cyclicDirectory.MakeDirectoryCyclic();
    Withstand(m_folder.Write("directory.doc", cyclicDirectory.Bytes()));
    CompoundFile cyclicChains = Document();
    cyclicChains.MakeChainsCyclic();
    Withstand(m_folder.Write("chains.doc", cyclicChains.Bytes()));

    const std::string bytes = Document().Bytes();
    for (std::size_t size = 0; size < bytes.size(); size += 293)
        Withstand(m_folder.Write("cut.doc", bytes.substr(0, size)));

    // The sizes and sector numbers of the header, each claiming more than there is.
    for (std::size_t offset = 24; offset < 84; offset += 2)
        for (const char* claim : {"\xFF\xFF\xFF\x7F", "\xF0\xFF\xFF\xFF", "\x00\x00\x10\x00"}) {
            std::string claiming = bytes;
            claiming.replace(offset, 4, claim, 4);
            Withstand(m_folder.Write("claim.doc", claiming));
        }
}

TEST_F(Storages, DoNotBelieveInAnAllocationTableLargerThanTheFile) {
    if (RunsOnWine())
        GTEST_SKIP() << "Wine believes in it";
    CompoundFile file;
    file.AddStream(u"WordDocument", std::string(5000, '\0'));
    std::string bytes = file.Bytes();
    bytes.replace(44, 4, std::string("\x00\x00\x20\x00", 4)); // sectors of the table: two million
    bytes.replace(68, 4,
                  std::string(4, '\0')); // listed in a sector of zeros, which leads to itself
    const auto path = m_folder.Write("claim.doc", bytes);
    std::filesystem::resize_file(path, std::uintmax_t{2} << 30);
    EXPECT_EQ(STG_E_DOCFILECORRUPT, OpenError(path));
}

} // namespace
