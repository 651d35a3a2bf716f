#include "tests/support/CompoundFile.h"

#include <algorithm>
#include <cstdint>
#include <initializer_list>
#include <tuple>

namespace {

constexpr std::size_t SectorSize = 512;
constexpr std::size_t MiniSectorSize = 64;
constexpr std::size_t MiniStreamLimit = 4096; // streams below it lie in the mini stream
constexpr std::size_t NumbersPerSector = SectorSize / 4;
constexpr std::size_t FatSectorsInHeader = 109;

constexpr std::uint32_t DifatSector = 0xFFFFFFFC;
constexpr std::uint32_t FatSector = 0xFFFFFFFD;
constexpr std::uint32_t EndOfChain = 0xFFFFFFFE;
constexpr std::uint32_t Unused = 0xFFFFFFFF;

/// Numbers in the file's order of bytes: each one and the bytes that it has.
std::string Fields(std::initializer_list<std::pair<std::uint64_t, int>> fields) {
    std::string bytes;
    for (const auto& [number, size] : fields)
        for (int i = 0; i < size; ++i)
            bytes += static_cast<char>(number >> 8 * i);
    return bytes;
}

/// A table in whole sectors.
std::string ToBytes(std::vector<std::uint32_t> table) {
    table.resize((table.size() + NumbersPerSector - 1) / NumbersPerSector * NumbersPerSector,
                 Unused);
    std::string bytes;
    for (const std::uint32_t number : table)
        bytes += Fields({{number, 4}});
    return bytes;
}

std::uint32_t ToNumber(std::size_t value) {
    return static_cast<std::uint32_t>(value);
}

} // namespace

/// Lays one file out: first the sectors of the streams, then the tables about them.
class CompoundFile::Writer {
public:
    explicit Writer(const CompoundFile& file) : m_file(file), m_places(file.m_entries.size()) {}

    std::string Write() {
        for (std::size_t i = 0; i < m_places.size(); ++i)
            PlaceStream(i);
        m_places[0].size = m_miniStream.size();
        m_places[0].start = AddChain(m_fat, m_sectors, m_miniStream, SectorSize);
        const std::string miniTable = ToBytes(m_miniFat);
        const std::uint32_t miniFat = AddChain(m_fat, m_sectors, miniTable, SectorSize);
        LinkSiblings();
        const std::uint32_t directory = AddChain(m_fat, m_sectors, Directory(), SectorSize);
        const std::vector<std::uint32_t> fatSectors = AddFat();
        return Header(directory, miniFat, miniTable.size() / SectorSize, fatSectors) + m_sectors;
    }

private:
    struct Place {
        std::uint32_t start = EndOfChain;
        std::size_t size = 0;
        std::uint32_t left = Unused;
        std::uint32_t right = Unused;
        std::uint32_t child = Unused;
    };

    /// Appends `data` to `space` and its chain to `table`.
    /// @return the number of its first sector
    std::uint32_t AddChain(std::vector<std::uint32_t>& table, std::string& space,
                           const std::string& data, std::size_t unit) const {
        if (data.empty())
            return EndOfChain;
        const std::uint32_t first = ToNumber(table.size());
        space += data;
        space.resize((space.size() + unit - 1) / unit * unit);
        while (table.size() < space.size() / unit)
            table.push_back(ToNumber(table.size()) + 1);
        table.back() = m_file.m_cyclicChains ? first : EndOfChain;
        return first;
    }

    void PlaceStream(std::size_t index) {
        const Entry& entry = m_file.m_entries[index];
        const bool isShort = entry.bytes.size() < MiniStreamLimit;
        m_places[index].size = entry.bytes.size();
        m_places[index].start = isShort
                                    ? AddChain(m_miniFat, m_miniStream, entry.bytes, MiniSectorSize)
                                    : AddChain(m_fat, m_sectors, entry.bytes, SectorSize);
    }

    void LinkSiblings() {
        for (std::size_t storage = 0; storage < m_places.size(); ++storage) {
            std::vector<std::size_t> children = m_file.m_entries[storage].children;
            // Shorter names come first, then it is the letters in upper case.
            const auto rank = [&](std::size_t child) {
                std::u16string name = m_file.m_entries[child].name;
                for (char16_t& letter : name)
                    letter = letter >= u'a' && letter <= u'z' ? letter - u'a' + u'A' : letter;
                return std::make_tuple(name.size(), name);
            };
            std::sort(children.begin(), children.end(),
                      [&](auto left, auto right) { return rank(left) < rank(right); });
            m_places[storage].child = Link(children, 0, children.size());
            for (const std::size_t child : children)
                if (m_file.m_cyclicDirectory)
                    m_places[child].right = m_places[storage].child;
        }
    }

    std::uint32_t Link(const std::vector<std::size_t>& sorted, std::size_t begin, std::size_t end) {
        if (m_file.m_degenerate) {
            for (std::size_t i = begin; i + 1 < end; ++i)
                m_places[sorted[i]].right = ToNumber(sorted[i + 1]);
            return begin < end ? ToNumber(sorted[begin]) : Unused;
        }
        if (begin == end)
            return Unused;
        const std::size_t middle = (begin + end) / 2;
        m_places[sorted[middle]].left = Link(sorted, begin, middle);
        m_places[sorted[middle]].right = Link(sorted, middle + 1, end);
        return ToNumber(sorted[middle]);
    }

