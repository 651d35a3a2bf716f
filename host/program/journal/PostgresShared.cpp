#include "host/program/journal/PostgresShared.h"

#include "host/program/journal/PostgresRow.h"

#include <nlohmann/json.hpp>

using nlohmann::json;

namespace {

json JsonOf(const Machine& machine) {
    const PageMakers& makers = machine.makers;
    return {{"finds", machine.finds},
            {"jobs", machine.jobs},
            {"program", makers.program.utf8_string()},
            {"office", makers.office.utf8_string()},
            {"pdf", makers.pdf.utf8_string()},
            {"fonts", makers.fonts.utf8_string()},
            {"any_version", machine.takesAnyVersion},
            {"cannot", machine.cannot},
            {"running", machine.running},
            {"obstacle", machine.obstacle.utf8_string()}};
}

/// What it does not say, as another version may not, stays as it is. Throws JSON's errors.
void ReadReport(const json& report, Machine& machine) {
    const auto text = [&report](const char* name) {
        return wxString::FromUTF8(report.value(name, std::string()));
    };
    machine.finds = report.value("finds", machine.finds);
    machine.jobs = report.value("jobs", machine.jobs);
    machine.makers = {text("program"), text("office"), text("pdf"), text("fonts")};
    machine.takesAnyVersion = report.value("any_version", machine.takesAnyVersion);
    machine.cannot = report.value("cannot", machine.cannot);
    machine.running = report.value("running", machine.running);
    machine.obstacle = text("obstacle");
}

std::string TextOf(const json& value) {
    return value.dump(-1, ' ', false, json::error_handler_t::replace);
}

} // namespace

void PostgresShared::Announce(const std::vector<AnnouncedFolder>& folders, const wxString& finder,
                              const std::vector<wxString>& all) {
    json told = json::array();
    for (const AnnouncedFolder& folder : folders)
        told.push_back({{"folder", folder.name.utf8_string()},
                        {"configuration", folder.configuration},
                        {"settings", folder.settings}});
    json names = json::array();
    for (const wxString& name : all)
        names.push_back(name.utf8_string());
    m_connection.Run(
        "WITH taken_back AS (DELETE FROM announcement WHERE finder=$2 AND NOT folder = "
        "ANY (ARRAY(SELECT json_array_elements_text($3::json)))) "
        "INSERT INTO announcement AS known (folder, configuration, settings, finder) "
        "SELECT folder, configuration, settings, $2 FROM json_to_recordset($1::json) "
        "AS told(folder text, configuration text, settings text) "
        "ON CONFLICT (folder) DO UPDATE SET configuration=excluded.configuration, "
        "settings=excluded.settings, finder=excluded.finder WHERE "
        "(known.configuration, known.settings, known.finder) <> "
        "(excluded.configuration, excluded.settings, excluded.finder)",
        TextOf(told), finder, TextOf(names));
}

std::vector<AnnouncedFolder> PostgresShared::Announced() {
    std::vector<AnnouncedFolder> folders;
    for (const pqxx::row& row : m_connection.Run("SELECT folder, configuration, settings FROM "
                                                 "announcement ORDER BY folder COLLATE \"C\""))
        folders.push_back({wxString::FromUTF8(row[0].c_str()), row[1].c_str(), row[2].c_str()});
    return folders;
}

void PostgresShared::Report(const Machine& machine, const Claimant& claimant) {
    m_connection.Run("WITH forgotten AS "
                     "(DELETE FROM machine WHERE seen < now() - interval '1 day' AND name <> $1) "
                     "INSERT INTO machine VALUES "
                     "($1, $2, now(), now(), make_interval(secs => $3)) ON CONFLICT (name) "
                     "DO UPDATE SET report=excluded.report, seen=excluded.seen, "
                     "lease=excluded.lease",
                     machine.name, TextOf(JsonOf(machine)),
                     static_cast<double>(claimant.lease.count()));
}

void PostgresShared::TakeLeave(const wxString& machine) {
    m_connection.Run("DELETE FROM machine WHERE name=$1", machine);
}

std::vector<Machine> PostgresShared::Machines() {
    const pqxx::result rows = m_connection.Run(
        "SELECT name, report, microseconds_of(started), microseconds_of(seen), "
        "(seen + lease >= now())::int AS alive FROM machine ORDER BY alive DESC, started, name");
    std::vector<Machine> machines;
    const PathMap noMap;
    for (const pqxx::row& each : rows) {
        PostgresRow row(each, noMap);
        Machine machine;
        machine.name = row.Text();
        try {
            ReadReport(json::parse(row.Bytes()), machine);
        } catch (const json::exception& error) {
            throw JournalError(error.what());
        }
        machine.started = row.Time();
        machine.seen = row.Time();
        machine.isAlive = row.Integer() != 0;
        machines.push_back(std::move(machine));
    }
    return machines;
}
