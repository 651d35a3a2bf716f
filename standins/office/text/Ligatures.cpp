// Office sets no ligatures unless a document asks for them. LibreOffice sets all that a font has,
// and of such a glyph PostScript does not say which characters it stands for: "letter" would be
// found as "le er". LibreOffice shapes text by HarfBuzz, which finds this function in front of its
// own.

#include <dlfcn.h>
#include <hb.h>

#include <vector>

namespace {

using Shape = hb_bool_t (*)(hb_font_t*, hb_buffer_t*, const hb_feature_t*, unsigned,
                            const char* const*);

/// Other scripts are not written right without theirs.
bool DoesWithoutLigatures(hb_script_t script) {
    return script == HB_SCRIPT_LATIN || script == HB_SCRIPT_GREEK || script == HB_SCRIPT_CYRILLIC;
}

hb_feature_t TurnedOff(hb_tag_t tag) {
    return {tag, 0, HB_FEATURE_GLOBAL_START, HB_FEATURE_GLOBAL_END};
}

} // namespace

extern "C" __attribute__((visibility("default"))) hb_bool_t
hb_shape_full(hb_font_t* font, hb_buffer_t* buffer, const hb_feature_t* features, unsigned count,
              const char* const* shapers) {
    static const auto s_shape = reinterpret_cast<Shape>(dlsym(RTLD_NEXT, "hb_shape_full"));
    if (!DoesWithoutLigatures(hb_buffer_get_script(buffer)))
        return s_shape(font, buffer, features, count, shapers);
    // What a document asks for comes later, and holds.
    std::vector<hb_feature_t> all = {TurnedOff(HB_TAG('l', 'i', 'g', 'a')),
                                     TurnedOff(HB_TAG('c', 'l', 'i', 'g'))};
    all.insert(all.end(), features, features + count);
    return s_shape(font, buffer, all.data(), static_cast<unsigned>(all.size()), shapers);
}
