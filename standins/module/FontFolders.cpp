#include "standins/module/FontFolders.h"

#include "standins/module/RegistryKey.h"
#include "standins/module/Text.h"

#include <fontconfig/fontconfig.h>

#include <memory>
#include <sstream>

namespace standins {

namespace {

// Modules come and go, the registry stays as long as the process.
constexpr const wchar_t* Key = L"SOFTWARE\\Orvanta\\Stand-Ins' Fonts";
constexpr const wchar_t* FoldersValue = L"Folders"; ///< one a line

/// Reads fontconfig's settings, and no font.
std::wstring AskFontconfig() {
    const std::unique_ptr<FcConfig, decltype(&FcConfigDestroy)> config(FcInitLoadConfig(),
                                                                       FcConfigDestroy);
    const std::unique_ptr<FcStrList, decltype(&FcStrListDone)> folders(
        config ? FcConfigGetFontDirs(config.get()) : nullptr, FcStrListDone);
    std::string lines;
    while (const FcChar8* folder = folders ? FcStrListNext(folders.get()) : nullptr)
        lines.append(reinterpret_cast<const char*>(folder)) += '\n';
    return FromUtf8(lines);
}

} // namespace

std::vector<std::string> FontFolders() {
    std::optional<std::wstring> known =
        RegistryKey::Open(HKEY_CURRENT_USER, Key).Text(FoldersValue);
    if (!known) {
        known = AskFontconfig();
        RegistryKey::Create(HKEY_CURRENT_USER, Key).SetText(FoldersValue, *known);
    }
    std::istringstream lines(ToUtf8(*known).value_or(std::string()));
    std::vector<std::string> folders;
    for (std::string folder; std::getline(lines, folder);)
        folders.push_back(folder);
    return folders;
}

} // namespace standins
