#include "standins/distiller/bridge/Profiles.h"

#include "standins/module/RegistryKey.h"
#include "standins/module/Text.h"

#include <algorithm>
#include <filesystem>

namespace fs = std::filesystem;

namespace standins {

namespace {

constexpr const wchar_t* UserProfilesKey = L"SOFTWARE\\Adobe\\PDF Settings";
constexpr const wchar_t* SettingsKey = L"SOFTWARE\\Adobe\\Acrobat Distiller\\AdobePDFSettings";
constexpr const wchar_t* Distiller5Key = L"SOFTWARE\\Adobe\\Acrobat Distiller\\5.0";

const wchar_t* const DistillerKeys[] = {
    L"SOFTWARE\\Adobe\\Acrobat Distiller\\9.0",
    L"SOFTWARE\\Adobe\\Acrobat Distiller\\8.0",
    L"SOFTWARE\\Adobe\\Acrobat Distiller\\7.0",
    L"SOFTWARE\\Adobe\\Acrobat Distiller\\6.0",
};

std::optional<std::wstring> InstalledFolder() {
    for (const wchar_t* path : DistillerKeys) {
        const RegistryKey key = RegistryKey::Open(HKEY_LOCAL_MACHINE, path);
        if (key.IsOpen())
            return key.Text(L"JobOptionsFolder"); // the newest counts, whatever it says
    }
    return RegistryKey::Open(HKEY_CURRENT_USER, SettingsKey).Text(nullptr);
}

std::wstring JobOptionsFolder() {
    if (const auto folder = InstalledFolder())
        return *folder;
    const auto path = RegistryKey::Open(HKEY_LOCAL_MACHINE, Distiller5Key).Text(L"InstallPath");
    return path ? *path + L"/Settings" : std::wstring();
}

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
    const auto userFolder = RegistryKey::Open(HKEY_CURRENT_USER, UserProfilesKey).Text(nullptr);
    std::vector<std::string> folders;
    for (const std::wstring& text : {userFolder.value_or(std::wstring()), JobOptionsFolder()}) {
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
