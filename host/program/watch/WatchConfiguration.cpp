#include "host/program/watch/WatchConfiguration.h"

#include "host/program/base/BoundedFile.h"
#include "host/program/base/PathText.h"
#include "host/program/journal/Journal.h"
#include "host/program/report/Language.h"
#include "host/program/settings/KnownSettings.h"
#include "host/program/watch/ConfigurationValue.h"
#include "host/program/watch/FolderPlaces.h"
#include "host/program/workers/WorkerCount.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <algorithm>
#include <map>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

using Value = const ConfigurationValue&;

/// A configuration that is being read.
struct Reading {
    fs::path base; ///< what its paths are relative to
    WatchConfiguration watch = StandardWatchConfiguration();
    FolderConfiguration folder = StandardFolderConfiguration(); ///< or what holds for all
    std::vector<ConfigurationValue> folders{};                  ///< those of the configuration
    std::string queue{};
};

using Keys = std::map<std::string, void (*)(Value, Reading&)>;

void ReadTable(Value table, const Keys& keys, Reading& reading) {
    for (const ConfigurationValue& value : table.Values()) {
        if (const auto key = keys.find(value.Key()); key != keys.end()) {
            key->second(value, reading);
            continue;
        }
        std::vector<wxString> known;
        for (const auto& [name, read] : keys)
            known.push_back(wxString::FromUTF8(name));
        value.RefuseKey(_("there is no key \"%s\" here"), known);
    }
}

/// Where the value with a key stands, or the table that has none.
FilePosition PositionOf(const char* key, Value table) {
    for (const ConfigurationValue& value : table.Values())
        if (value.Key() == key)
            return value.At();
    return table.At();
}

fs::path ReadPath(Value value, const Reading& reading) {
    fs::path path = (reading.base / FromText(value.Word())).lexically_normal();
    return path.has_filename() || path == path.root_path() ? path : path.parent_path();
}

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

std::string ReadQueue(Value value) {
    std::string url = value.Word().utf8_string();
    if (!IsQueueUrl(url))
        value.Refuse(_("it must be the URL of a database, such as "
                       "\"postgres://quillon@server/quillon\""));
    return url;
}

PathMap ReadMap(Value table, const Reading& reading) {
    std::map<std::string, fs::path> shares;
    for (const ConfigurationValue& value : table.Values()) {
        if (!PathMap::IsName(value.Key()))
            value.RefuseKey(
                _("\"%s\" is no name for a share: it must have two letters at least, and "
                  "no slash or colon"),
                {});
        shares[value.Key()] = ReadPath(value, reading);
    }
    return PathMap(std::move(shares));
}

