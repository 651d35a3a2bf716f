#include "host/program/watch/WatchConfiguration.h"

#include "host/program/base/BoundedFile.h"
#include "host/program/base/PathText.h"
#include "host/program/journal/Journal.h"
#include "host/program/watch/ConfigurationValue.h"
#include "host/program/watch/FolderPlaces.h"
#include "host/program/workers/WorkerCount.h"

#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

using Value = const ConfigurationValue&;

/// A configuration that is being read.
struct Reading {
    fs::path base; ///< what its paths are relative to
    WatchConfiguration watch = StandardWatchConfiguration();
    FolderConfiguration defaults = StandardFolderConfiguration();
    std::vector<ConfigurationValue> folders{}; ///< those of the configuration
    std::string queue{};
};

/// Where the value with a key stands, or the table that has none.
FilePosition PositionOf(const char* key, Value table) {
    for (const ConfigurationValue& value : table.Values())
        if (value.Key() == key)
            return value.At();
    return table.At();
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
        shares[value.Key()] = value.Path(reading.base);
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

void ReadFolders(Value list, Reading& reading) {
    reading.folders = list.Parts();
    std::vector<FolderConfiguration>& folders = reading.watch.folders;
    for (const ConfigurationValue& table : reading.folders) {
        FolderConfiguration folder = ReadFolder(table, reading.defaults, reading.base);
        if (std::any_of(folders.begin(), folders.end(),
                        [&folder](const auto& other) { return other.name == folder.name; }))
            throw Misfit{
                PositionOf("name", table),
                wxString::Format(_("there is another folder with the name \"%s\"; give each "
                                   "its own \"name\""),
                                 folder.name)};
        folders.push_back(std::move(folder));
    }
}

// clang-format off
const KeyReaders<Reading> RootKeys = {
    {"defaults", [](Value, Reading&) {}}, // what they are is read before all others
    {"folder", ReadFolders},
    {"http", [](Value value, Reading& r) { r.watch.http = ReadAddress(value); }},
    {"jobs", [](Value value, Reading& r) { r.watch.jobs = static_cast<unsigned>(value.Number(0, MostWorkers)); }},
    {"journal", [](Value value, Reading& r) { r.watch.journal = value.Path(r.base).u8string(); }},
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
            ReadDefaults(value, reading.defaults, reading.watch.minFree);
    ReadTable(root, RootKeys, reading);
    TakeQueue(root, reading);
    if (reading.watch.folders.empty() && need == FoldersNeed::Some)
        throw Misfit{{1, 1}, _("there is no folder to watch; add one, as [[folder]]")};
    CheckPlaces(root, reading);
    return reading.watch;
}

} // namespace

WatchConfiguration StandardWatchConfiguration() {
    constexpr std::uintmax_t Gigabyte = 1 << 30;
    WatchConfiguration watch;
    watch.journal = StandardJournal();
    watch.http = "127.0.0.1:9188";
    watch.minFree = Gigabyte;
    return watch;
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
