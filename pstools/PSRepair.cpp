#include "pstools/PSRepair.h"

#include "common/UniqueHandle.h"

#include <cstring>
#include <limits>
#include <memory>

namespace {

constexpr char HeaderMark[] = "%!PS-Adobe-";
constexpr DWORD SearchedBytes = 512;

class OpenedFile : public PSRepair::File {
public:
    explicit OpenedFile(const wxString& path)
        : m_file(CreateFileW(path.wc_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr, OPEN_EXISTING,
                             FILE_ATTRIBUTE_NORMAL, nullptr)) {}

    bool IsOpen() const { return static_cast<bool>(m_file); }

    bool Read(void* buffer, DWORD size, DWORD& read) override {
        return ReadFile(m_file.Get(), buffer, size, &read, nullptr) != FALSE;
    }
    bool Write(const void* buffer, DWORD size) override {
        DWORD written = 0;
        return WriteFile(m_file.Get(), buffer, size, &written, nullptr) && written == size;
    }
    bool Seek(DWORD position) override {
        LARGE_INTEGER distance{};
        distance.QuadPart = position;
        return SetFilePointerEx(m_file.Get(), distance, nullptr, FILE_BEGIN) != FALSE;
    }
    bool SetEnd() override { return SetEndOfFile(m_file.Get()) != FALSE; }
    bool GetSize(std::uint64_t& size) override {
        LARGE_INTEGER value{};
        if (!GetFileSizeEx(m_file.Get(), &value))
            return false;
        size = static_cast<std::uint64_t>(value.QuadPart);
        return true;
    }

private:
    FileHandle m_file;
};

struct HeapBlockDeleter {
    void operator()(char* block) const { HeapFree(GetProcessHeap(), 0, block); }
};
using HeapBlock = std::unique_ptr<char, HeapBlockDeleter>;

/// A block as large as a printed file, its bytes not set; null when there is no memory for it.
HeapBlock AllocateBlock(DWORD size) {
    return HeapBlock(static_cast<char*>(HeapAlloc(GetProcessHeap(), 0, size)));
}

bool ReplaceContent(PSRepair::File& file, const void* content, DWORD size) {
    return file.Seek(0) && file.Write(content, size) && file.SetEnd();
}

/// Puts back a file whose cut failed half-way: the bytes in front of the header and those from it
/// on are both still in memory, and the file has not become longer.
void TakeBack(PSRepair::File& file, const void* front, DWORD frontSize, const void* rest,
              DWORD restSize) {
    if (file.Seek(0) && file.Write(front, frontSize))
        file.Write(rest, restSize);
}

} // namespace

std::int32_t PSRepair::CutToHeader(File& file) {
    char start[SearchedBytes + 1];
    DWORD startSize = 0;
    if (!file.Read(start, SearchedBytes, startSize))
        startSize = 0;
    start[startSize] = '\0';

    const char* header = std::strstr(start, HeaderMark); // ends at the first zero byte
    if (!header)
        return NoHeader;
    const auto frontSize = static_cast<DWORD>(header - start);
    if (frontSize == 0)
        return Done;

    std::uint64_t size = 0;
    if (!file.GetSize(size) || size > std::numeric_limits<DWORD>::max())
        return NoHeader; // what cannot be moved in one piece stays as it is
    const auto restSize = static_cast<DWORD>(size - frontSize);
    const HeapBlock rest = AllocateBlock(restSize);
    DWORD readSize = 0;
    if (!rest || !file.Seek(frontSize) || !file.Read(rest.get(), restSize, readSize) ||
        readSize != restSize)
        return NoHeader;
    if (ReplaceContent(file, rest.get(), restSize))
        return Done;
    TakeBack(file, start, frontSize, rest.get(), restSize);
    return NoHeader;
}

std::int32_t RepairPSHeader(wxString path) { // NOLINT(performance-unnecessary-value-param)
    OpenedFile file(path);
    return file.IsOpen() ? PSRepair::CutToHeader(file) : PSRepair::CannotOpen;
}
