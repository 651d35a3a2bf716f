#include "host/program/base/BoundedFile.h"

#include <wx/intl.h>

#include <fstream>

namespace fs = std::filesystem;

namespace {

constexpr std::uintmax_t LargestFile = 1 << 20;

/// @return why this cannot be a settings file; empty when it is a file
wxString FindFaultOf(const fs::file_status& status) {
    if (!fs::exists(status))
        return _("there is no such file");
    if (fs::is_directory(status))
        return _("it is a folder; name a file in it");
    return fs::is_regular_file(status) ? wxString() : _("it is a device or a pipe, not a file");
}

} // namespace

std::optional<std::string> ReadBounded(const fs::path& file, Fault& fault) {
    std::error_code error;
    fault = {FindFaultOf(fs::status(file, error)), Blame::Usage};
    if (!fault.what.empty())
        return std::nullopt;
    const std::uintmax_t size = fs::file_size(file, error);
    if (!error && size > LargestFile) {
        fault.what = wxString::Format(_("it is larger than %ju KiB, too much for settings"),
                                      LargestFile / 1024);
        return std::nullopt;
    }
    std::string bytes(error ? 0 : size, '\0');
    std::ifstream stream(file, std::ios::binary);
    if (!stream.read(bytes.data(), static_cast<std::streamsize>(bytes.size()))) {
        fault.what = _("it cannot be read");
        return std::nullopt;
    }
    return bytes;
}
