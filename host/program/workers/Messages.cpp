#include "host/program/workers/Messages.h"

#include "host/program/base/PathText.h"

#include <limits>
#include <nlohmann/json.hpp>
#include <stdexcept>

namespace {

using nlohmann::json;

/// Runs `make` on the line's JSON.
template <typename Message, typename Make>
std::optional<Message> Decode(const std::string& line, Make make) {
    try {
        const json message = json::parse(line);
        return make(message);
    } catch (const std::exception&) {
        return std::nullopt;
    }
}

/// A whole number. Nothing else is taken for one: no fraction cut off, no truth counted.
int NumberOf(const json& value) {
    const auto number = value.get<double>(); // exact where it matters
    if (!value.is_number_integer() || number < std::numeric_limits<int>::min() ||
        number > std::numeric_limits<int>::max())
        throw std::invalid_argument("no whole number");
    return static_cast<int>(number);
}

/// @param last of the enumeration's values, which begin with 0
template <typename Enumeration>
Enumeration ValueOf(const json& value, Enumeration last) {
    const int number = NumberOf(value);
    if (number < 0 || number > static_cast<int>(last))
        throw std::invalid_argument("no such value");
    return static_cast<Enumeration>(number);
}

wxString TextOf(const json& value) {
    return wxString::FromUTF8(value.get<std::string>());
}

std::filesystem::path PathOf(const json& value) {
    return FromArgument(value.get<std::string>());
}

json ToJson(const std::vector<FontStandIn>& fonts) {
    json values = json::array();
    for (const FontStandIn& font : fonts)
        values.push_back(
            json::array({font.asked.utf8_string(), font.used.utf8_string(), font.hasSameMetrics}));
    return values;
}

json ToJson(const Fault& fault) {
    return {{"what", fault.what.utf8_string()},
            {"blame", static_cast<int>(fault.blame)},
            {"code", fault.code},
            {"advice", fault.advice.utf8_string()}};
}

json ToJson(const Outcome& outcome) {
    return {{"input", outcome.input.u8string()},
            {"made", outcome.made.u8string()},
            {"state", static_cast<int>(outcome.state)},
            {"fault", outcome.fault ? ToJson(*outcome.fault) : json()},
            {"text", outcome.text.utf8_string()},
            {"seconds", outcome.seconds.value_or(0)},
            {"fonts", ToJson(outcome.fonts)}};
}

std::vector<FontStandIn> FontsOf(const json& values) {
    std::vector<FontStandIn> fonts;
    for (const json& font : values)
        fonts.push_back({TextOf(font.at(0)), TextOf(font.at(1)), font.at(2).get<bool>()});
    return fonts;
}

Fault FaultOf(const json& value) {
    return {TextOf(value.at("what")), ValueOf(value.at("blame"), Blame::Usage),
            NumberOf(value.at("code")), TextOf(value.at("advice"))};
}

Outcome OutcomeOf(const json& value) {
    Outcome outcome;
    outcome.input = PathOf(value.at("input"));
    outcome.made = PathOf(value.at("made"));
    outcome.state = ValueOf(value.at("state"), State::Changed);
    if (const json& fault = value.at("fault"); !fault.is_null())
        outcome.fault = FaultOf(fault);
    outcome.text = TextOf(value.at("text"));
    outcome.seconds = value.at("seconds").get<double>();
    outcome.fonts = FontsOf(value.at("fonts"));
    return outcome;
}

/// A text that has half a surrogate pair in it is told with a mark in its place.
std::string LineOf(const json& message) {
    return message.dump(-1, ' ', false, json::error_handler_t::replace);
}

} // namespace

std::string Encode(const Assignment& assignment) {
    json message = {{"given", assignment.input.given.u8string()},
                    {"full", assignment.input.full.u8string()},
                    {"named", assignment.input.named},
                    {"workplace", assignment.workplace.u8string()},
                    {"settings", assignment.settings},
                    {"engineDocuments", assignment.engineDocuments},
                    {"asItIs", assignment.asItIs},
                    {"digest", assignment.digest}};
    if (assignment.language)
        message["language"] = *assignment.language;
    if (assignment.identity)
        message["identity"] = {assignment.identity->device, assignment.identity->number,
                               assignment.identity->size, assignment.identity->modified};
    return LineOf(message);
}

std::string Encode(const News& news) {
    json message = {{"step", news.step.utf8_string()}, {"percent", news.percent}};
    if (news.outcome)
        message["outcome"] = ToJson(*news.outcome);
    return LineOf(message);
}

std::optional<Assignment> DecodeAssignment(const std::string& line) {
    return Decode<Assignment>(line, [](const json& message) {
        Assignment assignment;
        assignment.input = {PathOf(message.at("given")), PathOf(message.at("full")),
                            message.at("named")};
        assignment.workplace = PathOf(message.at("workplace"));
        assignment.settings = message.at("settings");
        assignment.engineDocuments = message.at("engineDocuments");
        assignment.asItIs = message.at("asItIs");
        assignment.digest = message.at("digest");
        if (message.contains("language"))
            assignment.language = message["language"];
        if (message.contains("identity")) {
            const json& identity = message["identity"];
            assignment.identity = {identity.at(0), identity.at(1), identity.at(2), identity.at(3)};
        }
        return assignment;
    });
}

std::optional<News> DecodeNews(const std::string& line) {
    return Decode<News>(line, [](const json& message) {
        News news{TextOf(message.at("step")), NumberOf(message.at("percent")), std::nullopt};
        if (message.contains("outcome"))
            news.outcome = OutcomeOf(message["outcome"]);
        return news;
    });
}
