#include "standins/distiller/inprocess/Profiles.h"

#include "standins/distiller/inprocess/Settings.h"
#include "standins/inprocess/RegistryKey.h"
#include "standins/shared/Text.h"

#include <algorithm>
#include <filesystem>

namespace fs = std::filesystem;

namespace standins {

namespace {

std::vector<fs::path> FilesBelow(const fs::path& folder) {
    constexpr auto Options = fs::directory_options::follow_directory_symlink |
                             fs::directory_options::skip_permission_denied;
    std::vector<fs::path> files;
    std::error_code error;
    for (fs::recursive_directory_iterator entry(folder, Options, error), end;
         !error && entry != end; entry.increment(error)) {
        std::error_code unreadable;
        if (!entry->is_directory(unreadable))
            files.push_back(entry->path());
    }
    std::sort(files.begin(), files.end());
    return files;
}

} // namespace

std::vector<std::string> ProfileFolders() {
    const RegistryKey told = RegistryKey::Open(HKEY_CURRENT_USER, DistillerSettingsKey);
    std::vector<std::string> folders;
    for (const wchar_t* name : {UserProfilesValue, JobOptionsFolderValue}) {
        const std::wstring text = told.Text(name).value_or(std::wstring());
        const std::string folder = ToUtf8(text).value_or(std::string());
        if (!folder.empty())
            folders.push_back(folder);
    }
    return folders;
}

std::optional<std::string> FindProfile(const std::string& name) {
    for (const std::string& folder : ProfileFolders()) {
        for (const fs::path& file : FilesBelow(folder)) {
            if (file.filename() == name)
                return file;
        }
    }
    return std::nullopt;
}

} // namespace standins
