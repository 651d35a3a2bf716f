#include "standins/office/text/FontUse.h"

#include <dlfcn.h>

#include <cstdint>
#include <fstream>
#include <string>
#include <vector>

namespace standins {

namespace {

// LibreOffice's own types and functions, as far as they are needed.

struct String {
    std::int32_t references;
    std::int32_t length;
    char16_t characters[1];
};

struct Use {
    const String* asked;
    std::vector<const String*> used; ///< first the font, then those that have what it lacks
    int times;
};

using Start = void (*)();
using Finish = std::vector<Use> (*)();

template <typename Function>
Function Find(const char* name) {
    return reinterpret_cast<Function>(dlsym(RTLD_DEFAULT, name));
}

void Add(std::u16string& text, const String& name, char16_t end) {
    for (std::int32_t i = 0; i < name.length; ++i)
        text += name.characters[i] < u' ' ? u' ' : name.characters[i];
    text += end;
}

} // namespace

void StartFontUse() {
    if (const auto start = Find<Start>("_ZN12OutputDevice27StartTrackingFontMappingUseEv"))
        start();
}

void WriteFontUse(const char* path) {
    const auto finish = Find<Finish>("_ZN12OutputDevice28FinishTrackingFontMappingUseEv");
    if (!finish)
        return;
    std::u16string text;
    for (const Use& use : finish()) {
        if (use.used.empty())
            continue;
        Add(text, *use.asked, u'\t');
        Add(text, *use.used.front(), u'\n');
    }
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(text.data()),
               static_cast<std::streamsize>(text.size() * sizeof(char16_t)));
}

} // namespace standins
