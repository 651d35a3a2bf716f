#pragma once

#include <string_view>

/// The colours of one kind of surface, as 0xRRGGBB.
struct Palette {
    unsigned background;
    unsigned text;
    unsigned border;
};

/// The kinds of surfaces that have a theme.
enum class Surface { Default, Note, HeaderView };
constexpr int SurfaceCount = 3;

/// @param name a theme's name; an unknown one is Surface::Default
Surface SurfaceNamed(std::string_view name);

/// @param dark for a desktop with light text on dark ground
const Palette& PaletteOf(Surface surface, bool dark);
