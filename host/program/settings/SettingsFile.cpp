#include "host/program/settings/SettingsFile.h"

#include "host/program/base/PathText.h"
#include "host/program/settings/Settings.h"

#include <wx/file.h>
#include <wx/filename.h>
#include <wx/intl.h>
#include <wx/utils.h>

#include <cerrno>

namespace fs = std::filesystem;

namespace {

wxString LastError() {
    return Because({errno, std::generic_category()});
}

/// Writes a new file, down to the disk.
/// @return why it is not there; empty when it is
wxString WriteNew(const fs::path& path, const std::string& bytes) {
    errno = 0;
    wxFile file;
    if (!file.Create(ToText(path), false) ||
        file.Write(bytes.data(), bytes.size()) != bytes.size() || !file.Flush() || !file.Close())
        return LastError();
    return {};
}

wxString Replace(const fs::path& file, const std::string& bytes) {
    std::error_code error;
    const bool exists = fs::exists(file, error);
    if (exists && !wxFileName::IsFileWritable(ToText(file)))
        return _("it is write-protected");
    const fs::path newFile =
        file.parent_path() / FromText(wxString::Format(".quillon-settings-%lu", wxGetProcessId()));
    wxString obstacle = WriteNew(newFile, bytes);
    if (obstacle.empty() && exists)
        fs::permissions(newFile, fs::status(file, error).permissions(), error);
    if (obstacle.empty()) {
        fs::rename(newFile, file, error);
        if (error)
            obstacle = Because(error);
    }
    if (!obstacle.empty())
        fs::remove(newFile, error);
    return obstacle;
}

} // namespace

std::optional<Fault> StoreSettings(const fs::path& file, const SettingsValues& values) {
    // A link stays one: it is its file that is written.
    std::error_code error;
    const fs::path target = fs::weakly_canonical(fs::absolute(file, error), error);
    if (error)
        return Fault{Because(error), Blame::Machine};
    Fault fault;
    std::optional<Settings> settings = Settings::LoadForEditing(target, fault);
    if (!settings)
        return fault;
    for (const auto& [key, value] : values)
        if (settings->Value(key) != value || value.empty())
            settings->Set(key, value);
    const wxString obstacle = Replace(target, settings->Xml());
    return obstacle.empty() ? std::nullopt : std::optional(Fault{obstacle, Blame::Machine});
}
