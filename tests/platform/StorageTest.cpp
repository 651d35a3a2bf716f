#include "office/ComPointer.h"
#include "tests/platform/OpenPath.h"
#include "tests/support/CompoundFile.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/Wine.h"

#include <ole2.h>

#include <gtest/gtest.h>

#include <string>

namespace {

constexpr DWORD Shared = STGM_READ | STGM_SHARE_DENY_WRITE; // as storages are opened
constexpr DWORD Alone = STGM_READ | STGM_SHARE_EXCLUSIVE;   // as streams are

using Storage = ComPointer<IStorage>;
using Stream = ComPointer<IStream>;

HRESULT Open(const std::filesystem::path& path, Storage& storage, DWORD mode = Shared) {
    return StgOpenStorage(path.wstring().c_str(), nullptr, mode, nullptr, 0, storage.Receive());
}

HRESULT OpenError(const std::filesystem::path& path, DWORD mode = Shared) {
    Storage storage;
    const HRESULT result = Open(path, storage, mode);
    EXPECT_EQ(SUCCEEDED(result), static_cast<bool>(storage));
    return result;
}

HRESULT OpenStream(const Storage& storage, const wchar_t* name, Stream& stream,
                   DWORD mode = Alone) {
    return storage->OpenStream(name, nullptr, mode, 0, stream.Receive());
}

HRESULT StreamError(const Storage& storage, const wchar_t* name, DWORD mode = Alone) {
    Stream stream;
    return OpenStream(storage, name, stream, mode);
}

/// What a read of so many bytes gives.
std::string Read(const Stream& stream, ULONG size) {
    std::string bytes(size, '\0');
    ULONG count = 0;
    EXPECT_TRUE(SUCCEEDED(stream->Read(bytes.data(), size, &count)));
    bytes.resize(count);
    return bytes;
}

std::string ReadAll(const Storage& storage, const wchar_t* name) {
    Stream stream;
    EXPECT_EQ(S_OK, OpenStream(storage, name, stream)) << name;
    return stream ? Read(stream, 10 << 20) : std::string();
}

/// Opens a file made to do harm, and reads what it can. The codes do not matter, the end does.
void Withstand(const std::filesystem::path& path) {
    Storage storage;
    if (FAILED(Open(path, storage)))
        return;
    for (const wchar_t* name : {L"WordDocument", L"Short", L"None"}) {
        Stream stream;
        if (FAILED(OpenStream(storage, name, stream)))
            continue;
        std::string bytes(100000, '\0');
        ULONG count = 0;
        stream->Read(bytes.data(), static_cast<ULONG>(bytes.size()), &count);
        EXPECT_LE(count, bytes.size());
    }
}

class Storages : public testing::Test {
protected:
    Storages() {
        m_file.AddStream(u"WordDocument", m_words);
        m_file.AddStream(u"Short", "few bytes");
        m_file.AddStream(u"Empty", "");
        m_file.AddStream(u"ObjectPool/_1/Contents", "inside");
        m_path = m_folder.Write("a.doc", m_file.Bytes());
        EXPECT_EQ(S_OK, Open(m_path, m_storage));
    }