    std::string Directory() const {
        std::string bytes;
        for (std::size_t i = 0; i < m_places.size(); ++i) {
            const Entry& entry = m_file.m_entries[i];
            std::string name;
            for (const char16_t unit : entry.name)
                name += Fields({{unit, 2}});
            name.resize(64);
            const std::uint64_t kind = i == 0 ? 5 : entry.isStream ? 2 : 1;
            constexpr std::uint64_t Black = 1;
            const Place& place = m_places[i];
            bytes += name;
            bytes += Fields({{2 * (entry.name.size() + 1), 2}, {kind, 1}, {Black, 1}});
            bytes += Fields({{place.left, 4}, {place.right, 4}, {place.child, 4}});
            bytes.append(36, '\0'); // class, state and times
            bytes += Fields({{kind == 1 ? 0 : place.start, 4}, {place.size, 8}});
        }
        const std::string unusedEntry =
            std::string(68, '\0') + std::string(12, '\xFF') + std::string(48, '\0');
        while (bytes.size() % SectorSize != 0)
            bytes += unusedEntry;
        return bytes;
    }

    /// Appends the allocation table, and the table of its sectors beyond those in the header.
    /// @return the sectors of the allocation table; behind them those of the other
    std::vector<std::uint32_t> AddFat() {
        const std::size_t used = m_fat.size();
        std::size_t difatCount = 0;
        m_fatCount = 0;
        while (m_fatCount * NumbersPerSector < used + m_fatCount + difatCount) {
            ++m_fatCount;
            const std::size_t more = m_fatCount - std::min(m_fatCount, FatSectorsInHeader);
            difatCount = (more + NumbersPerSector - 2) / (NumbersPerSector - 1);
        }
        std::vector<std::uint32_t> sectors;
        for (std::size_t i = 0; i < m_fatCount + difatCount; ++i) {
            sectors.push_back(ToNumber(used + i));
            m_fat.push_back(i < m_fatCount ? FatSector : DifatSector);
        }
        m_sectors += ToBytes(m_fat);
        for (std::size_t i = 0; i < difatCount; ++i) {
            const std::size_t begin = FatSectorsInHeader + i * (NumbersPerSector - 1);
            const std::size_t end = std::min(begin + NumbersPerSector - 1, m_fatCount);
            std::vector<std::uint32_t> difat(sectors.begin() + static_cast<std::ptrdiff_t>(begin),
                                             sectors.begin() + static_cast<std::ptrdiff_t>(end));
            difat.resize(NumbersPerSector - 1, Unused);
            difat.push_back(i + 1 < difatCount ? sectors[m_fatCount + i + 1] : EndOfChain);
            m_sectors += ToBytes(difat);
        }
        return sectors;
    }

    std::string Header(std::uint32_t directory, std::uint32_t miniFat, std::size_t miniFatCount,
                       std::vector<std::uint32_t> fatSectors) const {
        const std::size_t difatCount = fatSectors.size() - m_fatCount;
        const std::uint32_t difat = difatCount > 0 ? fatSectors[m_fatCount] : EndOfChain;
        fatSectors.resize(std::min(m_fatCount, FatSectorsInHeader));
        std::string bytes("\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1", 8);
        bytes.append(16, '\0'); // class
        // The version; the order of bytes; sectors of 2^9 bytes, mini sectors of 2^6 bytes.
        bytes += Fields({{0x3E, 2}, {3, 2}, {0xFFFE, 2}, {9, 2}, {6, 2}});
        bytes.append(10, '\0');
        bytes += Fields({{m_fatCount, 4}, {directory, 4}, {0, 4}, {MiniStreamLimit, 4}});
        bytes += Fields({{miniFat, 4}, {miniFatCount, 4}, {difat, 4}, {difatCount, 4}});
        bytes += ToBytes(fatSectors);
        bytes.resize(SectorSize, '\xFF');
        return bytes;
    }

    const CompoundFile& m_file;
    std::vector<Place> m_places; // of the entries
    std::vector<std::uint32_t> m_fat;
    std::vector<std::uint32_t> m_miniFat;
    std::size_t m_fatCount = 0;
    std::string m_sectors;
    std::string m_miniStream;
};

CompoundFile::CompoundFile() : m_entries(1) {
    m_entries[0].name = u"Root Entry";
}

std::size_t CompoundFile::FindOrAdd(std::size_t storage, std::u16string_view name) {
    const auto [place, isNew] =
        m_index.try_emplace({storage, std::u16string(name)}, m_entries.size());
    if (isNew) {
        m_entries.push_back({std::u16string(name), false, {}, {}});
        m_entries[storage].children.push_back(place->second);
    }
    return place->second;
}

void CompoundFile::AddStream(std::u16string_view path, std::string_view bytes) {
    std::size_t storage = 0;
    for (std::size_t slash = path.find(u'/'); slash != std::u16string_view::npos;
         slash = path.find(u'/')) {
        storage = FindOrAdd(storage, path.substr(0, slash));
        path.remove_prefix(slash + 1);
    }
    Entry& stream = m_entries[FindOrAdd(storage, path)];
    stream.isStream = true;
    stream.bytes = bytes;
}

std::string CompoundFile::Bytes() const {
    return Writer(*this).Write();
}
