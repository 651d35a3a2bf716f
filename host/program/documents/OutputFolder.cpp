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

fs::path WithoutSeparatorAtEnd(const fs::path& path) {
    return path.has_filename() || path == path.root_path() ? path : path.parent_path();
}

} // namespace

std::optional<OutputFolder> OutputFolder::Open(const fs::path& path, wxString& fault) {
    std::error_code error;
    const fs::path folder = WithoutSeparatorAtEnd(fs::absolute(path, error).lexically_normal());
    if (error || !ToText(folder)) {
        fault = _("its name is not valid UTF-8 text");
        return std::nullopt;
    }
    if (!fs::is_directory(folder, error)) {
        if (fs::exists(folder, error))
            fault = _("it is a file, not a folder");
        else if (!fs::is_directory(folder.parent_path(), error))
            fault = _("the folder above it does not exist either; create that first");
        else if (!fs::create_directory(folder, error) ||
                 (error = SyncFolder(folder.parent_path()))) // or it is lost with what is in it
            fault = wxString::Format(_("it cannot be created: %s"), Because(error));
    } else if (!wxFileName::IsDirWritable(*ToText(folder))) {
        fault = _("nothing can be written to it; choose another one or change its permissions");
    }
    if (!fault.empty())
        return std::nullopt;
    return OutputFolder(folder);
}

wxString OutputFolder::Allot(const wxString& fileName) {
    wxString name = wxFileName(fileName).GetName();
    for (int number = 1; !m_allotted.insert(name.Lower()).second; ++number)
        name = number == 1 ? fileName : wxString::Format("%s (%d)", fileName, number);
    return name;
}

bool OutputFolder::IsFull() const {
    std::error_code error;
    const fs::path temporary = fs::temp_directory_path(error);
    return !HasRoom(m_path) || (!error && !HasRoom(temporary));
}
