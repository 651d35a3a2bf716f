#include "host/themer/Palette.h"

namespace {

// By surface, first for light desktops, then for dark ones. Texts reach a contrast of 7 to 1.
constexpr Palette Palettes[SurfaceCount][2] = {
    /* Default    */ {{0xFCFCFD, 0x1F2328, 0xC9CED6}, {0x24272C, 0xE7E9EC, 0x4A5059}},
    /* Note       */ {{0xFFF7DF, 0x4A3900, 0xE5CE87}, {0x3A321A, 0xF6E7B8, 0x6B5C2C}},
    /* HeaderView */ {{0x1F4B73, 0xFFFFFF, 0x163856}, {0x16334D, 0xE3EEF8, 0x2F5579}},
};

} // namespace

Surface SurfaceNamed(std::string_view name) {
    if (name == "Note")
        return Surface::Note;
    if (name == "HeaderView")
        return Surface::HeaderView;
    return Surface::Default;
}

const Palette& PaletteOf(Surface surface, bool dark) {
    return Palettes[static_cast<int>(surface)][dark ? 1 : 0];
}
