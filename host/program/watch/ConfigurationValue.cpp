#include "host/program/watch/ConfigurationValue.h"

#include "host/program/base/PathText.h"
#include "host/program/watch/Quantities.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <algorithm>
#include <numeric>

namespace {

bool StandsBefore(const FilePosition& a, const FilePosition& b) {
    return std::pair(a.line, a.column) < std::pair(b.line, b.column);
}

/// How many letters have to be put in, left out or changed to make one of the other.
std::size_t Distance(const std::string& a, const std::string& b) {
    std::vector<std::size_t> row(b.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t{0});
    for (const char letter : a) {
        std::size_t diagonal = row[0]++;
        for (std::size_t i = 0; i < b.size(); ++i) {
            const std::size_t changed = diagonal + (letter == b[i] ? 0 : 1);
            diagonal = row[i + 1];
            row[i + 1] = std::min({changed, diagonal + 1, row[i] + 1});
        }
    }
    return row.back();
}

wxString ListOf(const std::vector<wxString>& names) {
    wxString list;
    for (const wxString& name : names)
        list << (list.empty() ? "\"" : ", \"") << name << '"';
    return list;
}

/// What a key may have been meant for, or which ones there are.
wxString Suggestion(const std::string& key, const std::vector<wxString>& known) {
    constexpr std::size_t LongestToCompare = 40;
    const auto distance = [&key](const wxString& name) {
        return Distance(name.utf8_string(), key.substr(0, LongestToCompare));
    };
    const auto nearest =
        std::min_element(known.begin(), known.end(), [&](const wxString& a, const wxString& b) {
            return distance(a) < distance(b);
        });
    const bool isNear = nearest != known.end() &&
                        distance(*nearest) <= std::max(std::size_t{1}, nearest->length() / 3);
    return isNear ? wxString::Format(_("did you mean \"%s\"?"), *nearest)
                  : wxString::Format(_("there are: %s"), ListOf(known));
}

} // namespace

void ConfigurationValue::Refuse(const wxString& what) const {
    throw Misfit{At(), wxString::FromUTF8(m_key) + ": " + what};
}

void ConfigurationValue::RefuseFor(const std::vector<wxString>& choices) const {
    Refuse(wxString::Format(_("it must be one of these: %s"), ListOf(choices)));
}

void ConfigurationValue::RefuseKey(const wxString& what, const std::vector<wxString>& known) const {
    throw Misfit{KeyAt(), wxString::Format(what, OneLine(wxString::FromUTF8(m_key))) + "; " +
                              Suggestion(m_key, known)};
}

void ConfigurationValue::RefuseKey(const std::vector<wxString>& known) const {
    RefuseKey(_("there is no key \"%s\" here"), known);
}

wxString ConfigurationValue::Text() const {
    const std::optional<std::string_view> text = m_node->value_exact<std::string_view>();
    if (!text)
        Refuse(_("it must be a text in quotes"));
    if (text->find('\0') != std::string_view::npos)
        Refuse(_("it must be a text without the character 0"));
    return wxString::FromUTF8(text->data(), text->size());
}

wxString ConfigurationValue::Word() const {
    wxString text = Text();
    if (text.empty())
        Refuse(_("it must not be empty"));
    return text;
}

wxString ConfigurationValue::AsText() const {
    if (const auto flag = m_node->value_exact<bool>())
        return *flag ? "1" : "0";
    if (const auto number = m_node->value_exact<std::int64_t>())
        return wxString(std::to_string(*number));
    return Text();
}

std::filesystem::path ConfigurationValue::Path(const std::filesystem::path& base) const {
    std::filesystem::path path = (base / FromText(Word())).lexically_normal();
    return path.has_filename() || path == path.root_path() ? path : path.parent_path();
}

bool ConfigurationValue::Flag() const {
    const auto flag = m_node->value_exact<bool>();
    if (!flag)
        Refuse(_("it must be true or false"));
    return *flag;
}

std::int64_t ConfigurationValue::Number(std::int64_t least, std::int64_t most) const {
    const auto number = m_node->value_exact<std::int64_t>();
    if (!number || *number < least || *number > most)
        Refuse(wxString::Format(_("it must be a whole number from %s to %s"), std::to_string(least),
                                std::to_string(most)));
    return *number;
}

std::chrono::milliseconds ConfigurationValue::Time(std::chrono::milliseconds least,
                                                   std::chrono::milliseconds most) const {
    const auto text = m_node->value_exact<std::string>();
    const auto time = text ? ParseTime(wxString::FromUTF8(*text)) : std::nullopt;
    if (!time || *time < least || *time > most)
        Refuse(wxString::Format(_("it must be a time from \"%s\" to \"%s\": a whole number with "
                                  "ms, s, m, h or d behind it, in quotes"),
                                TimeText(least), TimeText(most)));
    return *time;
}

std::uintmax_t ConfigurationValue::Size() const {
    const std::optional<std::uintmax_t> size =
        m_node->is_string() || m_node->is_integer() ? ParseSize(AsText()) : std::nullopt;
    if (!size)
        Refuse(_("it must be a number of bytes, or a text such as \"500M\", with K, M, G or T "
                 "behind the number"));
    return *size;
}

std::size_t ConfigurationValue::Choice(const std::vector<wxString>& choices) const {
    const auto text = m_node->value_exact<std::string>();
    const auto found =
        std::find(choices.begin(), choices.end(), text ? wxString::FromUTF8(*text) : wxString());
    if (found == choices.end())
        RefuseFor(choices);
    return static_cast<std::size_t>(found - choices.begin());
}

std::vector<ConfigurationValue> ConfigurationValue::Parts() const {
    const toml::array* const array = m_node->as_array();
    if (!array)
        Refuse(_("it must be a list in brackets"));
    std::vector<ConfigurationValue> parts;
    for (const toml::node& part : *array)
        parts.push_back({m_key, m_keyAt, part});
    return parts;
}

std::vector<ConfigurationValue> ConfigurationValue::Values() const {
    const toml::table* const table = m_node->as_table();
    if (!table)
        Refuse(_("it must be a table, with keys of its own"));
    std::vector<ConfigurationValue> values;
    for (const auto& [key, node] : *table)
        values.push_back({std::string(key.str()), key.source().begin, node});
    std::sort(values.begin(), values.end(),
              [](const auto& a, const auto& b) { return StandsBefore(a.KeyAt(), b.KeyAt()); });
    return values;
}
