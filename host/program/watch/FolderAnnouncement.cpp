#include "host/program/watch/FolderAnnouncement.h"

#include "host/program/settings/RunSettings.h"

#include <wx/intl.h>

#include <nlohmann/json.hpp>

namespace {

using nlohmann::json;

json ToJson(const PrintConfiguration& print) {
    return {{"server", print.ticket.server.utf8_string()},
            {"queue", print.ticket.queue.utf8_string()},
            {"options", print.ticket.options},
            {"keep", print.keepsFiles},
            {"printsLost", print.printsLost},
            {"mostQueued", print.mostQueued}};
}

PrintConfiguration PrintingOf(const json& value) {
    PrintConfiguration print;
    print.ticket.server = wxString::FromUTF8(value.at("server").get<std::string>());
    print.ticket.queue = wxString::FromUTF8(value.at("queue").get<std::string>());
    print.ticket.options = value.at("options").get<std::map<std::string, std::string>>();
    print.keepsFiles = value.at("keep");
    print.printsLost = value.at("printsLost");
    print.mostQueued = value.at("mostQueued");
    return print;
}

/// What the one who finds documents needs alone is left out.
json ToJson(const FolderConfiguration& folder, const PathMap& map) {
    json value = {{"in", map.ToShared(folder.in)}, {"out", map.ToShared(folder.out)},
                  {"set", folder.assignments},     {"priority", folder.priority},
                  {"byName", folder.byName},       {"onSameName", folder.onSameName},
                  {"others", folder.others},       {"retries", json::array()}};
    for (const std::chrono::seconds delay : folder.retries)
        value["retries"].push_back(delay.count());
    if (folder.language)
        value["language"] = *folder.language;
    if (folder.print)
        value["print"] = ToJson(*folder.print);
    return value;
}

/// @param last of the enumeration's values, which begin with 0
template <typename Enumeration>
Enumeration ValueOf(const json& value, Enumeration last) {
    const auto number = value.get<unsigned>();
    if (number > static_cast<unsigned>(last))
        throw std::invalid_argument("no such value");
    return static_cast<Enumeration>(number);
}

FolderConfiguration FromJson(const json& value, const PathMap& map) {
    FolderConfiguration folder = StandardFolderConfiguration();
    folder.in = map.ToLocal(value.at("in"));
    folder.out = map.ToLocal(value.at("out"));
    folder.assignments = value.at("set").get<std::vector<std::string>>();
    folder.priority = value.at("priority");
    folder.byName = value.at("byName");
    folder.onSameName = ValueOf(value.at("onSameName"), OnSameName::Replace);
    folder.others = ValueOf(value.at("others"), Others::Pass);
    folder.retries.clear();
    for (const json& delay : value.at("retries"))
        folder.retries.emplace_back(delay.get<std::chrono::seconds::rep>());
    if (value.contains("language"))
        folder.language = value["language"];
    if (value.contains("print"))
        folder.print = PrintingOf(value["print"]);
    return folder;
}

Fault NoShare(const std::string& path) {
    return {wxString::Format(_("this machine has no folder for the share \"%s\""),
                             wxString::FromUTF8(path.substr(0, path.find(':')))),
            Blame::Usage, ConversionFailed,
            _("Name it with --map SHARE=DIR, or in the configuration below [map]")};
}

} // namespace

std::optional<AnnouncedFolder> AnnouncementOf(const FolderConfiguration& folder, const PathMap& map,
                                              Fault& fault) {
    AnnouncedFolder announced;
    announced.name = folder.name;
    announced.configuration = ToJson(folder, map).dump();
    if (!folder.settings)
        return announced;
    const std::optional<Settings> settings = Settings::Load(*folder.settings, fault);
    if (!settings) {
        fault = UnusableSettings(*folder.settings, fault);
        return std::nullopt;
    }
    announced.settings = settings->Xml();
    return announced;
}

std::optional<FolderConfiguration> FolderOf(const AnnouncedFolder& announced, const PathMap& map,
                                            Fault& fault) {
    try {
        const json value = json::parse(announced.configuration);
        for (const char* const place : {"in", "out"})
            if (const std::string path = value.at(place); !map.Has(path)) {
                fault = NoShare(path);
                return std::nullopt;
            }
        FolderConfiguration folder = FromJson(value, map);
        folder.name = announced.name;
        folder.isOthers = true;
        if (!announced.settings.empty())
            folder.settingsText = announced.settings;
        return folder;
    } catch (const std::exception&) { // by another version, or another's hand
        fault = {_("what is said of it in the queue cannot be understood; it may be a later "
                   "version's"),
                 Blame::Usage};
        return std::nullopt;
    }
}
