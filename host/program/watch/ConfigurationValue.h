#pragma once

#include <wx/string.h>

#include <toml++/toml.h>

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <map>
#include <string>
#include <vector>

/// Where something stands in a file; both count from 1.
using FilePosition = toml::source_position;

/// What is wrong in a configuration, and where. Thrown by whoever reads it, and caught by who has
/// it read.
struct Misfit {
    FilePosition at;
    wxString what;
};

/// A value of a configuration, with its key. Each way to read it throws a Misfit when the value is
/// none such.
class ConfigurationValue {
public:
    /// A whole configuration.
    /// @param node outlives this object
    explicit ConfigurationValue(const toml::node& node) : ConfigurationValue({}, {1, 1}, node) {}

    const std::string& Key() const { return m_key; }
    FilePosition KeyAt() const { return m_keyAt; }
    FilePosition At() const { return m_node->source().begin; }

    /// @throw Misfit with the key in front of what is wrong with the value
    [[noreturn]] void Refuse(const wxString& what) const;
    /// The same, with what the value can be.
    [[noreturn]] void RefuseFor(const std::vector<wxString>& choices) const;
    /// The same for its key.
    /// @param what has "%s" for the key
    /// @param known the keys that there are
    [[noreturn]] void RefuseKey(const wxString& what, const std::vector<wxString>& known) const;
    /// As one that is not known here.
    [[noreturn]] void RefuseKey(const std::vector<wxString>& known) const;

    wxString Text() const;
    /// A text that is not empty.
    wxString Word() const;
    /// A text, a number, or true and false as "1" and "0".
    wxString AsText() const;
    /// @param base what it is relative to
    std::filesystem::path Path(const std::filesystem::path& base) const;
    bool Flag() const;
    std::int64_t Number(std::int64_t least, std::int64_t most) const;
    std::chrono::milliseconds Time(std::chrono::milliseconds least,
                                   std::chrono::milliseconds most) const;
    std::uintmax_t Size() const;
    /// @return the number of the one that it is
    std::size_t Choice(const std::vector<wxString>& choices) const;

    /// The parts of a list.
    std::vector<ConfigurationValue> Parts() const;
    /// The values of a table, in the order in which they are written.
    std::vector<ConfigurationValue> Values() const;

private:
    ConfigurationValue(std::string key, FilePosition keyAt, const toml::node& node)
        : m_key(std::move(key)), m_keyAt(keyAt), m_node(&node) {}

    std::string m_key;
    FilePosition m_keyAt;
    const toml::node* m_node;
};

/// What reads the value of each key that a table may have.
template <typename Target>
using KeyReaders = std::map<std::string, void (*)(const ConfigurationValue&, Target&)>;

/// Reads a table. Throws a Misfit when it has a key that none of them reads.
template <typename Target>
void ReadTable(const ConfigurationValue& table, const KeyReaders<Target>& readers, Target& target) {
    for (const ConfigurationValue& value : table.Values()) {
        if (const auto reader = readers.find(value.Key()); reader != readers.end()) {
            reader->second(value, target);
            continue;
        }
        std::vector<wxString> known;
        for (const auto& [key, read] : readers)
            known.push_back(wxString::FromUTF8(key));
        value.RefuseKey(known);
    }
}