    TemporaryFolder m_folder;
    const std::string m_words = std::string(5000, 'w') + "end";
    CompoundFile m_file;
    std::filesystem::path m_path;
    Storage m_storage;
};

TEST_F(Storages, HoldStreams) {
    EXPECT_EQ(m_words, ReadAll(m_storage, L"WordDocument"));
    EXPECT_EQ("few bytes", ReadAll(m_storage, L"Short"));
    EXPECT_EQ("few bytes", ReadAll(m_storage, L"sHORT"));
    EXPECT_EQ("", ReadAll(m_storage, L"Empty"));
    EXPECT_EQ(STG_E_FILENOTFOUND, StreamError(m_storage, L"ObjectPool")); // that is a storage
    EXPECT_EQ(STG_E_FILENOTFOUND, StreamError(m_storage, L"Contents"));   // that is deeper down
    EXPECT_EQ(STG_E_FILENOTFOUND, StreamError(m_storage, L"WordDocument2"));
}

TEST_F(Storages, AreReadToTheEndOfALargeFile) {
    std::string bytes(9 << 20, '\0'); // more than the header's share of the allocation table tells
    for (std::size_t i = 0; i < bytes.size(); ++i)
        bytes[i] = static_cast<char>(i * 31 >> 7);
    m_file.AddStream(u"Large", bytes);
    ASSERT_EQ(S_OK, Open(m_folder.Write("large.doc", m_file.Bytes()), m_storage));
    EXPECT_TRUE(bytes == ReadAll(m_storage, L"Large"));
}

TEST_F(Storages, StreamsAreReadFromTheirPosition) {
    Stream stream;
    ASSERT_EQ(S_OK, OpenStream(m_storage, L"WordDocument", stream));
    LARGE_INTEGER distance{};
    ULARGE_INTEGER position{};
    EXPECT_EQ("ww", Read(stream, 2));
    distance.QuadPart = -3;
    ASSERT_EQ(S_OK, stream->Seek(distance, STREAM_SEEK_END, &position));
    EXPECT_EQ(5000U, position.QuadPart);
    distance.QuadPart = -1;
    ASSERT_EQ(S_OK, stream->Seek(distance, STREAM_SEEK_CUR, &position));
    EXPECT_EQ(4999U, position.QuadPart);
    EXPECT_EQ("we", Read(stream, 2));
    EXPECT_EQ("nd", Read(stream, 16));
    EXPECT_EQ("", Read(stream, 16));
    distance.QuadPart = -5004;
    if (!RunsOnWine()) { // which goes there
        EXPECT_EQ(STG_E_INVALIDFUNCTION, stream->Seek(distance, STREAM_SEEK_CUR, nullptr));
    }
    distance.QuadPart = 100000; // beyond the end there is nothing to read
    EXPECT_EQ(S_OK, stream->Seek(distance, STREAM_SEEK_CUR, &position));
    EXPECT_EQ(105003U, position.QuadPart);
    EXPECT_EQ("", Read(stream, 16));
    distance.QuadPart = 5002;
    EXPECT_EQ(S_OK, stream->Seek(distance, STREAM_SEEK_SET, nullptr));
    EXPECT_EQ("d", Read(stream, 16));
}

TEST_F(Storages, StreamsAreOpenedAloneAndForReading) {
    EXPECT_EQ(STG_E_INVALIDFLAG, StreamError(m_storage, L"Short", STGM_READ));
    EXPECT_EQ(STG_E_INVALIDFLAG, StreamError(m_storage, L"Short", Shared));
    EXPECT_EQ(RunsOnWine() ? E_INVALIDARG : STG_E_INVALIDNAME, StreamError(m_storage, nullptr));
    Stream first;
    ASSERT_EQ(S_OK, OpenStream(m_storage, L"Short", first));
    EXPECT_EQ(STG_E_ACCESSDENIED, StreamError(m_storage, L"SHORT"));
    first.Reset();
    EXPECT_EQ(S_OK, StreamError(m_storage, L"SHORT"));
}

TEST_F(Storages, AStreamIsNothingWithoutItsStorage) {
    Stream stream;
    ASSERT_EQ(S_OK, OpenStream(m_storage, L"WordDocument", stream));
    m_storage.Reset();
    char byte = 0;
    ULONG count = 0;
    EXPECT_EQ(STG_E_REVERTED, stream->Read(&byte, 1, &count));
}

TEST_F(Storages, TakePartInTheSharingOfFiles) {
    EXPECT_EQ(S_OK, OpenError(m_path));
    EXPECT_FALSE(OpenPath(m_path, GENERIC_WRITE, FILE_SHARE_READ));
    m_storage.Reset();
    FileHandle writer = OpenPath(m_path, GENERIC_WRITE, FILE_SHARE_READ);
    EXPECT_TRUE(writer);
    EXPECT_EQ(STG_E_SHAREVIOLATION, OpenError(m_path));
    writer.Reset();
    EXPECT_EQ(S_OK, OpenError(m_path));
}

TEST_F(Storages, FailuresHaveTheirCodes) {
    EXPECT_EQ(STG_E_FILENOTFOUND, OpenError(m_folder / "none.doc"));
    EXPECT_EQ(STG_E_PATHNOTFOUND, OpenError(m_folder / "none" / "a.doc"));
    EXPECT_EQ(STG_E_ACCESSDENIED, OpenError(m_folder.Path()));
    for (const std::string& bytes :
         {std::string(), std::string("PK\3\4"), std::string(5000, '\x5A')})
        EXPECT_EQ(STG_E_FILEALREADYEXISTS, OpenError(m_folder.Write("other.doc", bytes)));
    EXPECT_EQ(STG_E_INVALIDFLAG, OpenError(m_path, STGM_READ)); // others might write
    EXPECT_EQ(STG_E_INVALIDNAME,
              StgOpenStorage(nullptr, nullptr, Shared, nullptr, 0, m_storage.Receive()));
}

TEST_F(Storages, WithstandFilesMadeToDoHarm) {
    if (RunsOnWine())
        GTEST_SKIP() << "Wine follows a circle for ever";
    CompoundFile cyclicDirectory = m_file;
    cyclicDirectory.MakeDirectoryCyclic();
    Withstand(m_folder.Write("directory.doc", cyclicDirectory.Bytes()));
    CompoundFile cyclicChains = m_file;
    cyclicChains.MakeChainsCyclic();
    Withstand(m_folder.Write("chains.doc", cyclicChains.Bytes()));

    const std::string bytes = m_file.Bytes();
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
    // Two million sectors of the table, listed in a sector of zeros, which leads to itself.
    bytes.replace(44, 4, std::string("\x00\x00\x20\x00", 4));
    bytes.replace(68, 4, std::string(4, '\0'));
    const auto path = m_folder.Write("claim.doc", bytes);
    std::filesystem::resize_file(path, std::uintmax_t{2} << 30);
    EXPECT_EQ(STG_E_DOCFILECORRUPT, OpenError(path));
}

} // namespace
