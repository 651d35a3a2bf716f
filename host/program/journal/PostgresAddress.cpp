#include "host/program/journal/PostgresAddress.h"

#include <wx/intl.h>

#include <libpq-fe.h>

#include <map>
#include <memory>

namespace {

std::map<std::string, std::string> StandardOptions() {
    return {{"client_encoding", "UTF8"},
            {"connect_timeout", "5"}, // seconds
            {"fallback_application_name", "quillon"},
            {"keepalives_count", "3"},
            {"keepalives_idle", "4"},
            {"keepalives_interval", "2"},
            {"tcp_user_timeout", "10000"}}; // milliseconds
}

std::string Quoted(const std::string& value) {
    std::string quoted = "'";
    for (const char each : value) {
        if (each == '\'' || each == '\\')
            quoted += '\\';
        quoted += each;
    }
    return quoted + '\'';
}

} // namespace

std::string ConnectionOptions(const std::string& url, Fault& fault) {
    const std::unique_ptr<PQconninfoOption, void (*)(PQconninfoOption*)> parsed(
        PQconninfoParse(url.c_str(), nullptr), PQconninfoFree);
    if (!parsed) {
        fault = {_("the address of the queue cannot be read"), Blame::Usage, ConversionFailed,
                 _("Write it as postgres://USER@SERVER/DATABASE; what is special in a name or a "
                   "password, as %40 for an @")};
        return {};
    }
    std::map<std::string, std::string> options = StandardOptions();
    for (const PQconninfoOption* option = parsed.get(); option->keyword; ++option)
        if (option->val)
            options[option->keyword] = option->val;
    std::string text;
    for (const auto& [name, value] : options)
        text.append(name).append("=").append(Quoted(value)).append(" ");
    return text;
}

bool AnswersAt(const std::string& options) {
    return PQping(options.c_str()) == PQPING_OK;
}
