#include "host/program/watch/FolderPlaces.h"

#include "host/program/base/PathText.h"

#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;

namespace {

/// As far as the path is there.
fs::path Real(const fs::path& path) {
    std::error_code error;
    fs::path real = fs::weakly_canonical(path, error);
    return error ? path : real;
}

std::optional<wxString> ClashOfInput(const FolderConfiguration& folder,
                                     const FolderConfiguration& other) {
    if (LiesIn(other.in, folder.in) && LiesIn(folder.in, other.in))
        return wxString::Format(_("in: the folder \"%s\" has the same one"), other.name);
    if (LiesIn(folder.in, other.in))
        return wxString::Format(
            _("in: it lies in that of the folder \"%s\", which would take the same documents"),
            other.name);
    return std::nullopt;
}

} // namespace

bool LiesIn(const fs::path& path, const fs::path& folder) {
    const fs::path inner = Real(path);
    const fs::path outer = Real(folder);
    if (std::mismatch(outer.begin(), outer.end(), inner.begin(), inner.end()).first == outer.end())
        return true;
    // The same folder may have names that differ: by case, or by being mounted twice.
    std::error_code ignored;
    for (fs::path each = inner; each.has_relative_path(); each = each.parent_path())
        if (fs::equivalent(each, outer, ignored))
            return true;
    return false;
}

std::optional<Clash> FindClash(const WatchConfiguration& configuration) {
    const auto& folders = configuration.folders;
    for (std::size_t i = 0; i < folders.size(); ++i)
        for (std::size_t k = 0; k < folders.size(); ++k) {
            if (k != i)
                if (const auto what = ClashOfInput(folders[i], folders[k]))
                    return Clash{i, Clash::In, *what};
            if (LiesIn(folders[i].out, folders[k].in))
                return Clash{
                    i, Clash::Out,
                    wxString::Format(_("out: it lies in what the folder \"%s\" watches, which "
                                       "would take the output as documents"),
                                     folders[k].name)};
        }
    const fs::path journal = FromArgument(configuration.journal);
    for (std::size_t i = 0; i < folders.size(); ++i)
        if (LiesIn(journal, folders[i].in))
            return Clash{i, Clash::JournalFile,
                         wxString::Format(_("journal: it lies in what the folder \"%s\" watches"),
                                          folders[i].name)};
    return std::nullopt;
}
