#include "host/program/journal/PathMap.h"

namespace fs = std::filesystem;

namespace {

/// The rest of a path inside a folder, which it lies in or is itself.
/// @return false when it does not
bool IsInside(const fs::path& path, const fs::path& folder, fs::path& rest) {
    auto part = path.begin();
    for (const fs::path& name : folder) {
        if (name.empty()) // it ends with a separator
            break;
        if (part == path.end() || *part != name)
            return false;
        ++part;
    }
    for (; part != path.end(); ++part)
        rest /= *part;
    return true;
}

/// The length of the share's name in "office:/letters"; npos for a path that names none.
std::size_t LengthOfName(const std::string& shared) {
    const std::size_t colon = shared.find(":/");
    const bool isDrive = colon == 1;
    return isDrive || shared.find('/') < colon ? std::string::npos : colon;
}

} // namespace

std::string PathMap::ToShared(const fs::path& local) const {
    std::string shared = local.u8string();
    std::size_t longest = 0;
    for (const auto& [name, folder] : m_shares) {
        fs::path rest;
        const std::size_t length = folder.native().size();
        if (length <= longest || !IsInside(local, folder, rest))
            continue;
        longest = length; // one may be mounted inside another
        shared = name + ":/" + rest.generic_u8string();
    }
    return shared;
}

fs::path PathMap::ToLocal(const std::string& shared) const {
    const std::size_t length = LengthOfName(shared);
    const auto share =
        length == std::string::npos ? m_shares.end() : m_shares.find(shared.substr(0, length));
    if (share == m_shares.end())
        return fs::u8path(shared);
    const std::string rest = shared.substr(length + 2);
    return rest.empty() ? share->second : share->second / fs::u8path(rest);
}

bool PathMap::IsName(const std::string& name) {
    return name.size() > 1 && name.find_first_of("/:\\") == std::string::npos;
}

bool PathMap::Has(const std::string& shared) const {
    const std::size_t length = LengthOfName(shared);
    return length == std::string::npos || m_shares.count(shared.substr(0, length)) != 0;
}
