#include "standins/module/InstalledFonts.h"

#include <fontconfig/fontconfig.h>

#include <memory>

namespace standins {

namespace {

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
