#include "platform/win32/storage/StructureCheck.h"

#include <algorithm>
#include <cstring>
#include <optional>

namespace win32 {

namespace {

constexpr std::size_t HeaderSize = 512;
constexpr BYTE Signature[] = {0xD0, 0xCF, 0x11, 0xE0, 0xA1, 0xB1, 0x1A, 0xE1};
constexpr std::uint64_t LargestFile = std::uint64_t{0xFFFFFFFF}; // libgsf counts with 32 bits
constexpr std::size_t EntrySize = 128;
constexpr std::uint32_t LastSectorNumber = 0xFFFFFFFA; // above it are marks

// Of the directory. A document with two thousand embedded objects stays below; the depth is that of
// a tree whose siblings stand in one line.
constexpr std::size_t MostEntries = 20000;
constexpr std::size_t DeepestEntry = 1000;

// Short streams are below 4096 bytes, which are 64 mini sectors.
constexpr std::size_t MostMiniSectors = MostEntries * 64;

std::uint32_t NumberAt(const BYTE* bytes) {
    return bytes[0] | bytes[1] << 8 | bytes[2] << 16 | std::uint32_t{bytes[3]} << 24;
}

class Tables {
public:
    explicit Tables(FileWindow& file) : m_file(file) {}

    HRESULT ReadHeader() {
        const BYTE* header = m_file.At(0, HeaderSize);
        if (!header || std::memcmp(header, Signature, sizeof Signature) != 0)
            return STG_E_FILEALREADYEXISTS;
        if (m_file.Size() > LargestFile)
            return STG_E_DOCFILETOOLARGE;
        const unsigned sectorShift = header[30];
        const bool usualSectors = sectorShift == 9 || sectorShift == 12;
        const bool usualMiniSectors = header[32] == 6 && NumberAt(header + 56) == 4096;
        if (!usualSectors || !usualMiniSectors || header[31] != 0 || header[33] != 0)
            return STG_E_DOCFILECORRUPT;
        m_sectorSize = std::size_t{1} << sectorShift;
        m_directory = NumberAt(header + 48);
        m_miniFat = NumberAt(header + 60);
        return ReadFatSectors(NumberAt(header + 44), NumberAt(header + 68)) ? S_OK
                                                                            : STG_E_DOCFILECORRUPT;
    }

    /// @return the sectors of the directory; nothing when they are too many
    std::optional<std::vector<std::uint32_t>> DirectoryChain() {
        return Chain(m_directory, MostEntries * EntrySize / m_sectorSize);
    }

    bool IsMiniFatBounded() {
        return Chain(m_miniFat, MostMiniSectors / NumbersPerSector() + 1).has_value();
    }

    const BYTE* Sector(std::uint32_t number, std::size_t offset, std::size_t size) {
        return m_file.At((std::uint64_t{number} + 1) * m_sectorSize + offset, size);
    }

    std::size_t EntriesPerSector() const { return m_sectorSize / EntrySize; }

private:
    std::size_t NumbersPerSector() const { return m_sectorSize / 4; }

    /// Finds out where the allocation table lies.
    bool ReadFatSectors(std::size_t count, std::uint32_t difat) {
        const std::size_t sectors = m_file.Size() / m_sectorSize + 1;
        if (count > 2 * (sectors / NumbersPerSector()) + 8) // twice what the file needs
            return false;
        constexpr std::size_t InHeader = 109;
        const BYTE* header = m_file.At(0, HeaderSize);
        for (std::size_t i = 0; header && i < std::min(count, InHeader); ++i)
            m_fatSectors.push_back(NumberAt(header + 76 + 4 * i));
        while (m_fatSectors.size() < count) {
            const BYTE* numbers = Sector(difat, 0, m_sectorSize);
            if (!numbers)
                return false;
            const std::size_t left = count - m_fatSectors.size();
            for (std::size_t i = 0; i < std::min(left, NumbersPerSector() - 1); ++i)
                m_fatSectors.push_back(NumberAt(numbers + 4 * i));
            difat = NumberAt(numbers + m_sectorSize - 4);
        }
        return true;
    }

    std::optional<std::uint32_t> Next(std::uint32_t sector) {
        const std::size_t table = sector / NumbersPerSector();
        if (table >= m_fatSectors.size())
            return std::nullopt;
        const BYTE* number = Sector(m_fatSectors[table], sector % NumbersPerSector() * 4, 4);
        return number ? std::optional(NumberAt(number)) : std::nullopt;
    }

    /// Follows a chain to its end, or to where the file breaks off.
    std::optional<std::vector<std::uint32_t>> Chain(std::uint32_t start, std::size_t most) {
        std::vector<std::uint32_t> chain;
        std::optional<std::uint32_t> sector = start;
        while (sector && *sector <= LastSectorNumber) {
            if (chain.size() == most)
                return std::nullopt;
            chain.push_back(*sector);
            sector = Next(*sector);
        }
        return chain;
    }

    FileWindow& m_file;
    std::size_t m_sectorSize = 0;
    std::uint32_t m_directory = 0;
    std::uint32_t m_miniFat = 0;
    std::vector<std::uint32_t> m_fatSectors;
};

/// Walks the directory in the order in which libgsf does, which leaves out what it has seen.
bool IsDirectoryShallow(Tables& tables, const std::vector<std::uint32_t>& chain) {
    struct Step {
        std::uint32_t entry;
        std::size_t depth;
    };
    std::vector<bool> seen(chain.size() * tables.EntriesPerSector());
    std::vector<Step> ahead = {{0, 1}};
    while (!ahead.empty()) {
        const Step step = ahead.back();
        ahead.pop_back();
        if (step.entry >= seen.size() || seen[step.entry])
            continue;
        if (step.depth > DeepestEntry)
            return false;
        seen[step.entry] = true;
        const BYTE* entry =
            tables.Sector(chain[step.entry / tables.EntriesPerSector()],
                          step.entry % tables.EntriesPerSector() * EntrySize, EntrySize);
        if (!entry)
            continue;
        constexpr BYTE Stream = 2;
        if (entry[66] != Stream)
            ahead.push_back({NumberAt(entry + 76), step.depth + 1});
        ahead.push_back({NumberAt(entry + 72), step.depth + 1});
        ahead.push_back({NumberAt(entry + 68), step.depth + 1});
    }
    return true;
}

} // namespace

HRESULT CheckStructure(FileWindow& file) {
    Tables tables(file);
    const HRESULT header = tables.ReadHeader();
    if (FAILED(header))
        return header;
    const std::optional<std::vector<std::uint32_t>> directory = tables.DirectoryChain();
    const bool good =
        directory && tables.IsMiniFatBounded() && IsDirectoryShallow(tables, *directory);
    return good ? S_OK : STG_E_DOCFILECORRUPT;
}

} // namespace win32
