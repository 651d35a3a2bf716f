#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

/// Writes compound files, the container of the legacy Office formats: sectors of 512 bytes, short
/// streams in the mini stream.
class CompoundFile {
public:
    CompoundFile();

    /// @param path the stream's name, of up to 31 characters; behind the names of the storages it
    /// lies in, which are made as need be: u"ObjectPool/_1234/Contents"
    void AddStream(std::u16string_view path, std::string_view bytes);

    /// Has the siblings in each storage hang in one long line, not in a balanced tree.
    void MakeDirectoryDegenerate() { m_degenerate = true; }
    /// Has the entries of each storage refer to its first one again.
    void MakeDirectoryCyclic() { m_cyclicDirectory = true; }
    /// Has every chain of sectors lead back to its beginning.
    void MakeChainsCyclic() { m_cyclicChains = true; }

    std::string Bytes() const;

private:
    struct Entry {
        std::u16string name;
        bool isStream = false;
        std::string bytes;
        std::vector<std::size_t> children; // entries in a storage
    };
    class Writer;

    std::size_t FindOrAdd(std::size_t storage, std::u16string_view name);

    std::vector<Entry> m_entries;                                          // the root storage first
    std::map<std::pair<std::size_t, std::u16string>, std::size_t> m_index; // by storage and name
    bool m_degenerate = false;
    bool m_cyclicDirectory = false;
    bool m_cyclicChains = false;
};
