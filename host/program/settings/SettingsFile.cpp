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

wxString LastFault() {
    return Because({errno, std::generic_category()});
}

/// Writes a new file, down to the disk.
wxString WriteNew(const fs::path& path, const std::string& bytes) {
    errno = 0;
    wxFile file;
    if (!file.Create(ToText(path).value_or(wxString()), false) ||
        file.Write(bytes.data(), bytes.size()) != bytes.size() || !file.Flush() || !file.Close())
        return LastFault();
    return {};
}

wxString Replace(const fs::path& file, const std::string& bytes) {
    std::error_code error;
    const bool exists = fs::exists(file, error);
    if (exists && !wxFileName::IsFileWritable(ToText(file).value_or(wxString())))
        return _("it is write-protected");
    const fs::path newFile =
        file.parent_path() / FromText(wxString::Format(".quillon-settings-%lu", wxGetProcessId()));
    wxString fault = WriteNew(newFile, bytes);
    if (fault.empty() && exists)
        fs::permissions(newFile, fs::status(file, error).permissions(), error);
    if (fault.empty()) {
        fs::rename(newFile, file, error);
        if (error)
            fault = Because(error);
    }
    if (!fault.empty())
        fs::remove(newFile, error);
    return fault;
}

} // namespace

wxString StoreSettings(const fs::path& file, const SettingsValues& values) {
    // A link stays one: it is its file that is written.
    std::error_code error;
    const fs::path target = fs::weakly_canonical(fs::absolute(file, error), error);
    wxString fault;
    std::optional<Settings> settings =
        error ? std::nullopt : Settings::LoadForEditing(target, fault);
    if (!settings)
        return error ? Because(error) : fault;
    for (const auto& [key, value] : values)
        if (settings->Value(key) != value || value.empty())
            settings->Set(key, value);
    return Replace(target, settings->Xml());
}
