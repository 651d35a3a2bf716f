#include "host/program/watch/Quantities.h"

#include <algorithm>
#include <cstring>
#include <iterator>
#include <limits>

namespace {

struct Unit {
    const char* name;
    std::uintmax_t factor;
};

// From the smallest to the largest.
constexpr Unit Times[] = {{"ms", 1}, {"s", 1000}, {"m", 60000}, {"h", 3600000}, {"d", 86400000}};
constexpr Unit Sizes[] = {
    {"", 1}, {"K", 1U << 10U}, {"M", 1U << 20U}, {"G", 1U << 30U}, {"T", std::uintmax_t{1} << 40U}};

constexpr auto Most = static_cast<std::uintmax_t>(std::numeric_limits<std::int64_t>::max());

template <std::size_t Count>
std::optional<std::uintmax_t> Parse(const wxString& text, const Unit (&units)[Count]) {
    const std::string word = text.utf8_string();
    const auto digits = static_cast<std::size_t>(
        std::find_if_not(word.begin(), word.end(), [](char c) { return c >= '0' && c <= '9'; }) -
        word.begin());
    const Unit* const unit =
        std::find_if(std::begin(units), std::end(units), [&](const Unit& each) {
            return word.compare(digits, std::string::npos, each.name) == 0;
        });
    wxULongLong_t number = 0;
    if (digits == 0 || unit == std::end(units) || !text.Left(digits).ToULongLong(&number) ||
        number > Most / unit->factor)
        return std::nullopt;
    return number * unit->factor;
}

template <std::size_t Count>
wxString Text(std::uintmax_t number, const Unit (&units)[Count]) {
    const Unit* unit = std::end(units) - 1;
    while (unit != units && (number == 0 || number % unit->factor != 0))
        --unit;
    return std::to_string(number / unit->factor) + unit->name;
}

} // namespace

std::optional<std::chrono::milliseconds> ParseTime(const wxString& text) {
    const std::optional<std::uintmax_t> time = Parse(text, Times);
    return time ? std::optional(std::chrono::milliseconds(*time)) : std::nullopt;
}

std::optional<std::uintmax_t> ParseSize(const wxString& text) {
    return Parse(text, Sizes);
}

wxString TimeText(std::chrono::milliseconds time) {
    return Text(static_cast<std::uintmax_t>(time.count()), Times);
}

wxString SizeText(std::uintmax_t bytes) {
    return Text(bytes, Sizes);
}
