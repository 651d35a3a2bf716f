#include "host/program/watch/FreeSpace.h"

#include "host/program/base/PathText.h"

#include <wx/filename.h>
#include <wx/intl.h>

namespace fs = std::filesystem;

namespace {

wxString SizeText(std::uintmax_t bytes) {
    return wxFileName::GetHumanReadableSize(wxULongLong(bytes), "0 B", 1, wxSIZE_CONV_SI);
}

} // namespace

Fault NoSpaceIn(const fs::path& folder, std::uintmax_t free, std::uintmax_t wanted) {
    return {wxString::Format(_("no space in %s: %s are free, and at least %s are wanted"),
                             Shown(folder), SizeText(free), SizeText(wanted)),
            Blame::Machine, ConversionFailed, _("Make room there, or set min_free")};
}

std::optional<Fault> FindShortage(const std::vector<fs::path>& folders, std::uintmax_t wanted) {
    for (const fs::path& folder : folders) {
        std::error_code error;
        const fs::space_info space = fs::space(folder, error);
        if (!error && space.available < wanted)
            return NoSpaceIn(folder, space.available, wanted);
    }
    return std::nullopt;
}
