#include "host/program/documents/OutputFolder.h"

#include "host/program/base/PathText.h"
#include "host/program/system/DurableMove.h"

#include <wx/filename.h>
#include <wx/intl.h>

namespace fs = std::filesystem;

namespace {

constexpr std::uintmax_t NextToNothing = 256 << 10; // bytes

/// A file system that cannot be asked counts as having room.
bool HasRoom(const fs::path& folder) {
    std::error_code error;
    const fs::space_info space = fs::space(folder, error);
    return error || space.available > NextToNothing;
}

/// Absolute, without a separator at its end.
/// @return empty when there is no such path
fs::path Normal(const fs::path& path) {
    std::error_code error;
    const fs::path folder = fs::absolute(path, error).lexically_normal();
    if (error || !IsText(folder))
        return {};
    return folder.has_filename() || folder == folder.root_path() ? folder : folder.parent_path();
}

/// @return why there is no such folder; empty when it has been made
wxString Make(const fs::path& folder) {
    std::error_code error;
    if (!fs::create_directory(folder, error) ||
        (error = SyncFolder(folder.parent_path()))) // or it is lost with what is in it
        return wxString::Format(_("it cannot be created: %s"), Because(error));
    return {};
}

} // namespace

std::optional<OutputFolder> OutputFolder::Open(const fs::path& path, Fault& fault) {
    const fs::path folder = Normal(path);
    std::error_code error;
    wxString obstacle = FindObstacle(folder);
    if (obstacle.empty() && !fs::is_directory(folder, error))
        obstacle = Make(folder);
    if (obstacle.empty())
        return OutputFolder(folder);
    fault = {obstacle, Blame::Usage};
    return std::nullopt;
}

wxString OutputFolder::FindObstacle(const fs::path& path) {
    const fs::path folder = Normal(path);
    std::error_code error;
    if (folder.empty())
        return _("its name is not valid UTF-8 text");
    const fs::path parent = folder.parent_path();
    if (!fs::exists(folder, error) && !fs::is_directory(parent, error))
        return _("the folder above it does not exist either; create that first");
    if (!fs::exists(folder, error))
        return wxFileName::IsDirWritable(ToText(parent))
                   ? wxString()
                   : _("nothing can be written to the folder above it");
    if (!fs::is_directory(folder, error))
        return _("it is a file, not a folder");
    return wxFileName::IsDirWritable(ToText(folder))
               ? wxString()
               : _("nothing can be written to it; choose another one or change its permissions");
}

wxString OutputFolder::Allot(const wxString& fileName) {
    wxString name = wxFileName(fileName).GetName();
    for (int number = 1; !m_allotted.insert(name.Lower()).second; ++number)
        name = number == 1 ? fileName : wxString::Format("%s (%d)", fileName, number);
    return name;
}

bool IsFull(const fs::path& folder) {
    std::error_code error;
    const fs::path temporary = fs::temp_directory_path(error);
    return !HasRoom(folder) || (!error && !HasRoom(temporary));
}
