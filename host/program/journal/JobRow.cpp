#include "host/program/journal/JobRow.h"

#include <algorithm>
#include <iterator>

namespace {

/// In the order of the values.
constexpr const char* Blames[] = {"document", "machine", "outside", "usage"};

} // namespace

const char* NameOf(Blame blame) {
    return Blames[static_cast<int>(blame)];
}

std::optional<Blame> BlameOf(const std::string& name) {
    const auto* const found = std::find(std::begin(Blames), std::end(Blames), name);
    if (found == std::end(Blames))
        return std::nullopt;
    return static_cast<Blame>(found - std::begin(Blames));
}
