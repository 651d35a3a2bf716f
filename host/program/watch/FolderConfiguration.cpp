#include "host/program/watch/FolderConfiguration.h"

#include "host/program/base/PathText.h"
#include "host/program/report/Language.h"
#include "host/program/settings/KnownSettings.h"
#include "host/program/watch/ConfigurationValue.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

using Value = const ConfigurationValue&;

/// What is being read of folders.
struct Reading {
    FolderConfiguration folder;
    std::uintmax_t minFree = 0;
    fs::path base{}; ///< what paths are relative to
};

std::vector<std::chrono::seconds> ReadRetries(Value value) {
    constexpr std::size_t Most = 20;
    std::vector<std::chrono::seconds> retries;
    for (const ConfigurationValue& part : value.Parts())
        retries.push_back(std::chrono::duration_cast<std::chrono::seconds>(part.Time(1s, 168h)));
    if (retries.size() > Most)
        value.Refuse(wxString::Format(_("it must have %zu parts at most"), Most));
    return retries;
}

std::optional<std::chrono::seconds> ReadKeeping(Value value) {
    constexpr auto Longest = 24h * 36500;
    return value.AsText() == "forever"
               ? std::nullopt
               : std::optional(
                     std::chrono::duration_cast<std::chrono::seconds>(value.Time(0s, Longest)));
}

std::string ReadLanguage(Value value) {
    Fault fault;
    const std::optional<wxString> language = FindLanguage(value.Word(), fault);
    if (!language)
        value.Refuse(fault.what);
    return language->utf8_string();
}

wxString ReadName(Value value) {
    constexpr std::size_t Longest = 100;
    wxString name = value.Word();
    if (name.length() > Longest || OneLine(name) != name)
        value.Refuse(
            wxString::Format(_("it must be a text of one line, of %zu letters at most"), Longest));
    return name;
}

/// The same names as on a command line, but one that no filter is known to have is refused: nobody
/// would hear of it.
void ReadSettings(Value table, Reading& reading) {
    for (const ConfigurationValue& value : table.Values()) {
        const wxString key = wxString::FromUTF8(value.Key());
        const Setting* const setting = FindSetting(key);
        if (!setting) {
            std::vector<wxString> known;
            for (const Setting* const each : FilterSettings::All)
                known.emplace_back(each->key);
            value.RefuseKey(_("there is no setting \"%s\""), known);
        }
        const wxString text = value.AsText();
        if (!Takes(*setting, text))
            value.RefuseFor(ValuesOf(*setting));
        reading.folder.assignments.push_back((key + '=' + text).utf8_string());
    }
}

OnSameName ReadOnSameName(Value value) {
    return value.Choice({"number", "replace"}) == 0 ? OnSameName::Number : OnSameName::Replace;
}

Others ReadOthers(Value value) {
    constexpr Others Choices[] = {Others::Leave, Others::Fail, Others::Pass};
    return Choices[value.Choice({"leave", "fail", "pass"})];
}

// clang-format off
const KeyReaders<Reading> DefaultsKeys = {
    {"keep_processed", [](Value value, Reading& r) { r.folder.keepProcessed = ReadKeeping(value); }},
    {"lang", [](Value value, Reading& r) { r.folder.language = ReadLanguage(value); }},
    {"min_free", [](Value value, Reading& r) { r.minFree = value.Size(); }},
    {"retries", [](Value value, Reading& r) { r.folder.retries = ReadRetries(value); }},
    {"settle", [](Value value, Reading& r) { r.folder.settle = value.Time(0ms, 1h); }},
};

const KeyReaders<Reading> FolderKeys = {
    {"in", [](Value value, Reading& r) { r.folder.in = value.Path(r.base); }},
    {"job", [](Value value, Reading& r) { r.folder.folderIsJob = value.Choice({"file", "folder"}) == 1; }},
    {"keep_processed", DefaultsKeys.at("keep_processed")},
    {"lang", DefaultsKeys.at("lang")},
    {"name", [](Value value, Reading& r) { r.folder.name = ReadName(value); }},
    {"on_same_name", [](Value value, Reading& r) { r.folder.onSameName = ReadOnSameName(value); }},
    {"order", [](Value value, Reading& r) { r.folder.byName = value.Choice({"arrival", "name"}) == 1; }},
    {"others", [](Value value, Reading& r) { r.folder.others = ReadOthers(value); }},
    {"out", [](Value value, Reading& r) { r.folder.out = value.Path(r.base); }},
    {"print", [](Value value, Reading& r) { r.folder.print = ReadPrinting(value); }},
    {"priority", [](Value value, Reading& r) { r.folder.priority = static_cast<int>(value.Number(1, 100)); }},
    {"retries", DefaultsKeys.at("retries")},
    {"set", ReadSettings},
    {"settings", [](Value value, Reading& r) { r.folder.settings = value.Path(r.base); }},
    {"settle", DefaultsKeys.at("settle")},
};
// clang-format on

} // namespace

FolderConfiguration StandardFolderConfiguration() {
    FolderConfiguration folder;
    folder.retries = {30s, 5min, 30min};
    folder.keepProcessed = 24h * 14;
    return folder;
}

std::chrono::milliseconds SettleTime(const FolderConfiguration& folder, bool isOnShare) {
    return folder.settle.value_or(isOnShare ? 10s : 2s);
}

void ReadDefaults(Value table, FolderConfiguration& folder, std::uintmax_t& minFree) {
    Reading reading = {folder, minFree};
    ReadTable(table, DefaultsKeys, reading);
    folder = reading.folder;
    minFree = reading.minFree;
}

FolderConfiguration ReadFolder(Value table, const FolderConfiguration& defaults,
                               const fs::path& base) {
    Reading reading = {defaults, 0, base};
    ReadTable(table, FolderKeys, reading);
    FolderConfiguration& folder = reading.folder;
    for (const auto& [key, path] : {std::pair("in", &folder.in), std::pair("out", &folder.out)})
        if (path->empty())
            throw Misfit{table.At(), wxString::Format(_("this folder has no \"%s\""), key)};
    if (folder.name.empty())
        folder.name = Shown(folder.in.filename());
    if (folder.name.empty())
        throw Misfit{table.At(), _("this folder has no \"name\"")};
    return folder;
}
