#include "standins/inprocess/Fonts.h"

#include "standins/inprocess/RegistryKey.h"
#include "standins/shared/Text.h"

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

using Pattern = std::unique_ptr<FcPattern, decltype(&FcPatternDestroy)>;

const FcChar8* Text(const std::string& text) {
    return reinterpret_cast<const FcChar8*>(text.c_str());
}

Pattern PatternOf(const std::string& family) {
    Pattern pattern(FcPatternCreate(), FcPatternDestroy);
    FcPatternAddString(pattern.get(), FC_FAMILY, Text(family));
    return pattern;
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

bool IsFontInstalled(const std::string& family) {
    const Pattern pattern = PatternOf(family);
    const std::unique_ptr<FcObjectSet, decltype(&FcObjectSetDestroy)> nothing(FcObjectSetCreate(),
                                                                              FcObjectSetDestroy);
    const std::unique_ptr<FcFontSet, decltype(&FcFontSetDestroy)> found(
        FcFontList(nullptr, pattern.get(), nothing.get()), FcFontSetDestroy);
    return found && found->nfont > 0;
}

bool HasSameMetrics(const std::string& asked, const std::string& used) {
    const Pattern pattern = PatternOf(asked);
    FcConfigSubstitute(nullptr, pattern.get(), FcMatchPattern);
    // Its settings bind fonts of the same metrics to a name as strongly as the font of that name;
    // what merely looks alike is bound weakly.
    FcValue family;
    FcValueBinding binding = FcValueBindingStrong;
    for (int i = 0;
         FcPatternGetWithBinding(pattern.get(), FC_FAMILY, i, &family, &binding) == FcResultMatch;
         ++i) {
        if (binding == FcValueBindingWeak)
            return false;
        if (FcStrCmpIgnoreCase(family.u.s, Text(used)) == 0)
            return true;
    }
    return false;
}

} // namespace standins
