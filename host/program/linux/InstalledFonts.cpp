#include "host/program/system/InstalledFonts.h"

#include "host/program/system/Digest.h"

#include <fontconfig/fontconfig.h>

#include <memory>
#include <set>

std::string DigestOfFonts() {
    const std::unique_ptr<FcPattern, decltype(&FcPatternDestroy)> all(FcPatternCreate(),
                                                                      FcPatternDestroy);
    const std::unique_ptr<FcObjectSet, decltype(&FcObjectSetDestroy)> asked(
        FcObjectSetBuild(FC_FAMILY, FC_STYLE, FC_FONTVERSION, nullptr), FcObjectSetDestroy);
    const std::unique_ptr<FcFontSet, decltype(&FcFontSetDestroy)> found(
        FcFontList(nullptr, all.get(), asked.get()), FcFontSetDestroy);
    std::set<std::string> names; // whatever order they are found in
    for (int number = 0; found && number < found->nfont; ++number) {
        const std::unique_ptr<FcChar8, decltype(&std::free)> name(
            FcNameUnparse(found->fonts[number]), std::free);
        if (name)
            names.insert(reinterpret_cast<const char*>(name.get()));
    }
    Digest digest;
    for (const std::string& name : names)
        digest.Add(name.c_str(), name.size() + 1);
    return digest.Text();
}