std::string ReadAddress(Value value) {
    const wxString address = value.Text();
    const wxString port = address.AfterLast(':');
    unsigned long number = 0;
    const bool isOne = !address.BeforeLast(':').empty() &&
                       port.find_first_not_of("0123456789") == wxString::npos &&
                       port.ToULong(&number) && number >= 1 && number <= 65535;
    if (!address.empty() && !isOne)
        value.Refuse(_("it must be HOST:PORT, such as \"127.0.0.1:9188\", or empty for no page"));
    return address.utf8_string();
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
const Keys DefaultsKeys = {
    {"keep_processed", [](Value value, Reading& r) { r.folder.keepProcessed = ReadKeeping(value); }},
    {"lang", [](Value value, Reading& r) { r.folder.language = ReadLanguage(value); }},
    {"min_free", [](Value value, Reading& r) { r.watch.minFree = value.Size(); }},
    {"retries", [](Value value, Reading& r) { r.folder.retries = ReadRetries(value); }},
    {"settle", [](Value value, Reading& r) { r.folder.settle = value.Time(0ms, 1h); }},
};

const Keys FolderKeys = {
    {"in", [](Value value, Reading& r) { r.folder.in = ReadPath(value, r); }},
    {"job", [](Value value, Reading& r) { r.folder.folderIsJob = value.Choice({"file", "folder"}) == 1; }},
    {"keep_processed", DefaultsKeys.at("keep_processed")},
    {"lang", DefaultsKeys.at("lang")},
    {"name", [](Value value, Reading& r) { r.folder.name = ReadName(value); }},
    {"on_same_name", [](Value value, Reading& r) { r.folder.onSameName = ReadOnSameName(value); }},
    {"order", [](Value value, Reading& r) { r.folder.byName = value.Choice({"arrival", "name"}) == 1; }},
    {"others", [](Value value, Reading& r) { r.folder.others = ReadOthers(value); }},
    {"out", [](Value value, Reading& r) { r.folder.out = ReadPath(value, r); }},
    {"print", [](Value value, Reading& r) { r.folder.print = ReadPrinting(value); }},
    {"priority", [](Value value, Reading& r) { r.folder.priority = static_cast<int>(value.Number(1, 100)); }},
    {"retries", DefaultsKeys.at("retries")},
    {"set", ReadSettings},
    {"settings", [](Value value, Reading& r) { r.folder.settings = ReadPath(value, r); }},
    {"settle", DefaultsKeys.at("settle")},
};
// clang-format on

void CheckFolder(Value table, Reading& r) {
    FolderConfiguration& folder = r.folder;
    for (const auto& [key, path] : {std::pair("in", &folder.in), std::pair("out", &folder.out)})
        if (path->empty())
            throw Misfit{table.At(), wxString::Format(_("this folder has no \"%s\""), key)};
    if (folder.name.empty())
        folder.name = Shown(folder.in.filename());
    if (folder.name.empty())
        throw Misfit{table.At(), _("this folder has no \"name\"")};
    const auto& others = r.watch.folders;
    if (std::any_of(others.begin(), others.end(),
                    [&folder](const auto& other) { return other.name == folder.name; }))
        throw Misfit{PositionOf("name", table),
                     wxString::Format(_("there is another folder with the name \"%s\"; give each "
                                        "its own \"name\""),
                                      folder.name)};
}

void ReadFolders(Value list, Reading& reading) {
    const FolderConfiguration defaults = reading.folder;
    reading.folders = list.Parts();
    for (const ConfigurationValue& table : reading.folders) {
        reading.folder = defaults;
        ReadTable(table, FolderKeys, reading);
        CheckFolder(table, reading);
        reading.watch.folders.push_back(reading.folder);
    }
}

// clang-format off
const Keys RootKeys = {
    {"defaults", [](Value, Reading&) {}}, // what they are is read before all others
    {"folder", ReadFolders},
    {"http", [](Value value, Reading& r) { r.watch.http = ReadAddress(value); }},
    {"jobs", [](Value value, Reading& r) { r.watch.jobs = static_cast<unsigned>(value.Number(0, MostWorkers)); }},
    {"journal", [](Value value, Reading& r) { r.watch.journal = ReadPath(value, r).u8string(); }},
    {"lease", [](Value value, Reading& r) {
         r.watch.lease = std::chrono::duration_cast<std::chrono::seconds>(value.Time(ShortestLease, LongestLease));
     }},
    {"map", [](Value value, Reading& r) { r.watch.map = ReadMap(value, r); }},
    {"queue", [](Value value, Reading& r) { r.queue = ReadQueue(value); }},
};
// clang-format on

void CheckPlaces(Value root, const Reading& reading) {
    const std::optional<Clash> clash = FindClash(reading.watch);
    if (!clash)
        return;
    throw Misfit{
        clash->place == Clash::JournalFile
            ? PositionOf("journal", root)
            : PositionOf(clash->place == Clash::In ? "in" : "out", reading.folders[clash->folder]),
        clash->what};
}

/// A queue takes the place of the journal.
void TakeQueue(Value root, Reading& reading) {
    for (const ConfigurationValue& value : root.Values()) {
        const bool isQueues = value.Key() == "map" || value.Key() == "lease";
        if (isQueues && reading.queue.empty())
            throw Misfit{value.KeyAt(),
                         wxString::Format(_("\"%s\" is of use with a \"queue\" only"),
                                          wxString::FromUTF8(value.Key()))};
        if (value.Key() == "journal" && !reading.queue.empty())
            throw Misfit{value.KeyAt(), _("there is a \"queue\", which takes the place of the "
                                          "\"journal\"; keep one of them")};
    }
    if (!reading.queue.empty())
        reading.watch.journal = reading.queue;
}

WatchConfiguration Read(const std::string& bytes, const fs::path& base, FoldersNeed need) {
    const toml::table table = toml::parse(bytes);
    const ConfigurationValue root(table);
    Reading reading{base};
    for (const ConfigurationValue& value : root.Values())
        if (value.Key() == "defaults")
            ReadTable(value, DefaultsKeys, reading);
    ReadTable(root, RootKeys, reading);
    TakeQueue(root, reading);
    if (reading.watch.folders.empty() && need == FoldersNeed::Some)
        throw Misfit{{1, 1}, _("there is no folder to watch; add one, as [[folder]]")};
    CheckPlaces(root, reading);
    return reading.watch;
}

} // namespace

FolderConfiguration StandardFolderConfiguration() {
    FolderConfiguration folder;
    folder.retries = {30s, 5min, 30min};
    folder.keepProcessed = 24h * 14;
    return folder;
}

WatchConfiguration StandardWatchConfiguration() {
    constexpr std::uintmax_t Gigabyte = 1 << 30;
    WatchConfiguration watch;
    watch.journal = StandardJournal();
    watch.http = "127.0.0.1:9188";
    watch.minFree = Gigabyte;
    return watch;
}

std::chrono::milliseconds SettleTime(const FolderConfiguration& folder, bool isOnShare) {
    return folder.settle.value_or(isOnShare ? 10s : 2s);
}

std::optional<WatchConfiguration> ReadWatchConfiguration(const fs::path& file, Fault& fault,
                                                         FoldersNeed need) {
    std::optional<std::string> bytes = ReadBounded(file, fault);
    if (bytes && !bytes->empty() && wxString::FromUTF8(*bytes).empty()) {
        fault = {_("it is not valid UTF-8 text"), Blame::Usage};
        bytes.reset();
    }
    if (!bytes) {
        fault.what =
            wxString::Format(_("the configuration %s cannot be used: %s"), Shown(file), fault.what);
        return std::nullopt;
    }
    const auto tell = [&](const FilePosition& at, const wxString& what) {
        fault = {wxString::Format("%s:%u:%u: %s", Shown(file), unsigned{at.line},
                                  unsigned{at.column}, what),
                 Blame::Usage};
    };
    try {
        std::error_code ignored;
        return Read(*bytes, fs::absolute(file, ignored).parent_path(), need);
    } catch (const Misfit& misfit) {
        tell(misfit.at, misfit.what);
    } catch (const toml::parse_error& error) {
        tell(error.source().begin, wxString::FromUTF8(std::string(error.description())));
    }
    return std::nullopt;
}
