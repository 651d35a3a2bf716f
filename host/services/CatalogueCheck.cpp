#include "host/services/CatalogueCheck.h"

#include <cstdint>

namespace {

constexpr std::uint32_t Magic = 0x950412DE;
constexpr std::uint32_t SwappedMagic = 0xDE120495;
constexpr std::size_t CountAt = 8; // behind the magic number and the version
constexpr std::size_t KeysAt = 12;
constexpr std::size_t TextsAt = 16;
constexpr std::size_t HeaderSize = 28;
constexpr std::size_t EntrySize = 8; // length, place

/// The bytes as a sequence of numbers of 32 bits in one byte order.
class Numbers {
public:
    Numbers(std::string_view bytes, bool bigEndian) : m_bytes(bytes), m_bigEndian(bigEndian) {}

    std::uint64_t At(std::size_t place) const {
        std::uint64_t number = 0;
        for (std::size_t i = 0; i < 4; ++i)
            number = number << 8U |
                     static_cast<unsigned char>(m_bytes[place + (m_bigEndian ? i : 3 - i)]);
        return number;
    }

private:
    std::string_view m_bytes;
    bool m_bigEndian;
};

/// Whether the strings of a table are in the file, each with a zero behind it.
bool IsSoundTable(std::string_view bytes, const Numbers& numbers, std::uint64_t table) {
    const std::uint64_t count = numbers.At(CountAt);
    if (table + count * EntrySize > bytes.size())
        return false;
    for (std::uint64_t entry = table; entry < table + count * EntrySize; entry += EntrySize) {
        const std::uint64_t end = numbers.At(entry) + numbers.At(entry + 4);
        if (end >= bytes.size() || bytes[end] != '\0')
            return false;
    }
    return true;
}

} // namespace

bool IsSoundCatalogue(std::string_view bytes) {
    if (bytes.size() < HeaderSize)
        return false;
    const std::uint64_t magic = Numbers(bytes, false).At(0);
    if (magic != Magic && magic != SwappedMagic)
        return false;
    const Numbers numbers(bytes, magic == SwappedMagic);
    return IsSoundTable(bytes, numbers, numbers.At(KeysAt)) &&
           IsSoundTable(bytes, numbers, numbers.At(TextsAt));
}
