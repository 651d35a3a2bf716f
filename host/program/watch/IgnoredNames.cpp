#include "host/program/watch/IgnoredNames.h"

#include <algorithm>
#include <string_view>

namespace {

constexpr std::string_view Beginnings[] = {".", "~$", "._"};
constexpr std::string_view Endings[] = {".tmp",        ".part", ".partial", ".filepart",
                                        ".crdownload", ".swp",  ".lock"};
constexpr std::string_view Whole[] = {"thumbs.db", "desktop.ini", "@eadir"};

std::string Lower(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(), [](unsigned char c) {
        return static_cast<char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
    });
    return text;
}

template <typename Names, typename Matches>
bool Any(const Names& names, Matches matches) {
    return std::any_of(std::begin(names), std::end(names), matches);
}

} // namespace

bool IsIgnored(const std::string& name) {
    const std::string lower = Lower(name);
    const auto begins = [&lower](std::string_view text) { return lower.rfind(text, 0) == 0; };
    const auto ends = [&lower](std::string_view text) {
        return lower.size() >= text.size() &&
               lower.compare(lower.size() - text.size(), text.size(), text) == 0;
    };
    const auto is = [&lower](std::string_view text) { return lower == text; };
    return Any(Beginnings, begins) || Any(Endings, ends) || Any(Whole, is);
}

bool IsOpenIn(const std::string& name, const std::set<std::string>& names) {
    // An application that is short of letters puts its mark in the place of the first two.
    const std::string shortened = name.size() > 2 ? "~$" + name.substr(2) : name;
    return names.count("~$" + name) != 0 || names.count(".~lock." + name + '#') != 0 ||
           (shortened != name && names.count(shortened) != 0);
}
