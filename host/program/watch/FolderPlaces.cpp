#include "host/program/watch/FolderPlaces.h"

#include "host/program/base/PathText.h"
#include "host/program/journal/Journal.h"
#include "host/program/system/FileIdentity.h"

#include <wx/intl.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace fs = std::filesystem;

namespace {

/// A place with all that it lies in, looked at once: on a share each look takes its time.
class Place {
public:
    explicit Place(const fs::path& path) {
        std::error_code error;
        m_real = fs::weakly_canonical(path, error); // as far as it is there
        if (error)
            m_real = path;
        for (fs::path each = m_real; each.has_relative_path(); each = each.parent_path()) {
            const FileIdentity identity = LookAt(each, error).identity;
            m_chain.emplace_back(identity.device, error ? 0 : identity.number);
        }
    }

    bool LiesIn(const Place& other) const {
        if (std::mismatch(other.m_real.begin(), other.m_real.end(), m_real.begin(), m_real.end())
                .first == other.m_real.end())
            return true;
        // The same folder may have names that differ: by case, or by being mounted twice.
        return !other.m_chain.empty() && other.m_chain.front().second != 0 &&
               std::find(m_chain.begin(), m_chain.end(), other.m_chain.front()) != m_chain.end();
    }

private:
    fs::path m_real;
    std::vector<std::pair<std::uint64_t, std::uint64_t>> m_chain; ///< devices and numbers upwards
};

std::vector<Place> PlacesOf(const std::vector<FolderConfiguration>& folders,
                            fs::path FolderConfiguration::*place) {
    std::vector<Place> places;
    places.reserve(folders.size());
    for (const FolderConfiguration& folder : folders)
        places.emplace_back(folder.*place);
    return places;
}

} // namespace

std::optional<Clash> FindClash(const WatchConfiguration& configuration) {
    const auto& folders = configuration.folders;
    const std::vector<Place> ins = PlacesOf(folders, &FolderConfiguration::in);
    const std::vector<Place> outs = PlacesOf(folders, &FolderConfiguration::out);
    const Place journal(IsQueueUrl(configuration.journal) ? fs::path()
                                                          : FromArgument(configuration.journal));
    const auto clash = [&](std::size_t folder, Clash::Place place, const wxString& format,
                           std::size_t other) {
        return Clash{folder, place, wxString::Format(format, folders[other].name)};
    };
    for (std::size_t i = 0; i < folders.size(); ++i)
        for (std::size_t k = 0; k < folders.size(); ++k) {
            if (k != i && ins[i].LiesIn(ins[k]))
                return clash(i, Clash::In,
                             ins[k].LiesIn(ins[i])
                                 ? _("in: the folder \"%s\" has the same one")
                                 : _("in: it lies in that of the folder \"%s\", which would take "
                                     "the same documents"),
                             k);
            if (outs[i].LiesIn(ins[k]))
                return clash(i, Clash::Out,
                             _("out: it lies in what the folder \"%s\" watches, which would take "
                               "the output as documents"),
                             k);
        }
    for (std::size_t i = 0; i < folders.size(); ++i)
        if (journal.LiesIn(ins[i]))
            return clash(i, Clash::JournalFile,
                         _("journal: it lies in what the folder \"%s\" watches"), i);
    return std::nullopt;
}
